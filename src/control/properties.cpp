#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

namespace TalvikDBxZandor {

using platform::single;
using platform::toInteger;

namespace {

/// Scrolls so that `value` is the first visible twip of a canvas of `extent`, of which `visible`
/// can be seen; past the end of the range, to its end. Both are read afresh at each use.
template <class Visible, class Extent>
void scrollTo(const Part<platform::ScrollBar>& bar, std::int16_t value, const Visible& visible,
              const Extent& extent) {
    if (single(value + visible()) < extent()) {
        bar->Value(value);
        return;
    }
    const float whole = extent();
    const float end = single(whole - visible());
    bar->Value(end >= 1 ? toInteger(end) : std::int16_t{0});
}

} // namespace

std::int16_t Zandor::VisibleFrameLeft() const {
    std::int16_t result = 0;
    Guard(report::VisibleFrameLeft.get, [&] { result = toInteger(-fraTable->Left()); });
    return result;
}

void Zandor::VisibleFrameLeft(std::int16_t v) {
    Guard(report::VisibleFrameLeft.let, [&] {
        scrollTo(
            hsbTable, v, [&] { return mToolkit->ScaleWidth(); }, [&] { return fraTable->Width(); });
    });
}

std::int16_t Zandor::VisibleFrameTop() const {
    std::int16_t result = 0;
    Guard(report::VisibleFrameTop.get, [&] { result = toInteger(-fraTable->Top()); });
    return result;
}

void Zandor::VisibleFrameTop(std::int16_t v) {
    Guard(report::VisibleFrameTop.let, [&] {
        scrollTo(
            vsbTable, v, [&] { return UpperPaneHeight(); }, [&] { return fraTable->Height(); });
    });
}

std::int16_t Zandor::HorizMaxScrollPos() const {
    std::int16_t result = 0;
    Guard(report::HorizMaxScrollPos.get, [&] { result = hsbTable->Max(); });
    return result;
}

void Zandor::HorizMaxScrollPos(std::int16_t v) {
    Guard(report::HorizMaxScrollPos.let, [&] { hsbTable->Max(v); });
}

std::int16_t Zandor::VertMaxScrollPos() const {
    std::int16_t result = 0;
    Guard(report::VertMaxScrollPos.get, [&] { result = vsbTable->Max(); });
    return result;
}

void Zandor::VertMaxScrollPos(std::int16_t v) {
    Guard(report::VertMaxScrollPos.let, [&] { vsbTable->Max(v); });
}

std::int16_t Zandor::HorizontalScrollbarPos() const {
    std::int16_t result = 0;
    Guard(report::HorizontalScrollbarPos.get, [&] { result = hsbTable->Value(); });
    return result;
}

void Zandor::HorizontalScrollbarPos(std::int16_t v) {
    Guard(report::HorizontalScrollbarPos.let, [&] { hsbTable->Value(v); });
}

std::int16_t Zandor::VerticalScrollbarPos() const {
    std::int16_t result = 0;
    Guard(report::VerticalScrollbarPos.get, [&] { result = vsbTable->Value(); });
    return result;
}

void Zandor::VerticalScrollbarPos(std::int16_t v) {
    Guard(report::VerticalScrollbarPos.let, [&] { vsbTable->Value(v); });
}

void Zandor::OnlyJoin(bool v) {
    Guard(report::OnlyJoin.let, [&] {
        mOnlyJoin = v;
        if (!mOnlyJoin) {
            sprColumn->Visible(true);
            WriteRowTitles();
        } else {
            sprColumn->Visible(false);
        }
        ResizeControls();
    });
}

} // namespace TalvikDBxZandor
