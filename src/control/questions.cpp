#include <Zandor/Questions.h>
#include <Zandor/Zandor.h>

namespace TalvikDBxZandor {

using TalvikZandorLib::ZDColumn;
using TalvikZandorLib::ZDColumnDefinition;
using TalvikZandorLib::ZDJoin;
using TalvikZandorLib::ZDTable;

// A host that says nothing has nothing against it.
bool Questions::MayJoin(const JoinEnd&, const JoinEnd&) { return true; }
bool Questions::MayRemoveJoin(const platform::Ref<ZDJoin>&) { return true; }
bool Questions::MayCloseTable(const platform::Ref<ZDTable>&) { return true; }
bool Questions::MayComeOut(const platform::Ref<ZDColumn>&) { return true; }
bool Questions::MayRemoveColumn(const platform::Ref<ZDColumnDefinition>&) { return true; }
std::vector<HostEntry> Questions::MenuEntries(const MenuPlace&) { return {}; }

void Zandor::ReadOnly(bool value) {
    Guard(u"P_LET ReadOnly", [&] {
        if (mReadOnly == value) return;
        // While it may still be kept, what stands in an open editor is, if it is kept at all.
        if (value) MakeGetValueFieldsInvisible();
        mLife.check();
        const std::vector shown(lstTable.begin(), lstTable.end());
        mReadOnly = value;
        // What the user holds is let go where it was.
        for (const auto& [index, table] : shown) {
            mLife.check();
            table->Locked(value);
            if (value) table->Drag(0);
        }
    });
}

/// The host's answer. What it was asked about may have gone with the model that was bound or shown
/// anew meanwhile: then the procedure ends.
template <class Question>
auto Zandor::Answer(Question question) {
    mLife.check();
    const std::shared_ptr<Questions> questions = mQuestions;
    const Ref<TalvikZandorLib::Zandor> model = mModel;
    const std::int32_t binding = mBinding;
    auto answer = question(*questions);
    mLife.check();
    require(mModel == model && mBinding == binding);
    return answer;
}

template <class T>
bool Zandor::May(bool (Questions::*question)(const Ref<T>&), const Ref<T>& about) {
    if (mReadOnly || !mQuestions) return !mReadOnly;
    // By value: it may go from where it stands while the host is asked.
    return Answer([question, about = Ref<T>(about)](Questions& questions) {
        return (questions.*question)(about);
    });
}

bool Zandor::MayRemoveJoin(const Ref<ZDJoin>& join) { return May(&Questions::MayRemoveJoin, join); }

bool Zandor::MayCloseTable(const Ref<ZDTable>& table) {
    return May(&Questions::MayCloseTable, table);
}

bool Zandor::MayComeOut(const Ref<ZDColumn>& column) { return May(&Questions::MayComeOut, column); }

bool Zandor::MayRemoveColumn(const Ref<ZDColumnDefinition>& definition) {
    return May(&Questions::MayRemoveColumn, definition);
}

bool Zandor::MayJoin(const clsDragColumn& source, const Held<Tabulet>& table,
                     const Ref<ColumnItem>& target) {
    if (mReadOnly || !mQuestions) return !mReadOnly;
    const JoinEnd left{source.ZDTable(), source.ZDColumn()};
    const auto rightTable = TableOf(table);
    const auto columns = List(rightTable, &ZDTable::Columns);
    const JoinEnd right{rightTable, columns.Item(Hold(target)->Key())};
    return Answer([&](Questions& questions) { return questions.MayJoin(left, right); });
}

/// What is under the place that the menu opens at.
MenuPlace Zandor::PlaceOfMenu(std::int16_t source, float X, float Y) {
    MenuPlace place;
    place.Source = source;
    if (source == menuSource::table) {
        const auto element = Hold(lstTable(mActiveTableIndex));
        const auto table = TableOf(element);
        place.Table = table;
        if (const auto entry = Hold(FirstSelected(*element)))
            place.Column = List(table, &ZDTable::Columns).Item(entry->Key());
    } else if (source == menuSource::canvas) {
        place.X = X;
        place.Y = Y;
        Ref<clsJoinLine> hit;
        if (JoinHitTest(hit, X, Y) && HasTag(*hit)) place.Join = ModelJoin(*hit);
    } else if (source == menuSource::grid) {
        std::int32_t column = 0;
        basZandor::SpreadHitTest(mLife, column, place.Row, *sprColumn, X, Y);
        if (column >= 1 && sprColumn->ColData(column) != 0) place.Definition = DefinitionOf(column);
    }
    return place;
}

/// Entries that were made for an earlier menu serve again; those that are too many are hidden.
/// Where the host fails, the menu opens with the control's own.
void Zandor::OfferHostEntries(std::int16_t source, float X, float Y) {
    Guard(u"OfferHostEntries", [&] {
        mHostEntries.clear();
        for (const auto& entry : mnuHost) entry->Visible(false);
        if (!mQuestions) return;
        const MenuPlace place = PlaceOfMenu(source, X, Y);
        auto offered = Answer([&](Questions& questions) { return questions.MenuEntries(place); });
        if (offered.empty()) return;
        offered.insert(offered.begin(), {.Caption = u"-", .Chosen = {}});
        mHostEntries.swap(offered);
        for (std::size_t n = 0; n < mHostEntries.size(); ++n) {
            if (n == mnuHost.size()) {
                const String name = u"mnuHost" + platform::decimal(static_cast<std::int32_t>(n));
                mnuHost.emplace_back(mLife,
                                     mnuZandor->makeEntry(
                                         {.Name = name}, [this, n] { mnuHost_Click(n); }, nullptr));
            }
            mnuHost[n]->Caption(mHostEntries[n].Caption);
            mnuHost[n]->Enabled(mHostEntries[n].Enabled);
            mnuHost[n]->Visible(true);
        }
    });
}

void Zandor::mnuHost_Click(std::size_t entry) {
    Guard(u"mnuHost_Click", [&] {
        if (entry >= mHostEntries.size()) return;
        // A copy: what it does may end the control.
        if (const auto chosen = mHostEntries[entry].Chosen) chosen();
    });
}

} // namespace TalvikDBxZandor
