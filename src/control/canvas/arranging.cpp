#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

#include <algorithm>

namespace TalvikDBxZandor {

using platform::single;

void Zandor::OrganizeTables() {
    Guard(u"OrganizeTables", [&] {
        Trace(u"OrganizeTables");
        const auto step = [](const Part<platform::ScrollBar>& bar) {
            return std::max<std::int16_t>(1, static_cast<std::int16_t>(bar->Max() / 5));
        };
        vsbTable->LargeChange(step(vsbTable));
        hsbTable->LargeChange(step(hsbTable));
        const bool anyShown = lstTable.Count() >= 2;
        vsbTable->Enabled(anyShown);
        hsbTable->Enabled(anyShown);
        cmdHome->Enabled(anyShown);
        DrawJoins();
    });
}

void Zandor::lstTable_Moving(std::int16_t Index) {
    Guard(u"lstTable_Moving", [&] {
        const std::int32_t table = lstTable(Index)->TableHandle();
        for (std::int32_t n = 1; n <= mJoinLines.Count(); ++n) {
            clsJoinLine& record = *mJoinLines.Peek(n);
            // What fails is reported once, where the move ends, not at every step of the mouse.
            if (record.IsOf(table)) quietly([&] { FollowJoin(record); });
        }
    });
}

void Zandor::lstTable_Moved(std::int16_t Index) {
    Guard(u"lstTable_Moved", [&] {
        const auto table = Hold(lstTable(Index));
        // Not negated, which would hand a host -0 as the place of the edge.
        const float visibleTop = 0 - fraTable->Top();
        const float visibleLeft = 0 - fraTable->Left();
        if (table->Top() < visibleTop) table->Top(visibleTop);
        if (table->Left() < visibleLeft) table->Left(visibleLeft);
        // The lower limit reckons with the grid's top, not its height; it comes last and wins.
        // Between panes that are no halves, the grid's top is where the upper one ends.
        const bool halves = mOnlyJoin || mUpperPaneShare == half;
        float bottom =
            halves ? single(mToolkit->ScaleHeight() - sprColumn->Top()) : sprColumn->Top();
        bottom = single(single(bottom - fraTable->Top()) - 600);
        if (table->Top() > bottom) table->Top(bottom);
        const float right = single(single(mToolkit->ScaleWidth() - fraTable->Left()) - 600);
        if (table->Left() > right) table->Left(right);

        const auto model = TableOf(table);
        model->Left(table->Left());
        model->Top(table->Top());
        Raise(Event::TableMoved);
        OrganizeTables();
    });
}

void Zandor::lstTable_Resized(std::int16_t Index) {
    Guard(u"lstTable_Resized", [&] {
        const auto table = Hold(lstTable(Index));
        if (table->Width() < 0) table->Width(0);
        if (table->Height() < 0) table->Height(0);
        const auto model = TableOf(table);
        model->Width(table->Width());
        model->Height(table->Height());
        OrganizeTables();
    });
}

void Zandor::lstTable_Scroll(std::int16_t) {
    Guard(u"lstTable_Scroll", [&] { DrawJoins(); });
}

void Zandor::hsbTable_Change() {
    Guard(u"hsbTable_Change", [&] { fraTable->Left(-static_cast<float>(hsbTable->Value())); });
}

void Zandor::vsbTable_Change() {
    Guard(u"vsbTable_Change", [&] { fraTable->Top(-static_cast<float>(vsbTable->Value())); });
}

void Zandor::hsbTable_GotFocus() {
    Guard(u"hsbTable_GotFocus", [&] {
        MakeGetValueFieldsInvisible();
        SetFocusBack();
    });
}

void Zandor::vsbTable_GotFocus() {
    Guard(u"vsbTable_GotFocus", [&] {
        MakeGetValueFieldsInvisible();
        SetFocusBack();
    });
}

void Zandor::cmdHome_Click() {
    Guard(u"cmdHome_Click", [&] {
        vsbTable->Value(0);
        hsbTable->Value(0);
        SetFocusBack();
    });
}

void Zandor::cmdHome_GotFocus() {
    Guard(u"cmdHome_GotFocus", [&] { MakeGetValueFieldsInvisible(); });
}

void Zandor::fraTable_MouseDown(std::int16_t, std::int16_t, float X, float Y) {
    Guard(u"fraTable_MouseDown", [&] {
        MakeGetValueFieldsInvisible();
        Ref<clsJoinLine> hit;
        if (!JoinHitTest(hit, X, Y)) return;
        mLastJoin = hit;
        linJoin(hit->JoinLineIndex())->BorderWidth(2);
    });
}

void Zandor::fraTable_MouseUp(std::int16_t Button, std::int16_t, float X, float Y) {
    // Reports under the table list's name; hosts know it so.
    Guard(u"lstTable_MouseUp", [&] {
        if (Button == platform::rightButton) PopupZandorMenu(menuSource::canvas, X, Y);
    });
}

} // namespace TalvikDBxZandor
