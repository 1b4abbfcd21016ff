#include "Invariants.h"

#include "support/Backstage.h"

#include <Zandor/control/KeyNumber.h>

#include <algorithm>
#include <bitset>

using namespace zandor;

using Backstage = TalvikDBxZandor::ZandorBackstage;
namespace headless = platform::headless;

namespace {

/// The indexes of the elements loaded.
class Loaded {
public:
    template <class T>
    explicit Loaded(const TalvikDBxZandor::ControlArray<T>& array) {
        for (const auto& [index, element] : array) mIndexes.set(static_cast<std::size_t>(index));
    }
    bool has(std::int32_t index) const {
        return index >= 0 && mIndexes.test(static_cast<std::size_t>(index));
    }
    std::size_t count() const { return mIndexes.count(); }

private:
    std::bitset<2 * Backstage::lastJoinSlot + 1> mIndexes;
};

} // namespace

std::string Invariants::broken(const fake::Model& model) {
    mBroken.str({});
    checkTables();
    checkJoins();
    checkRecords();
    checkColumns(model);
    checkEditors();
    checkCanvas();
    checkSurvivors();
    watchElements();
    return mBroken.str();
}

const headless::Grid& Invariants::grid() const {
    return dynamic_cast<const headless::Grid&>(*Backstage::sprColumn(mControl));
}

/// A slot is taken exactly while its table list is loaded.
void Invariants::checkTables() {
    const auto& slots = *Backstage::mTableFreeList(mControl);
    const Loaded tables(Backstage::lstTable(mControl));
    std::int32_t free = 0;
    for (std::int16_t i = 1; i <= Backstage::lastTableSlot; ++i) {
        free += slots.IsFree(i);
        if (tables.has(i) ? slots.IsFree(i) : !slots.IsFree(i) && !mSlotsLost)
            mBroken << "table slot " << i << " disagrees\n";
    }
    if (slots.FreeCount() != free) mBroken << "the count of free table slots disagrees\n";
    const auto taken = static_cast<std::size_t>(Backstage::lastTableSlot - free);
    if (mSlotsLost ? tables.count() > 1 + taken : tables.count() != 1 + taken)
        mBroken << "there are table lists without a slot\n";
}

/// An index is taken exactly while its line and both of its marks are loaded.
void Invariants::checkJoins() {
    const auto& slots = *Backstage::mJoinFreeList(mControl);
    const Loaded lines(Backstage::linJoin(mControl));
    const Loaded marks(Backstage::shpJoin(mControl));
    std::int32_t free = 0;
    for (std::int16_t n = 1; n <= Backstage::lastJoinSlot; ++n) {
        const bool taken = !slots.IsFree(n);
        free += !taken;
        if (lines.has(n) ? !taken : taken && !mSlotsLost)
            mBroken << "line " << n << " disagrees with its slot\n";
        const bool whole = marks.has(2 * n) && marks.has(2 * n - 1);
        const bool none = !marks.has(2 * n) && !marks.has(2 * n - 1);
        if (taken ? !whole && !mSlotsLost : !none)
            mBroken << "the marks of line " << n << " disagree with its slot\n";
    }
    const auto taken = static_cast<std::size_t>(Backstage::lastJoinSlot - free);
    if (slots.FreeCount() != free) mBroken << "the count of free join slots disagrees\n";
    if (!mSlotsLost && (lines.count() != 1 + taken || marks.count() != 1 + 2 * taken))
        mBroken << "there are lines or marks without a slot\n";
}

/// A record has its line, its marks, its key and both of its tables.
void Invariants::checkRecords() {
    const auto& records = Backstage::mJoinLines(mControl);
    const auto& tables = Backstage::lstTable(mControl);
    const Loaded lines(Backstage::linJoin(mControl));
    const Loaded marks(Backstage::shpJoin(mControl));
    const auto isShown = [&](std::int32_t handle, const platform::String& name) {
        return std::any_of(tables.begin(), tables.end(), [&](const auto& element) {
            return element.first != 0 && element.second->TableHandle() == handle &&
                   (element.second->Text() == name || (mSlotsLost && name.empty()));
        });
    };
    for (const auto& record : platform::Each<TalvikDBxZandor::clsJoinLine>(records)) {
        const std::int16_t n = record->Index();
        const bool complete = lines.has(record->JoinLineIndex()) &&
                              marks.has(record->LeftConnectorIndex()) &&
                              marks.has(record->RightConnectorIndex());
        if (!complete) mBroken << "record " << n << " lacks its line or a mark\n";
        if (record->JoinLineIndex() != n || !records.Contains(platform::decimal(n)) ||
            records.Item(platform::decimal(n)) != record)
            mBroken << "record " << n << " is not under its number\n";
        if (!isShown(record->LeftTablehwnd(), record->LeftTableName()) ||
            !isShown(record->RightTablehwnd(), record->RightTableName()))
            mBroken << "record " << n << " has outlived a table\n";
    }
    const auto last = Backstage::mLastJoin(mControl);
    if (last && !lines.has(last->JoinLineIndex()))
        mBroken << "the join hit last has lost its line\n";
}

/// A column with a field carries 0, or the number of a definition that the model holds, or is left
/// over. As long as no model was abandoned no two of them share a definition. A column that has
/// stood last may be left over: the last column of the grid is never removed, neither with its
/// definition nor with its table, nor before the model is shown again.
void Invariants::checkColumns(const fake::Model& model) {
    std::vector<std::int32_t> live;
    for (std::int32_t i = 1; i <= model.definitionCount(); ++i)
        live.push_back(TalvikDBxZandor::numberOfKey(model.definitionAt(i).key));
    std::sort(live.begin(), live.end());
    const std::int32_t last = grid().Cols() - 1;
    if (!grid().cell(0, last).text.empty()) mLeftOver.insert(grid().ColData(last));
    std::vector<std::int32_t> shown;
    for (std::int32_t col = 1; col <= last; ++col) {
        const std::int32_t number = grid().ColData(col);
        if (grid().cell(0, col).text.empty() || number == 0) continue;
        if (mLeftOver.count(number)) continue;
        shown.push_back(number);
        if (!std::binary_search(live.begin(), live.end(), number))
            mBroken << "column " << col << " names no definition by " << number << "\n";
    }
    std::sort(shown.begin(), shown.end());
    const auto twice = std::adjacent_find(shown.begin(), shown.end());
    if (twice != shown.end() && !mAbandoned)
        mBroken << "two columns share definition " << *twice << "\n";
}

void Invariants::abandonColumns() {
    mAbandoned = true;
    for (std::int32_t col = 1; col < grid().Cols(); ++col) mLeftOver.insert(grid().ColData(col));
}

void Invariants::checkEditors() {
    const auto open = [this](const char* frame) { return mToolkit.find(frame).look().visible; };
    if (open("fraSortOrder") + open("fraVisibility") + open("fraValue") > 1)
        mBroken << "two cell editors are open\n";
}

void Invariants::checkCanvas() {
    auto& canvas = *Backstage::fraTable(mControl);
    if (canvas.Left() != -static_cast<float>(Backstage::hsbTable(mControl)->Value()) ||
        canvas.Top() != -static_cast<float>(Backstage::vsbTable(mControl)->Value()))
        mBroken << "the canvas stands elsewhere than its scroll bars say\n";
}

/// Every element of a control array, and every entry of a table list.
template <class Action>
void Invariants::eachElement(const Action& action) {
    for (const auto& [index, table] : Backstage::lstTable(mControl)) {
        action("table list ", index, table);
        auto& entries = table->ColumnItems();
        for (std::int32_t n = 1; n <= entries.Count(); ++n)
            action("an entry of table list ", index, entries.Item(n));
    }
    for (const auto& [index, line] : Backstage::linJoin(mControl)) action("line ", index, line);
    for (const auto& [index, mark] : Backstage::shpJoin(mControl)) action("mark ", index, mark);
}

/// Nothing but a drag record keeps an element that the control has unloaded.
void Invariants::checkSurvivors() {
    std::vector<const void*> loaded;
    for (const auto& record : Backstage::mDragColumns(mControl)) {
        loaded.push_back(record->Table().get());
        loaded.push_back(record->Column().get());
    }
    eachElement([&loaded](const char*, std::int32_t, const auto& element) {
        loaded.push_back(element.get());
    });
    std::sort(loaded.begin(), loaded.end());
    for (const Watched& watched : mWatched)
        if (!watched.element.expired() &&
            !std::binary_search(loaded.begin(), loaded.end(), watched.address))
            mBroken << watched.kind << watched.index << " survives\n";
}

std::string Invariants::survivors() const {
    std::string names;
    for (const Watched& watched : mWatched)
        if (!watched.element.expired())
            names += watched.kind + std::to_string(watched.index) + " survives the control\n";
    return names;
}

void Invariants::watchElements() {
    mWatched.clear();
    eachElement([this](const char* kind, std::int32_t index, const auto& element) {
        mWatched.push_back({kind, index, std::weak_ptr<void>(element), element.get()});
    });
}
