#include "frontends/windows/toolkit/Images.h"

#include "frontends/windows/toolkit/Drawing.h"

#include <algorithm>
#include <cmath>

namespace zandor::platform::windows {

namespace {

/// Places of a square of 16 in another one.
class Grid16 {
public:
    explicit Grid16(const RECT& square) : mSquare(square) {}
    int x(double x) const {
        return mSquare.left + static_cast<int>(std::lround(x * widthOf(mSquare) / 16));
    }
    int y(double y) const {
        return mSquare.top + static_cast<int>(std::lround(y * heightOf(mSquare) / 16));
    }
    POINT at(double left, double top) const { return {x(left), y(top)}; }
    RECT rect(double left, double top, double right, double bottom) const {
        return {x(left), y(top), std::max(x(right), x(left) + 1), std::max(y(bottom), y(top) + 1)};
    }

private:
    const RECT mSquare;
};

void fillEllipse(HDC dc, const RECT& place, COLORREF colour) {
    const HGDIOBJ pen = SelectObject(dc, GetStockObject(DC_PEN));
    const HGDIOBJ brush = SelectObject(dc, GetStockObject(DC_BRUSH));
    SetDCPenColor(dc, colour);
    SetDCBrushColor(dc, colour);
    Ellipse(dc, place.left, place.top, place.right, place.bottom);
    SelectObject(dc, pen);
    SelectObject(dc, brush);
}

void paintKey(HDC dc, const Grid16& at, COLORREF colour, COLORREF ground) {
    fillEllipse(dc, at.rect(0.2, 3.7, 8.8, 12.3), colour);
    fillEllipse(dc, at.rect(2.2, 6, 6.2, 10), ground);
    fill(dc, at.rect(7.5, 6.9, 15.5, 9.1), colour);
    fill(dc, at.rect(13.3, 8, 15.5, 12.4), colour);
    fill(dc, at.rect(10, 8, 12, 11.2), colour);
}

} // namespace

void paintPicture(HDC dc, Picture picture, const RECT& square, COLORREF colour, COLORREF ground) {
    switch (picture) {
    case Picture::key: return paintKey(dc, Grid16(square), colour, ground);
    }
}

void paintOutputMark(HDC dc, const RECT& square, COLORREF colour) {
    const Grid16 at(square);
    const int width = std::max(1, widthOf(square) / 7);
    line(dc, at.at(3, 8.5), at.at(6.5, 12), colour, width);
    line(dc, at.at(6.5, 12), at.at(13, 4.5), colour, width);
}

} // namespace zandor::platform::windows
