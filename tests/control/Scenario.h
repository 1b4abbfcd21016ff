#pragma once

#include "GridStage.h"

#include <functional>
#include <sstream>
#include <utility>

namespace gridstage {

// The tables of a scenario by slot, and entries that only they have.
constexpr std::int16_t ORDERS = 1;
constexpr std::int16_t CUSTOMERS = 2;
constexpr std::int16_t PARTS = 3;
constexpr std::int32_t no = 2;
constexpr std::int32_t nowhere = 0;

inline std::string joined(const std::vector<std::string>& texts) {
    std::string all;
    for (const std::string& text : texts) all += (all.empty() ? "" : ", ") + text;
    return all;
}

/// What a user does in a row, and everything that is told of it, in its order: three tables, ORDERS
/// in slot 1, CUSTOMERS in slot 2 and PARTS in slot 3. As each program runs the same scenarios, the
/// toolkits tell the same.
class AScenario : public GridTest {
protected:
    AScenario() {
        parts = model->table(u"PARTS", {u"*", u"NO", u"TITLE"});
        parts->place(9000, 300, 2100, 2400);
        control().JoinModifyDisabled(1);
        stage->onMenu = [this](const std::vector<Stage::Entry>& shown) {
            menu = shown;
            note("  can " + joined(enabled()));
            return platform::fromUtf8(std::exchange(mChosen, {}));
        };
        stage->onDialog = [this] {
            note("  shows " + platform::toUtf8(stage->look("cboJoinType").text) + " " +
                 platform::toUtf8(stage->look("cboJoinCompareOperator").text));
            if (const auto use = std::exchange(mInDialog, {})) use();
        };
        bind();
    }

    void note(const std::string& line) { stage->transcript.push_back(line); }

    /// What was told, each on a line of its own.
    std::string story() const {
        std::string all = "\n";
        for (const std::string& told : stage->transcript) {
            for (const char letter : told) {
                if (letter == '\r') continue;
                all += letter == '\n' ? "\n  " : std::string(1, letter == '\t' ? ' ' : letter);
            }
            all += "\n";
        }
        return all;
    }

    std::string entryName(std::int16_t table, std::int32_t entry) {
        const auto list = stage->look("lstTable(" + std::to_string(table) + ")");
        return platform::toUtf8(list.text) + "." +
               (entry == 0 ? "(empty)" : platform::toUtf8(list.items.at(std::size_t(entry) - 1)));
    }
    std::string entryNames(std::int16_t table, const std::vector<std::int32_t>& entries) {
        std::vector<std::string> names;
        for (const std::int32_t entry : entries) names.push_back(entryName(table, entry));
        return joined(names);
    }

    void dragTo(std::int16_t from, const std::vector<std::int32_t>& entries, std::int16_t to,
                std::int32_t target) {
        note("> drag " + entryNames(from, entries) + " to " + entryName(to, target));
        stage->selectEntries(from, entries);
        stage->dragToEntry(from, entries.front(), to, target);
    }
    void dragToColumn(std::int16_t from, const std::vector<std::int32_t>& entries,
                      std::int32_t col) {
        note("> drag " + entryNames(from, entries) + " to column " + std::to_string(col));
        drag(from, entries, col);
    }

    void menuOnEntry(std::int16_t table, std::int32_t entry, const std::string& command = {}) {
        note("> menu on " + entryName(table, entry) + " " + command);
        mChosen = command;
        stage->pressEntry(table, entry, right);
        stage->releaseEntry(table, entry, right);
    }
    void menuOnCell(std::int32_t row, std::int32_t col, const std::string& command = {}) {
        note("> menu on column " + std::to_string(col) + " " + command);
        mChosen = command;
        stage->pressCell(right, row, col);
        stage->releaseCell(right, row, col);
    }
    void menuOnCanvas(float x, float y, const std::string& command = {}) {
        mChosen = command;
        stage->pressCanvas(right, x, y);
        stage->releaseCanvas(right, x, y);
    }
    void menuOnJoin(int number, const std::string& command = {},
                    const std::function<void()>& inDialog = {}) {
        note("> menu on join " + std::to_string(number) + " " + command);
        mInDialog = inDialog;
        const auto line = stage->look("linJoin(" + std::to_string(number) + ")");
        menuOnCanvas((line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2, command);
    }

    void openCell(std::int32_t row, std::int32_t col) {
        note("> open row " + std::to_string(row) + " of column " + std::to_string(col));
        press(left, row, col);
        noteEditor();
    }
    /// Which editor is open, and with what in it.
    void noteEditor() {
        const std::pair<const char*, const char*> editors[] = {{"fraSortOrder", "cobSortOrder"},
                                                               {"fraVisibility", "cobVisibility"},
                                                               {"fraValue", "txtValue"}};
        for (const auto& [frame, input] : editors)
            if (shows(frame))
                note("  " + std::string(input) + " reads '" +
                     platform::toUtf8(stage->look(input).text) + "'");
    }

    void notePlace(std::int16_t table) {
        const auto box = stage->look("lstTable(" + std::to_string(table) + ")").bounds;
        const auto& stored = model->tableAt(table);
        std::ostringstream line;
        line << "  at " << box.Left << " " << box.Top << ", " << box.Width << " by " << box.Height;
        note(line.str());
        EXPECT_EQ(box, (platform::Bounds{stored.left, stored.top, stored.width, stored.height}));
    }

    /// The joins and output columns of the model, and the first cells of the grid.
    void noteQuery(std::int32_t columns) {
        note("> query");
        for (std::int32_t i = 1; i <= model->joinCount(); ++i) {
            const auto& join = model->joinAt(i);
            note(platform::toUtf8(join.leftTable->Name() + u"." + join.leftColumn->Name() + u" - " +
                                  join.rightTable->Name() + u"." + join.rightColumn->Name()) +
                 " " + std::to_string(join.joinType) + " " + std::to_string(join.compareOperator));
        }
        for (std::int32_t i = 1; i <= model->definitionCount(); ++i) {
            auto& definition = model->definitionAt(i);
            String line = definition.key + u" " + definition.column->Name() + u" '" +
                          definition.synonym + u"' " + platform::decimal(definition.sortOrder) +
                          (definition.visible ? u" visible" : u" hidden");
            for (std::int32_t n = 1; n <= definition.criteria.items.Count(); ++n)
                line += u" [" + definition.criteria.items.Item(n)->Criterium() + u"]";
            note(platform::toUtf8(line));
        }
        std::vector<std::string> shown;
        for (const String& field : fields(columns))
            shown.push_back(field.empty() ? "-" : platform::toUtf8(field));
        note("grid " + joined(shown));
    }

    Ref<fake::Table> parts;

private:
    std::string mChosen;
    std::function<void()> mInDialog;
};

} // namespace gridstage
