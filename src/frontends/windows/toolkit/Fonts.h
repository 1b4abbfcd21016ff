#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/Control.h>

#include <map>
#include <tuple>

namespace zandor::platform::windows {

/// The fonts of one control, each made once and kept until the control goes.
class Fonts {
public:
    enum class Face { plain, title, small };

    /// The font of the system's own message boxes is the control's until its host has another.
    explicit Fonts(int dpi);
    Fonts(const Fonts&) = delete;
    Fonts& operator=(const Fonts&) = delete;
    ~Fonts();

    /// The control's own, at so many dots to an inch. What the fonts before were stays valid until
    /// `dropOld`.
    void setOwn(const LOGFONTW& font, int dpi);
    /// The monitor is another: the own font keeps its size in points.
    void setDpi(int dpi);
    /// Nobody uses the fonts of before any more.
    void dropOld();

    const Font& own() const { return mOwn; }
    /// The system's handle of a font, which stays the property of these.
    HFONT of(const Font& font, Face face = Face::plain);

    /// Of a text in one line.
    int widthOf(HFONT font, const String& text) const;
    int heightOf(HFONT font) const;

private:
    LOGFONTW mBase{}; ///< has what a name and a size do not say
    Font mOwn;
    int mDpi;
    HDC mMeasuring;
    std::map<std::tuple<String, float, Face>, HFONT> mMade;
    std::multimap<std::tuple<String, float, Face>, HFONT> mOld;
};

} // namespace zandor::platform::windows
