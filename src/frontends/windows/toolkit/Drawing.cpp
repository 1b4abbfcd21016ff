#include "frontends/windows/toolkit/Drawing.h"

#include "frontends/windows/toolkit/Text.h"
#include "frontends/windows/toolkit/Window.h"

#include <cmath>

namespace zandor::platform::windows {

Buffer::Buffer(HDC target, const RECT& place)
    : mTarget(target), mPlace(place), mDc(CreateCompatibleDC(target)),
      mBitmap(CreateCompatibleBitmap(target, widthOf(place), heightOf(place))),
      mBefore(SelectObject(mDc, mBitmap)) {
    SetViewportOrgEx(mDc, -place.left, -place.top, nullptr);
}

Buffer::~Buffer() {
    SetViewportOrgEx(mDc, 0, 0, nullptr);
    BitBlt(mTarget, mPlace.left, mPlace.top, widthOf(mPlace), heightOf(mPlace), mDc, 0, 0, SRCCOPY);
    SelectObject(mDc, mBefore);
    DeleteObject(mBitmap);
    DeleteDC(mDc);
}

Painting::Painting(HWND window, const Message& message)
    : mWindow(message.id == WM_PAINT ? window : nullptr) {
    if (mWindow) {
        BeginPaint(mWindow, &mPaint);
    } else {
        mPaint.hdc = reinterpret_cast<HDC>(message.w);
        GetClientRect(window, &mPaint.rcPaint);
    }
}

Painting::~Painting() {
    if (mWindow) EndPaint(mWindow, &mPaint);
}

COLORREF mixed(COLORREF one, COLORREF other, double share) {
    const auto mix = [share](int a, int b) {
        return static_cast<BYTE>(std::lround(a + (b - a) * share));
    };
    return RGB(mix(GetRValue(one), GetRValue(other)), mix(GetGValue(one), GetGValue(other)),
               mix(GetBValue(one), GetBValue(other)));
}

void fill(HDC dc, const RECT& place, COLORREF colour) {
    // Needs no brush: a text of no letters on an opaque ground.
    SetBkColor(dc, colour);
    ExtTextOutW(dc, 0, 0, ETO_OPAQUE, &place, nullptr, 0, nullptr);
}

void frame(HDC dc, const RECT& place, COLORREF colour, int width) {
    fill(dc, {place.left, place.top, place.right, place.top + width}, colour);
    fill(dc, {place.left, place.bottom - width, place.right, place.bottom}, colour);
    fill(dc, {place.left, place.top, place.left + width, place.bottom}, colour);
    fill(dc, {place.right - width, place.top, place.right, place.bottom}, colour);
}

void line(HDC dc, POINT from, POINT to, COLORREF colour, int width) {
    const HPEN pen = CreatePen(PS_SOLID, width, colour);
    const HGDIOBJ before = SelectObject(dc, pen);
    MoveToEx(dc, from.x, from.y, nullptr);
    LineTo(dc, to.x, to.y);
    SelectObject(dc, before);
    DeleteObject(pen);
}

void write(HDC dc, const String& text, RECT place, HFONT font, COLORREF colour, UINT format) {
    const HGDIOBJ before = SelectObject(dc, font);
    SetBkMode(dc, TRANSPARENT);
    SetTextColor(dc, colour);
    DrawTextW(dc, wide(text), static_cast<int>(text.size()), &place,
              format | DT_SINGLELINE | DT_VCENTER | DT_NOPREFIX | DT_END_ELLIPSIS);
    SelectObject(dc, before);
}

} // namespace zandor::platform::windows
