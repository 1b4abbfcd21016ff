#include "RandomUser.h"

#include "control/GridStage.h"
#include "support/Backstage.h"

#include <new>
#include <stdexcept>

using namespace zandor;

using Backstage = TalvikDBxZandor::ZandorBackstage;
using platform::Ref;
namespace headless = platform::headless;

using gridstage::enter;
using gridstage::escape;
using gridstage::left;
using gridstage::right;

void RandomUser::open() {
    mStage = Stage::open(mLibrary);
    mStage->onMenu = [this](const auto& entries) { return chooseFromMenu(entries); };
    mStage->onDialog = [this] { answerDialog(); };
    mInvariants = std::make_unique<Invariants>(control(), toolkit());
    control().DebugSwitch(0);
    mCalm = chance(30);
    control().OnlyJoin(!mCalm && chance(20));
    bind(newModel());
}

std::string RandomUser::close() {
    mStage->closeControl();
    const std::string survivors = mInvariants->survivors();
    mInvariants.reset();
    mStage.reset();
    mModel = nullptr;
    return survivors;
}

void RandomUser::act() {
    static constexpr struct {
        const char* name;
        void (RandomUser::*action)();
        std::int32_t weight;
    } actions[] = {
        {"moveTable", &RandomUser::moveTable, 10},
        {"resizeTable", &RandomUser::resizeTable, 4},
        {"closeTable", &RandomUser::closeTable, 1},
        {"scrollSomething", &RandomUser::scrollSomething, 8},
        {"selectEntries", &RandomUser::selectEntries, 8},
        {"pressEntry", &RandomUser::pressEntry, 4},
        {"releaseEntry", &RandomUser::releaseEntry, 4},
        {"dragToTable", &RandomUser::dragToTable, 10},
        {"dragToGrid", &RandomUser::dragToGrid, 10},
        {"menuOverTable", &RandomUser::menuOverTable, 8},
        {"menuOverCanvas", &RandomUser::menuOverCanvas, 8},
        {"menuOverGrid", &RandomUser::menuOverGrid, 12},
        {"pressCanvas", &RandomUser::pressCanvas, 5},
        {"editCell", &RandomUser::editCell, 8},
        {"useEditor", &RandomUser::useEditor, 2},
        {"resizeControl", &RandomUser::resizeControl, 3},
        {"useGrid", &RandomUser::useGrid, 6},
        {"useComforts", &RandomUser::useComforts, 2},
        {"host", &RandomUser::host, 4},
    };
    std::int32_t total = 0;
    for (const auto& action : actions) total += action.weight;
    std::int32_t drawn = number(1, total);
    for (const auto& action : actions) {
        drawn -= action.weight;
        if (drawn > 0) continue;
        mLast = action.name;
        if (mModelsFail) armModel();
        try {
            (this->*action.action)();
            ++mDone;
        } catch (const std::logic_error&) {
            // Not there, not shown or covered: a user could not have done it.
        } catch (const platform::RuntimeError&) {
            // Nor could one press what cannot take the focus.
        }
        break;
    }
    mLibrary.calls->disarm();
    hear();
}

bool RandomUser::idle() { return Backstage::lstTable(control()).Count() == 1; }

/// As a host does it: a join of a deleted table goes with the table.
void RandomUser::hear() {
    for (const auto& raised : mStage->raised) {
        if (raised.event != TalvikDBxZandor::Event::TableDeleted) continue;
        for (std::int32_t i = mModel->joinCount(); i >= 1; --i) {
            const auto& join = mModel->joinAt(i);
            const auto& tables = mModel->tables.items;
            const auto key = [](const auto& table) {
                return dynamic_cast<const fake::Table&>(*table).key;
            };
            if (!tables.Contains(key(join.leftTable)) || !tables.Contains(key(join.rightTable)))
                mModel->joins.items.Remove(String(join.key));
        }
    }
    mMostColumns = std::max(mMostColumns, columnsFilled());
    mStage->raised.clear();
    mStage->boxes.clear();
    mStage->messages.clear();
    mStage->transcript.clear();
}

std::int32_t RandomUser::number(std::int32_t from, std::int32_t to) {
    const auto span = static_cast<std::uint64_t>(std::int64_t{to} - from + 1);
    return static_cast<std::int32_t>(from + static_cast<std::int64_t>(mDraw(span)));
}

headless::Toolkit& RandomUser::toolkit() {
    return dynamic_cast<headless::Toolkit&>(mStage->toolkit());
}

headless::Grid& RandomUser::grid() { return toolkit().find<headless::Grid>("sprColumn"); }

/// A shown table's, as long as there is one.
std::int16_t RandomUser::slot() {
    std::vector<std::int16_t> shown;
    for (const auto& [index, table] : Backstage::lstTable(control()))
        if (index != 0) shown.push_back(index);
    if (shown.empty()) throw std::logic_error("no table is shown");
    return shown[static_cast<std::size_t>(number(0, static_cast<std::int32_t>(shown.size()) - 1))];
}

std::int32_t RandomUser::entryOf(std::int16_t slot) {
    const std::int32_t count = Backstage::lstTable(control())(slot)->ColumnItems().Count();
    if (count == 0) throw std::logic_error("the table has no entry");
    return number(1, count);
}

std::int32_t RandomUser::reachEntry(std::int16_t slot) {
    const std::int32_t entry = entryOf(slot);
    const auto& table = toolkit().find<headless::Tabulet>(headless::elementName(u"lstTable", slot));
    if (!table.inView(entry) && chance(80)) mStage->scrollList(slot, entry);
    return entry;
}

std::pair<std::int32_t, std::int32_t> RandomUser::reachCell() {
    const std::int32_t row = number(0, grid().Rows() - 1);
    const std::int32_t col = column();
    if (!grid().inView(row, col) && chance(80))
        mStage->scrollGrid(std::max(1, row), std::max(1, chance(50) ? 1 : col));
    return {row, col};
}

int RandomUser::columnsFilled() {
    int filled = 0;
    while (filled + 1 < grid().Cols() && !grid().cell(0, filled + 1).text.empty()) ++filled;
    return filled;
}

/// Mostly near the definitions, now and then anywhere.
std::int32_t RandomUser::column() {
    const std::int32_t last = grid().Cols() - 1;
    if (chance(3)) return chance(50) ? last : number(0, last);
    return number(0, std::min(last, mModel->definitionCount() + 2));
}

platform::String RandomUser::text() {
    return chance(30) ? String() : u"= " + platform::decimal(number(0, 99));
}

Ref<fake::Model> RandomUser::newModel() {
    auto model = mLibrary.newModel();
    std::vector<Ref<fake::Table>> tables;
    const std::int32_t count = chance(10) ? number(0, 18) : number(2, 7);
    for (std::int32_t i = 0; i < count; ++i) {
        // T1 begins T10 to T18, and two tables may share their name.
        const String name = u"T" + platform::decimal(chance(5) ? 1 : i);
        auto table = model->table(name, {u"*", u"ID", u"A", u"B"}, u"t" + platform::decimal(i));
        for (std::int32_t extra = number(0, 4); extra > 0; --extra)
            table->addColumn(u"C" + platform::decimal(extra));
        if (chance(80))
            table->place(static_cast<float>(number(0, 9000)), static_cast<float>(number(0, 4000)),
                         static_cast<float>(number(600, 3000)),
                         static_cast<float>(number(600, 3000)));
        tables.push_back(table);
    }
    const auto any = [&] { return tables[std::size_t(number(0, count - 1))]; };
    for (std::int32_t i = count == 0 ? 0 : number(0, 4); i > 0; --i)
        model->join(any(), u"ID", any(), u"A", static_cast<std::int16_t>(number(0, 3)));
    for (std::int32_t i = count == 0 ? 0 : number(0, 6); i > 0; --i)
        model->definition(any(), u"B", {u"> 1"});
    return model;
}

void RandomUser::moveTable() {
    mStage->moveTable(slot(), static_cast<float>(number(-2000, 18000)),
                      static_cast<float>(number(-2000, 18000)));
}

void RandomUser::resizeTable() {
    mStage->resizeTable(slot(), static_cast<float>(number(-500, 5000)),
                        static_cast<float>(number(-500, 5000)));
}

void RandomUser::closeTable() {
    if (!mCalm) mStage->closeTable(slot());
}

void RandomUser::scrollSomething() {
    switch (number(0, 4)) {
    case 0: {
        const std::int16_t table = slot();
        return mStage->scrollList(table, entryOf(table));
    }
    case 1: return mStage->scrollGrid(number(1, grid().Rows()), chance(70) ? 1 : column());
    case 2: return mStage->clickButton("cmdHome");
    default:
        return mStage->scrollBarTo(chance(50) ? "hsbTable" : "vsbTable",
                                   static_cast<std::int16_t>(chance(40) ? 0 : number(0, 16000)));
    }
}

void RandomUser::selectEntries() {
    const std::int16_t table = slot();
    std::vector<std::int32_t> entries;
    const std::int32_t count = Backstage::lstTable(control())(table)->ColumnItems().Count();
    for (std::int32_t n = 1; n <= count; ++n)
        if (chance(40)) entries.push_back(n);
    mStage->selectEntries(table, entries);
}

void RandomUser::pressEntry() {
    const std::int16_t table = slot();
    const std::int32_t entry = reachEntry(table);
    mStage->pressEntry(table, entry, left);
    if (chance(50)) mStage->moveOverEntry(table, entry, static_cast<std::int16_t>(number(0, 3)));
}

void RandomUser::releaseEntry() {
    const std::int16_t table = slot();
    mStage->releaseEntry(table, reachEntry(table), chance(70) ? left : right);
}

void RandomUser::dragToTable() {
    const std::int16_t from = slot();
    const std::int16_t to = slot();
    const std::int32_t entry = reachEntry(from);
    mStage->dragToEntry(from, entry, to, chance(10) ? 0 : reachEntry(to));
}

void RandomUser::dragToGrid() {
    const std::int16_t from = slot();
    const std::int32_t entry = reachEntry(from);
    const auto [row, col] = reachCell();
    mStage->dragToCell(from, entry, row, col);
}

void RandomUser::menuOverTable() {
    const std::int16_t table = slot();
    const std::int32_t entry = reachEntry(table);
    mStage->pressEntry(table, entry, right);
    mStage->releaseEntry(table, entry, right);
}

void RandomUser::menuOverCanvas() {
    const auto [x, y] = placeOnCanvas();
    mStage->pressCanvas(right, x, y);
    mStage->releaseCanvas(right, x, y);
}

void RandomUser::menuOverGrid() {
    const auto [row, col] = reachCell();
    mStage->pressCell(right, row, col);
    mStage->releaseCell(right, row, col);
}

void RandomUser::pressCanvas() {
    const auto [x, y] = placeOnCanvas();
    mStage->pressCanvas(left, x, y);
    mStage->releaseCanvas(left, x, y);
}

/// Mostly on a join, if there is one.
std::pair<float, float> RandomUser::placeOnCanvas() {
    const auto& lines = Backstage::linJoin(control());
    if (lines.Count() > 1 && chance(70)) {
        auto at = lines.begin();
        std::advance(at, number(1, static_cast<std::int32_t>(lines.Count()) - 1));
        const auto& line = *(*at).second;
        return {(line.X1() + line.X2()) / 2, (line.Y1() + line.Y2()) / 2};
    }
    return {static_cast<float>(number(0, 12000)), static_cast<float>(number(0, 9000))};
}

void RandomUser::editCell() {
    const auto [row, col] = reachCell();
    mStage->pressCell(left, row, col);
    if (row != 0 && col != 0 && chance(60)) useEditor();
}

void RandomUser::useEditor() {
    static constexpr struct {
        const char *frame, *input, *set;
        std::int16_t items;
    } editors[] = {{"fraSortOrder", "cobSortOrder", "cmdSetSortOrder", 3},
                   {"fraVisibility", "cobVisibility", "cmdSetVisibility", 2},
                   {"fraValue", "txtValue", "cmdSetTextValue", 0}};
    for (const auto& editor : editors) {
        if (!toolkit().find<headless::Frame>(editor.frame).shown()) continue;
        if (editor.items == 0)
            mStage->type(editor.input, text());
        else
            mStage->choose(editor.input, static_cast<std::int16_t>(number(0, editor.items - 1)));
        switch (number(0, 3)) {
        case 0: return mStage->key(editor.input, escape);
        case 1: return mStage->key(editor.input, enter);
        default: return mStage->clickButton(editor.set);
        }
    }
    throw std::logic_error("no editor is open");
}

void RandomUser::resizeControl() {
    if (chance(50)) return mStage->repaint();
    const bool sensible = chance(70);
    mStage->resizeControl(static_cast<float>(sensible ? number(6000, 15000) : number(0, 40000)),
                          static_cast<float>(sensible ? number(6000, 12000) : number(0, 40000)));
}

/// By keys, and by the fields at the heads of the columns.
void RandomUser::useGrid() {
    const std::int32_t col = std::max(1, column());
    switch (number(0, 6)) {
    case 0: return mStage->typeInGrid(text());
    case 1: return mStage->editCell();
    case 2: return mStage->moveCurrentColumn(chance(50) ? 1 : -1);
    case 3: return mStage->dragField(col, std::max(1, column()));
    case 4: return mStage->dragBorder(col, static_cast<float>(chance(30) ? 0 : number(1, 9000)));
    case 5:
        mStage->clickField(col);
        if (chance(70)) mStage->pickField(chance(50) ? u"ID" : String());
        return;
    default: return mStage->leaveControl();
    }
}

void RandomUser::useComforts() {
    switch (number(0, 3)) {
    case 0: {
        auto flags = comforts::Flags::all();
        flags.KeepsTyping = chance(50);
        flags.OffersFields = chance(50);
        flags.FitsColumns = chance(50);
        flags.ReadsJoins = chance(50);
        return mStage->comforts().setFlags(chance(30) ? comforts::Flags() : flags);
    }
    case 1: {
        const std::int16_t table = slot();
        return mStage->doubleClickEntry(table, reachEntry(table));
    }
    case 2: {
        const std::int16_t from = slot();
        const std::int32_t entry = reachEntry(from);
        const std::int16_t across = slot();
        const std::int32_t passed = reachEntry(across);
        const auto [row, col] = reachCell();
        return mStage->dragAcross(from, entry, across, passed, row, col);
    }
    default: return mStage->comforts().takeOver();
    }
}

/// Of the calls that the next action makes one fails, if it comes to it.
void RandomUser::armModel() {
    if (!chance(25)) return;
    const auto& names = fake::memberNames();
    const auto& name =
        names[static_cast<std::size_t>(number(0, static_cast<std::int32_t>(names.size()) - 1))];
    const std::int32_t nth = chance(60) ? 1 : number(1, 8);
    switch (number(0, 2)) {
    case 0: return mLibrary.calls->failNext(name, std::bad_alloc(), nth);
    case 1: return mLibrary.calls->failNext(name, std::runtime_error("what a host throws"), nth);
    default:
        return mLibrary.calls->failNext(name, platform::RuntimeError{1234, u"The host refuses."},
                                        nth);
    }
}

void RandomUser::host() {
    switch (number(0, 14)) {
    case 0: return control().OnlyJoin(!mCalm && chance(20));
    case 1: return control().SetCurrentTable(u"T" + platform::decimal(number(0, 8)));
    case 2: return control().SelectColumnNames(u"T" + platform::decimal(number(0, 8)), u"ID");
    case 3: return control().VisibleFrameLeft(static_cast<std::int16_t>(number(-50, 20000)));
    case 4: return control().VisibleFrameTop(static_cast<std::int16_t>(number(-50, 20000)));
    case 5: return control().JoinModifyDisabled(static_cast<std::int16_t>(number(0, 1)));
    case 6: return control().P_SET_Zandor({});
    case 7:
        if (mCalm || !chance(10)) return bind(mModel);
        mInvariants->abandonColumns();
        return bind(newModel());
    case 8:
        if (mCalm || !chance(5)) return;
        mInvariants->abandonColumns();
        control().Terminate();
        return bind(newModel());
    case 9: return control().ShowAnew();
    case 10: return control().ReadOnly(chance(20));
    case 11: return control().UpperPaneShare(static_cast<float>(number(0, 100)) / 100);
    default: return control().HorizontalScrollbarPos(static_cast<std::int16_t>(number(0, 9000)));
    }
}

void RandomUser::bind(const Ref<fake::Model>& model) {
    mModel = model;
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
}

platform::String RandomUser::chooseFromMenu(const std::vector<Stage::Entry>& entries) {
    std::vector<String> enabled;
    for (const auto& entry : entries)
        if (entry.enabled && entry.visible && entry.caption != u"-") enabled.push_back(entry.name);
    if (enabled.empty() || chance(15)) return {};
    const auto last = static_cast<std::int32_t>(enabled.size()) - 1;
    const String chosen = enabled[static_cast<std::size_t>(number(0, last))];
    if (mCalm && chosen == u"mnuColumnDefinitionDelete" && chance(80)) return enabled.front();
    // Tables would be gone before anything else could happen.
    return chosen == u"mnuTableDefinitionDelete" && (mCalm || chance(80)) ? String() : chosen;
}

void RandomUser::answerDialog() {
    try {
        if (chance(60)) mStage->choose("cboJoinType", static_cast<std::int16_t>(number(0, 3)));
        if (chance(60))
            mStage->choose("cboJoinCompareOperator", static_cast<std::int16_t>(number(0, 5)));
        mStage->clickButton(chance(70) ? "cmdOk" : "cmdCancel");
    } catch (const std::logic_error&) {
        // Closed by its frame.
    }
}
