#pragma once

#include "Container.h"

/// A picture of a control, drawn as for a designer or a printer: in a size of its own.
class Picture {
public:
    /// As large as the control is.
    static Picture of(const Container& form);

    Picture(IViewObject2& view, SIZE size);
    Picture(const Picture&) = delete;
    Picture& operator=(const Picture&) = delete;
    ~Picture();

    HRESULT drawn() const { return mDrawn; }
    COLORREF at(POINT place) const { return GetPixel(mDc, place.x, place.y); }
    /// How many points are not of one colour.
    int otherThan(COLORREF colour) const;
    /// As a file in the folder that ZANDOR_PICTURES names, to be looked at.
    void keep(const std::string& name) const;

private:
    SIZE mSize;
    HDC mDc;
    BITMAPINFO mInfo{};
    std::uint32_t* mPoints = nullptr;
    HBITMAP mBitmap;
    HGDIOBJ mBefore;
    HRESULT mDrawn;
};
