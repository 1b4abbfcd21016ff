#pragma once

#include "GridStage.h"

#include <functional>
#include <string>
#include <vector>

namespace gridstage {

// The tables of a scenario by slot, and entries that only they have.
constexpr std::int16_t ORDERS = 1;
constexpr std::int16_t CUSTOMERS = 2;
constexpr std::int16_t PARTS = 3;
constexpr std::int32_t no = 2;
constexpr std::int32_t nowhere = 0;

/// What a user does in a row with three tables, ORDERS in slot 1, CUSTOMERS in slot 2 and PARTS in
/// slot 3, step by step, and what is told of it. Nothing is expected here, so that it can be played
/// while a host gets in the way; who plays it may change what a step is.
class Scenario {
public:
    /// Answers the stage's menus and dialogs while it is there, after whoever did before.
    Scenario(Stage& stage, const Ref<fake::Model>& model);
    Scenario(const Scenario&) = delete;
    Scenario& operator=(const Scenario&) = delete;
    virtual ~Scenario();

    /// A press, a release, a key.
    virtual void step(const std::function<void()>& deed) { deed(); }
    /// A look at what has come of it, for the story.
    virtual void look(const std::function<void()>& deed) { deed(); }
    virtual void closeControl() { stage.closeControl(); }

    void note(const std::string& line) { stage.transcript.push_back(line); }
    TalvikDBxZandor::Zandor& control() { return stage.control(); }

    void focus(const std::string& name);
    void selectEntries(std::int16_t table, const std::vector<std::int32_t>& entries);
    void pressEntry(std::int16_t table, std::int32_t entry, std::int16_t button);
    void releaseEntry(std::int16_t table, std::int32_t entry, std::int16_t button);
    void dragTo(std::int16_t from, const std::vector<std::int32_t>& entries, std::int16_t to,
                std::int32_t target);
    void dragToColumn(std::int16_t from, const std::vector<std::int32_t>& entries,
                      std::int32_t col);

    void menuOnEntry(std::int16_t table, std::int32_t entry, const std::string& command = {});
    void menuOnCell(std::int32_t row, std::int32_t col, const std::string& command = {});
    void menuOnCanvas(float x, float y, const std::string& command = {});
    void menuOnJoin(int number, const std::string& command = {},
                    const std::function<void()>& inDialog = {});

    void openCell(std::int32_t row, std::int32_t col);
    void pressCell(std::int32_t row, std::int32_t col);
    void pressCanvas(float x, float y);
    void type(const std::string& name, const String& text);
    void choose(const std::string& name, std::int16_t listIndex);
    void key(const std::string& name, std::int16_t keyCode);
    void clickButton(const std::string& name);

    void moveTable(std::int16_t table, float x, float y);
    void resizeTable(std::int16_t table, float width, float height);
    void closeTable(std::int16_t table);
    void scrollBarTo(const std::string& name, std::int16_t value);
    void scrollList(std::int16_t table, std::int32_t firstEntry);
    void scrollGrid(std::int32_t topRow, std::int32_t leftCol);

    /// Which editor is open, and with what in it.
    void noteEditor();
    void notePlace(std::int16_t table);
    /// How far the canvas is scrolled, whether it can be, and which table was deleted last.
    void noteScroll();
    /// The joins and output columns of the model, and the first cells of the grid.
    void noteQuery(std::int32_t columns);

protected:
    Stage& stage;
    const Ref<fake::Model> model;

private:
    std::string entryName(std::int16_t table, std::int32_t entry);
    std::string entryNames(std::int16_t table, const std::vector<std::int32_t>& entries);

    const std::function<String(const std::vector<Stage::Entry>&)> mMenuBefore;
    const std::function<void()> mDialogBefore;
    std::string mChosen;
    std::function<void()> mInDialog;
};

/// ORDERS, CUSTOMERS and PARTS.
inline void addTables(fake::Model& model) {
    addOrders(model);
    addCustomers(model);
    addParts(model);
}

/// A scenario under the name of the test that expects its story.
struct NamedScenario {
    const char* name;
    void (*play)(Scenario&);
};
const std::vector<NamedScenario>& scenarios();

/// A scenario on a stage of its own, and everything that is told of it, in its order. As each
/// program plays the same scenarios, the toolkits tell the same.
class AScenario : public GridTest {
protected:
    AScenario() {
        addParts(*model);
        control().JoinModifyDisabled(1);
        bind();
    }

    /// Plays the one of the test's own name.
    void play();
    /// What was told, each on a line of its own.
    std::string story() const;
};

} // namespace gridstage
