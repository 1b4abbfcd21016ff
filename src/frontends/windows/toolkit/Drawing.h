#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/Control.h>

namespace zandor::platform::windows {

struct Message;

/// A picture in memory that is shown at once when it is done, so that nothing flickers. Drawing
/// goes by the coordinates of what it is shown in.
class Buffer {
public:
    Buffer(HDC target, const RECT& place);
    Buffer(const Buffer&) = delete;
    Buffer& operator=(const Buffer&) = delete;
    ~Buffer();

    HDC dc() const { return mDc; }
    const RECT& place() const { return mPlace; }

private:
    HDC mTarget;
    RECT mPlace;
    HDC mDc;
    HBITMAP mBitmap;
    HGDIOBJ mBefore;
};

/// What a window paints when it is asked to: by the system the part that is stale (WM_PAINT), for a
/// picture of it the whole (WM_PRINTCLIENT).
class Painting {
public:
    Painting(HWND window, const Message& message);
    Painting(const Painting&) = delete;
    Painting& operator=(const Painting&) = delete;
    ~Painting();

    HDC dc() const { return mPaint.hdc; }
    const RECT& place() const { return mPaint.rcPaint; }

private:
    HWND mWindow; ///< nullptr: for a picture
    PAINTSTRUCT mPaint{};
};

/// A colour between two: `share` of the way from the one to the other, from 0 to 1.
COLORREF mixed(COLORREF one, COLORREF other, double share);
/// Of the system's present looks: COLOR_WINDOW and the like.
inline COLORREF systemColour(int index) { return GetSysColor(index); }

void fill(HDC dc, const RECT& place, COLORREF colour);
/// Just inside a rectangle.
void frame(HDC dc, const RECT& place, COLORREF colour, int width = 1);
void line(HDC dc, POINT from, POINT to, COLORREF colour, int width);
/// In one line, cut with an ellipsis where it is too long. Format: DT_LEFT, DT_CENTER, DT_RIGHT.
void write(HDC dc, const String& text, RECT place, HFONT font, COLORREF colour,
           UINT format = DT_LEFT);

inline int widthOf(const RECT& place) { return place.right - place.left; }
inline int heightOf(const RECT& place) { return place.bottom - place.top; }
inline POINT middleOf(const RECT& place) {
    return {(place.left + place.right) / 2, (place.top + place.bottom) / 2};
}
inline RECT within(RECT place, int left, int top, int right, int bottom) {
    return {place.left + left, place.top + top, place.right - right, place.bottom - bottom};
}

} // namespace zandor::platform::windows
