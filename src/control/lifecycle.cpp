#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

#include <algorithm>
#include <cmath>

namespace TalvikDBxZandor {

using platform::single;
using platform::toInteger;

void Zandor::Trace(platform::StringView text, platform::StringView title) const {
    if (mDebugSwitch != 0 && mTraces)
        mLife.MsgBox(String(text), platform::styleSystemModal, String(title));
}

void Zandor::Raise(Event event, const EventArguments& arguments) {
    mEvents->Raise(event, arguments);
}

// Texts and flags have their defaults as initialisers.
void Zandor::UserControl_Initialize() {
    Guard(u"UserControl_Initialize", [&] {
        const clsFreeList factory(mLife);
        mTableFreeList = factory.CreateFreeList(1, lastTableSlot);
        mJoinFreeList = factory.CreateFreeList(1, lastJoinSlot);
        WriteRowTitles();
        sprColumn->Visible(!mOnlyJoin);
    });
}

void Zandor::WriteRowTitles() {
    const String* const titles[] = {&LNGSpreadField,   &LNGSpreadSynonym,  &LNGSpreadSort,
                                    &LNGSpreadVisible, &LNGSpreadCriteria, &LNGSpreadOr};
    std::int32_t row = 0;
    for (const String* title : titles) sprColumn->TextMatrix(row++, 0, *title);
}

void Zandor::UserControl_Paint() {
    Guard(u"UserControl_Paint", [&] {
        MakeGetValueFieldsInvisible();
        ResizeControls();
    });
}

void Zandor::UserControl_Resize() {
    Guard(u"UserControl_Resize", [&] { ResizeControls(); });
}

void Zandor::UserControl_Terminate() {
    Guard(u"UserControl_Terminate", [&] {
        Trace(u"UserControl_Terminate");
        Terminate();
    });
}

void Zandor::End() {
    if (std::exchange(mEnding, true)) return;
    UserControl_Terminate();
    mLife.end();
}

float Zandor::UpperPaneHeight() const {
    const float height = mToolkit->ScaleHeight();
    return mOnlyJoin ? height : single(height * mUpperPaneShare);
}

void Zandor::UpperPaneShare(float share) {
    constexpr float least = 0.05F;
    if (std::isnan(share)) return;
    mUpperPaneShare = std::clamp(share, least, 1 - least);
    ResizeControls();
}

void Zandor::ResizeControls() {
    Guard(u"ResizeControls", [&] {
        LayOut();
        if (const auto laidOut = mHooks.LaidOut) laidOut();
    });
}

void Zandor::LayOut() {
    if (mToolkit->ScaleWidth() > 120) {
        const float hidden = single(MXHorzFrameSize - mToolkit->ScaleWidth());
        hsbTable->Max(hidden >= 1 ? toInteger(hidden) : std::int16_t{0});
        fraTable->Width(MXHorzFrameSize);
        sprColumn->Width(mToolkit->ScaleWidth());
        vsbTable->Left(single(mToolkit->ScaleWidth() - vsbTable->Width()));
        hsbTable->Width(vsbTable->Left());
        cmdHome->Left(vsbTable->Left());
        cmdHome->Width(vsbTable->Width());
    }

    const float height = UpperPaneHeight();
    if (height <= 300) return;
    if (!mOnlyJoin) {
        sprColumn->Top(height);
        sprColumn->Height(single(mToolkit->ScaleHeight() - height));
    }
    vsbTable->Height(single(height - hsbTable->Height()));
    hsbTable->Top(vsbTable->Height());
    cmdHome->Top(vsbTable->Height());
    cmdHome->Height(hsbTable->Height());
    // The test uses the whole height, the value the upper pane's: hosts rely on both.
    const bool scrolls = single(MXVertFrameSize - mToolkit->ScaleHeight()) >= 1;
    vsbTable->Max(scrolls ? toInteger(single(MXVertFrameSize - height)) : std::int16_t{0});
    fraTable->Height(MXVertFrameSize);
}

} // namespace TalvikDBxZandor
