#include "Scenario.h"

#include <algorithm>
#include <sstream>
#include <utility>

using namespace zandor;

namespace gridstage {

namespace {

std::string joined(const std::vector<std::string>& texts) {
    std::string all;
    for (const std::string& text : texts) all += (all.empty() ? "" : ", ") + text;
    return all;
}

std::string listName(std::int16_t table) { return "lstTable(" + std::to_string(table) + ")"; }

} // namespace

Scenario::Scenario(Stage& played, const Ref<fake::Model>& shown)
    : stage(played), model(shown), mMenuBefore(played.onMenu), mDialogBefore(played.onDialog) {
    stage.onMenu = [this](const std::vector<Stage::Entry>& entries) {
        if (mMenuBefore) mMenuBefore(entries);
        look([&] { note("  can " + joined(enabledIn(entries))); });
        return platform::fromUtf8(std::exchange(mChosen, {}));
    };
    stage.onDialog = [this] {
        if (mDialogBefore) mDialogBefore();
        look([&] {
            note("  shows " + platform::toUtf8(stage.look("cboJoinType").text) + " " +
                 platform::toUtf8(stage.look("cboJoinCompareOperator").text));
        });
        if (const auto use = std::exchange(mInDialog, {})) use();
    };
}

Scenario::~Scenario() {
    stage.onMenu = mMenuBefore;
    stage.onDialog = mDialogBefore;
}

std::string Scenario::entryName(std::int16_t table, std::int32_t entry) {
    const auto list = stage.look(listName(table));
    return platform::toUtf8(list.text) + "." +
           (entry == 0 ? "(empty)" : platform::toUtf8(list.items.at(std::size_t(entry) - 1)));
}

std::string Scenario::entryNames(std::int16_t table, const std::vector<std::int32_t>& entries) {
    std::vector<std::string> names;
    for (const std::int32_t entry : entries) names.push_back(entryName(table, entry));
    return joined(names);
}

void Scenario::focus(const std::string& name) {
    step([&] { stage.focus(name); });
}

void Scenario::selectEntries(std::int16_t table, const std::vector<std::int32_t>& entries) {
    step([&] { stage.selectEntries(table, entries); });
}

void Scenario::pressEntry(std::int16_t table, std::int32_t entry, std::int16_t button) {
    step([&] { stage.pressEntry(table, entry, button); });
}

void Scenario::releaseEntry(std::int16_t table, std::int32_t entry, std::int16_t button) {
    step([&] { stage.releaseEntry(table, entry, button); });
}

void Scenario::dragTo(std::int16_t from, const std::vector<std::int32_t>& entries, std::int16_t to,
                      std::int32_t target) {
    look([&] { note("> drag " + entryNames(from, entries) + " to " + entryName(to, target)); });
    selectEntries(from, entries);
    step([&] { stage.dragToEntry(from, entries.front(), to, target); });
}

void Scenario::dragToColumn(std::int16_t from, const std::vector<std::int32_t>& entries,
                            std::int32_t col) {
    look(
        [&] { note("> drag " + entryNames(from, entries) + " to column " + std::to_string(col)); });
    selectEntries(from, entries);
    step([&] { stage.dragToCell(from, entries.front(), synonymRow, col); });
}

void Scenario::menuOnEntry(std::int16_t table, std::int32_t entry, const std::string& command) {
    look([&] { note("> menu on " + entryName(table, entry) + " " + command); });
    pressEntry(table, entry, right);
    mChosen = command;
    releaseEntry(table, entry, right);
}

void Scenario::menuOnCell(std::int32_t row, std::int32_t col, const std::string& command) {
    note("> menu on column " + std::to_string(col) + " " + command);
    step([&] { stage.pressCell(right, row, col); });
    mChosen = command;
    step([&] { stage.releaseCell(right, row, col); });
}

void Scenario::menuOnCanvas(float x, float y, const std::string& command) {
    step([&] { stage.pressCanvas(right, x, y); });
    mChosen = command;
    step([&] { stage.releaseCanvas(right, x, y); });
}

void Scenario::menuOnJoin(int number, const std::string& command,
                          const std::function<void()>& inDialog) {
    note("> menu on join " + std::to_string(number) + " " + command);
    mInDialog = inDialog;
    Stage::Seen line;
    step([&] {
        const std::string name = "linJoin(" + std::to_string(number) + ")";
        if (!stage.exists(name)) throw std::logic_error("there is no " + name);
        line = stage.look(name);
    });
    menuOnCanvas((line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2, command);
}

void Scenario::openCell(std::int32_t row, std::int32_t col) {
    note("> open row " + std::to_string(row) + " of column " + std::to_string(col));
    pressCell(row, col);
    noteEditor();
}

void Scenario::pressCell(std::int32_t row, std::int32_t col) {
    step([&] { stage.pressCell(left, row, col); });
}

void Scenario::pressCanvas(float x, float y) {
    step([&] { stage.pressCanvas(left, x, y); });
    step([&] { stage.releaseCanvas(left, x, y); });
}

void Scenario::type(const std::string& name, const String& text) {
    step([&] { stage.type(name, text); });
}

void Scenario::choose(const std::string& name, std::int16_t listIndex) {
    step([&] { stage.choose(name, listIndex); });
}

void Scenario::key(const std::string& name, std::int16_t keyCode) {
    step([&] { stage.key(name, keyCode); });
}

void Scenario::clickButton(const std::string& name) {
    step([&] { stage.clickButton(name); });
}

void Scenario::moveTable(std::int16_t table, float x, float y) {
    note("> move table " + std::to_string(table));
    step([&] { stage.moveTable(table, x, y); });
}

void Scenario::resizeTable(std::int16_t table, float width, float height) {
    note("> size table " + std::to_string(table));
    step([&] { stage.resizeTable(table, width, height); });
}

void Scenario::closeTable(std::int16_t table) {
    note("> close table " + std::to_string(table));
    step([&] { stage.closeTable(table); });
}

void Scenario::scrollBarTo(const std::string& name, std::int16_t value) {
    step([&] { stage.scrollBarTo(name, value); });
}

void Scenario::scrollList(std::int16_t table, std::int32_t firstEntry) {
    step([&] { stage.scrollList(table, firstEntry); });
}

void Scenario::scrollGrid(std::int32_t topRow, std::int32_t leftCol) {
    step([&] { stage.scrollGrid(topRow, leftCol); });
}

void Scenario::noteEditor() {
    static constexpr std::pair<const char*, const char*> editors[] = {
        {"fraSortOrder", "cobSortOrder"},
        {"fraVisibility", "cobVisibility"},
        {"fraValue", "txtValue"}};
    look([&] {
        for (const auto& [frame, input] : editors)
            if (stage.look(frame).visible)
                note("  " + std::string(input) + " reads '" +
                     platform::toUtf8(stage.look(input).text) + "'");
    });
}

void Scenario::notePlace(std::int16_t table) {
    look([&] {
        const auto box = stage.look(listName(table)).bounds;
        const auto& stored = model->tableAt(table);
        std::ostringstream line;
        line << "  at " << box.Left << " " << box.Top << ", " << box.Width << " by " << box.Height;
        if (box != platform::Bounds{stored.left, stored.top, stored.width, stored.height})
            line << ", which the model does not know";
        note(line.str());
    });
}

void Scenario::noteScroll() {
    look([&] {
        const auto bar = stage.look("hsbTable");
        std::ostringstream line;
        line << "  scrolled by " << bar.value << (bar.enabled ? "" : ", disabled") << ", "
             << stage.look("vsbTable").value << "; deleted '"
             << platform::toUtf8(control().DeletedTable) << "'";
        note(line.str());
    });
}

void Scenario::noteQuery(std::int32_t columns) {
    note("> query");
    look([&] {
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
        for (std::int32_t col = 1; col <= columns; ++col) {
            const String field = stage.cell(fieldRow, col);
            shown.push_back(field.empty() ? "-" : platform::toUtf8(field));
        }
        note("grid " + joined(shown));
    });
}

void AScenario::play() {
    const std::string name = testing::UnitTest::GetInstance()->current_test_info()->name();
    const auto& all = scenarios();
    const auto found =
        std::ranges::find_if(all, [&](const NamedScenario& each) { return each.name == name; });
    if (found == all.end()) throw std::logic_error("there is no scenario " + name);
    Scenario scenario(*stage, model);
    found->play(scenario);
    stage->onMenu = nullptr;
    stage->onDialog = nullptr;
}

std::string AScenario::story() const {
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

} // namespace gridstage
