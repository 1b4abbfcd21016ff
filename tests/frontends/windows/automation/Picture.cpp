#include "Picture.h"

#include "writeBitmap.h"

using namespace zandor::automation;

Picture Picture::of(const Container& form) {
    SIZEL extent{};
    form.as<IOleObject>()->GetExtent(DVASPECT_CONTENT, &extent);
    // Hundredths of a millimetre, of 96 points to an inch
    return {*form.as<IViewObject2>().get(),
            {MulDiv(extent.cx, 96, 2540), MulDiv(extent.cy, 96, 2540)}};
}

Picture::Picture(IViewObject2& view, SIZE size) : mSize(size), mDc(CreateCompatibleDC(nullptr)) {
    mInfo.bmiHeader.biSize = sizeof mInfo.bmiHeader;
    mInfo.bmiHeader.biWidth = size.cx;
    mInfo.bmiHeader.biHeight = -size.cy;
    mInfo.bmiHeader.biPlanes = 1;
    mInfo.bmiHeader.biBitCount = 32;
    mBitmap = CreateDIBSection(nullptr, &mInfo, DIB_RGB_COLORS, reinterpret_cast<void**>(&mPoints),
                               nullptr, 0);
    mBefore = SelectObject(mDc, mBitmap);
    const RECTL place{0, 0, size.cx, size.cy};
    mDrawn = view.Draw(DVASPECT_CONTENT, -1, nullptr, nullptr, nullptr, mDc, &place, nullptr,
                       nullptr, 0);
    GdiFlush();
}

Picture::~Picture() {
    SelectObject(mDc, mBefore);
    DeleteObject(mBitmap);
    DeleteDC(mDc);
}

int Picture::otherThan(COLORREF colour) const {
    int count = 0;
    const std::uint32_t held =
        GetRValue(colour) << 16 | GetGValue(colour) << 8 | std::uint32_t{GetBValue(colour)};
    for (LONG i = 0; i < mSize.cx * mSize.cy; ++i)
        if ((mPoints[i] & 0xFFFFFF) != held) ++count;
    return count;
}

void Picture::keep(const std::string& name) const {
    writeBitmap(mDc, {0, 0, mSize.cx, mSize.cy}, name);
}
