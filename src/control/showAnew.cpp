#include "control/QueryPicture.h"

#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

#include <algorithm>
#include <utility>

// What is shown, brought to what the model has by the difference of the two.

namespace TalvikDBxZandor {

using platform::Bounds;

namespace {

/// A table stands between two twips where its user left it, and the model has the nearest one.
float nearest(std::int32_t wanted, float now) {
    return platform::toLong(now) == wanted ? now : static_cast<float>(wanted);
}

/// How many steps of the cascade a table takes.
std::int32_t cascadeSteps(const TablePicture& table) {
    return (table.isPlaced() ? 0 : 1) + (table.isSized() ? 0 : 1);
}

bool sameEntry(const TalvikTabulet::ColumnItem& shown, const EntryPicture& wanted) {
    return shown.Key() == wanted.key && shown.Text() == wanted.text;
}

} // namespace

/// Keeps the procedures that run meanwhile from showing traces.
class Zandor::Untraced {
public:
    explicit Untraced(Zandor& control) : mControl(control), mBefore(control.mTraces) {
        control.mTraces = false;
    }
    Untraced(const Untraced&) = delete;
    Untraced& operator=(const Untraced&) = delete;
    ~Untraced() { mControl.mTraces = mBefore; }

private:
    Zandor& mControl;
    const bool mBefore;
};

/// The elements that show the tables of a picture.
class Zandor::ShownTables {
public:
    /// Of the elements there are, the first with the key of a table shows it.
    ShownTables(const Zandor& control, const QueryPicture& picture)
        : mControl(control), mTables(picture.tables), mSlots(picture.tables.size()) {
        for (const auto& [index, element] : control.lstTable) {
            if (index == 0) continue;
            std::size_t n = 0;
            while (n < mSlots.size() && (mSlots[n] != 0 || mTables[n].key != element->Tag())) ++n;
            if (n < mSlots.size())
                mSlots[n] = index;
            else
                mOthers.push_back(index);
        }
    }

    /// Slots of the elements that show none of them.
    const std::vector<std::int16_t>& others() const { return mOthers; }
    /// The slot of each table; 0 for one that is not shown yet.
    std::int16_t& slot(std::size_t table) { return mSlots[table]; }
    std::size_t count() const { return mSlots.size(); }

    /// The element of the table with a key, or nothing.
    Ref<Tabulet> element(const String& key) const {
        for (std::size_t n = 0; n < mSlots.size(); ++n)
            if (mTables[n].key == key && !mControl.mTableFreeList->IsFree(mSlots[n]))
                return mControl.lstTable(mSlots[n]);
        return {};
    }
    /// The slot of the selected table, else of the first; 0 without tables.
    std::int16_t heir() const {
        if (mSlots.empty()) return 0;
        const auto selected = std::ranges::find_if(mTables, &TablePicture::selected);
        return selected == mTables.end()
                   ? mSlots.front()
                   : mSlots[static_cast<std::size_t>(selected - mTables.begin())];
    }

private:
    const Zandor& mControl;
    const std::vector<TablePicture>& mTables;
    std::vector<std::int16_t> mSlots;
    std::vector<std::int16_t> mOthers;
};

void Zandor::ShowAnew() {
    Guard(u"ShowAnew", [&] {
        const std::int32_t binding = mBinding;
        const QueryPicture picture = pictureOf(mLife, Model(), lastTableSlot,
                                               static_cast<std::size_t>(sprColumn->Cols()) - 1,
                                               static_cast<std::size_t>(sprColumn->Rows()), mWords);
        require(binding == mBinding); // what was bound meanwhile has been shown
        const Untraced untraced(*this);
        ShowTablesAnew(picture);
        require(binding == mBinding);
        ShowDefinitionsAnew(picture);
        ShowMenuEntries();
        if (const auto bound = mHooks.Bound) bound();
    });
}

void Zandor::ShowTablesAnew(const QueryPicture& picture) {
    const std::int32_t binding = mBinding;
    ShownTables shown(*this, picture);
    RemoveOtherJoins(picture, shown);
    // The focus may go from a table that goes, and the host be told of where it goes.
    for (const std::int16_t index : shown.others()) {
        if (!mTableFreeList->IsFree(index)) UnloadTable(index);
        require(binding == mBinding);
    }

    std::int32_t cascade = 0;
    for (std::size_t n = 0; n < shown.count(); ++n) {
        const TablePicture& table = picture.tables[n];
        if (!mTableFreeList->IsFree(shown.slot(n))) {
            ShowTableAnew(shown.slot(n), table);
            cascade += cascadeSteps(table);
            continue;
        }
        // Before it takes a slot; one that has been closed since the model was read has none.
        Held<TalvikZandorLib::ZDTable> added;
        quietly([&] { added = Tables().Item(table.key); });
        require(binding == mBinding);
        std::int32_t slot = 0;
        if (!added || !mTableFreeList->GetNextFreeIndex(slot)) continue;
        shown.slot(n) = static_cast<std::int16_t>(slot);
        ShowTable(shown.slot(n), added, cascade);
        require(binding == mBinding);
    }
    // The current table stays, and has an heir when it has gone.
    if (mTableFreeList->IsFree(mActiveTableIndex)) mActiveTableIndex = shown.heir();
    if (mActiveTableIndex != 0) Hold(lstTable(mActiveTableIndex))->Activated(true);

    ShowJoinsAnew(picture, shown);
    OrganizeTables();
}

/// Where a table is to stand that stands somewhere now. What the model leaves to the control stays
/// as it is, for its user may have changed it; but where the model had a place meanwhile and has
/// given it up, as by undoing, the table goes back.
Bounds Zandor::PlaceAnew(std::int16_t slot, const TablePicture& table, const Bounds& now) {
    OwnPlace& own = mOwnPlaces[slot];
    Bounds place = now;
    const bool wasPlaced = std::exchange(own.placed, table.isPlaced());
    if (table.isPlaced()) {
        place.Left = nearest(table.left, now.Left);
        place.Top = nearest(table.top, now.Top);
    } else {
        if (!wasPlaced || !own.place) own.place = now;
        place.Left = own.place->Left;
        place.Top = own.place->Top;
    }
    const bool wasSized = std::exchange(own.sized, table.isSized());
    if (table.isSized()) {
        place.Width = nearest(table.width, now.Width);
        place.Height = nearest(table.height, now.Height);
    } else {
        if (!wasSized || !own.size) own.size = now;
        place.Width = own.size->Width;
        place.Height = own.size->Height;
    }
    return place;
}

/// Gives a table that is shown already the name, the place and the columns that it has now.
void Zandor::ShowTableAnew(std::int16_t slot, const TablePicture& table) {
    const auto element = Hold(lstTable(slot));
    if (element->Text() != table.name) element->Text(table.name);
    const Bounds now = element->bounds();
    const Bounds place = PlaceAnew(slot, table, now);
    if (place != now) element->setBounds(place);

    auto& shown = element->ColumnItems();
    std::int32_t same = 0;
    const auto wanted = static_cast<std::int32_t>(table.entries.size());
    const auto at = [&](std::int32_t n) -> const EntryPicture& {
        return table.entries[static_cast<std::size_t>(n) - 1];
    };
    while (same < shown.Count() && same < wanted && sameEntry(*shown.Item(same + 1), at(same + 1)))
        ++same;
    std::vector<String> selected;
    if (same < shown.Count()) {
        for (std::int32_t n = 1; n <= shown.Count(); ++n)
            if (shown.Item(n)->Selected()) selected.push_back(shown.Item(n)->Key());
        element->Terminate();
        same = 0;
    }
    const bool grows = same < wanted;
    for (std::int32_t n = 1; n <= wanted; ++n) {
        const Ref<ColumnItem> entry = n <= same ? shown.Item(n) : shown.Add(at(n).key, at(n).text);
        entry->Image(at(n).marked ? std::int16_t{1} : std::int16_t{0});
        if (std::ranges::find(selected, at(n).key) != selected.end()) entry->Selected(true);
    }
    if (grows) element->Complete();
}

/// Removes the lines of joins that the model has no longer, or between other columns.
void Zandor::RemoveOtherJoins(const QueryPicture& picture, const ShownTables& shown) {
    std::vector<Ref<clsJoinLine>> others;
    for (const auto& record : platform::Each<clsJoinLine>(mJoinLines)) {
        const auto same = [&](const JoinPicture& join) {
            if (record->Tag() != platform::Variant(join.key)) return false;
            const auto left = shown.element(join.leftTable);
            const auto right = shown.element(join.rightTable);
            return left && right && left->TableHandle() == record->LeftTablehwnd() &&
                   right->TableHandle() == record->RightTablehwnd() &&
                   record->IsLeftColumn(join.leftColumn) && record->IsRightColumn(join.rightColumn);
        };
        if (std::ranges::none_of(picture.joins, same)) others.push_back(record);
    }
    for (const auto& record : others) RemoveJoin(record);
}

/// Draws the joins that have no line yet, and tells the other lines what their joins are now. One
/// whose tables are not shown has none.
void Zandor::ShowJoinsAnew(const QueryPicture& picture, const ShownTables& shown) {
    for (const JoinPicture& join : picture.joins) {
        const auto left = shown.element(join.leftTable);
        const auto right = shown.element(join.rightTable);
        if (!left || !right) continue;
        Ref<clsJoinLine> record;
        for (const auto& each : platform::Each<clsJoinLine>(mJoinLines))
            if (each->Tag() == platform::Variant(join.key)) record = each;
        if (!record) {
            Ref<ColumnItem> leftColumn, rightColumn;
            FindColumn(left, join.leftColumn, leftColumn);
            FindColumn(right, join.rightColumn, rightColumn);
            if (!leftColumn || !rightColumn) continue;
            if (!DrawNewJoin(record, left, leftColumn, right, rightColumn, join.type,
                             join.comparison))
                continue;
            record->Tag(join.key);
        }
        record->LeftTableName(left->Text());
        record->RightTableName(right->Text());
        record->JoinType(join.type);
        record->CompareOperator(join.comparison);
    }
}

} // namespace TalvikDBxZandor
