#include "frontends/windows/toolkit/Fonts.h"

#include "frontends/windows/toolkit/Scale.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <cmath>
#include <cwchar>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr double pointsPerInch = 72;

/// A font selected to be measured.
class Selected {
public:
    Selected(HDC dc, HFONT font) : mDc(dc), mBefore(SelectObject(dc, font)) {}
    Selected(const Selected&) = delete;
    Selected& operator=(const Selected&) = delete;
    ~Selected() { SelectObject(mDc, mBefore); }

private:
    HDC mDc;
    HGDIOBJ mBefore;
};

LOGFONTW messageFont() {
    NONCLIENTMETRICSW metrics{};
    metrics.cbSize = sizeof metrics;
    SystemParametersInfoW(SPI_GETNONCLIENTMETRICS, sizeof metrics, &metrics, 0);
    return metrics.lfMessageFont;
}

} // namespace

Fonts::Fonts(int dpi) : mDpi(dpi), mMeasuring(CreateCompatibleDC(nullptr)) {
    setOwn(messageFont(), dpiOf(nullptr));
    setDpi(dpi);
}

Fonts::~Fonts() {
    for (const auto& [look, font] : mMade) DeleteObject(font);
    dropOld();
    DeleteDC(mMeasuring);
}

void Fonts::setOwn(const LOGFONTW& font, int dpi) {
    mOld.merge(mMade);
    mMade.clear();
    mBase = font;
    mDpi = dpi;
    const int height = font.lfHeight < 0 ? -font.lfHeight : font.lfHeight;
    mOwn.Name = fromWide(font.lfFaceName, std::wcslen(font.lfFaceName));
    // Points come in quarters.
    mOwn.Size = static_cast<float>(std::round(4 * pointsPerInch * height / dpi) / 4);
}

void Fonts::setDpi(int dpi) {
    if (std::exchange(mDpi, dpi) == dpi) return;
    mOld.merge(mMade);
    mMade.clear();
}

void Fonts::dropOld() {
    for (const auto& [look, font] : mOld) DeleteObject(font);
    mOld.clear();
}

HFONT Fonts::of(const Font& font, Face face) {
    HFONT& made = mMade[{font.Name, font.Size, face}];
    if (made) return made;
    LOGFONTW wanted = mBase;
    const double points = static_cast<double>(font.Size) * (face == Face::small ? 0.85 : 1);
    wanted.lfHeight = -static_cast<LONG>(std::lround(points * mDpi / pointsPerInch));
    wanted.lfWidth = 0;
    if (face == Face::title) wanted.lfWeight = FW_SEMIBOLD;
    const std::size_t length = std::min<std::size_t>(font.Name.size(), LF_FACESIZE - 1);
    std::copy_n(wide(font.Name), length, wanted.lfFaceName);
    wanted.lfFaceName[length] = 0;
    return made = CreateFontIndirectW(&wanted);
}

int Fonts::widthOf(HFONT font, const String& text) const {
    const Selected selected(mMeasuring, font);
    SIZE size{};
    GetTextExtentPoint32W(mMeasuring, wide(text), static_cast<int>(text.size()), &size);
    return size.cx;
}

int Fonts::heightOf(HFONT font) const {
    const Selected selected(mMeasuring, font);
    TEXTMETRICW metrics{};
    GetTextMetricsW(mMeasuring, &metrics);
    return metrics.tmHeight;
}

} // namespace zandor::platform::windows
