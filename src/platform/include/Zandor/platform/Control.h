#pragma once

#include <Zandor/platform/String.h>
#include <Zandor/platform/export.h>

namespace zandor::platform {

/// A placement inside the container, in twips (1/1440 inch, 15 to a logical pixel at 96 dpi).
struct Bounds {
    float Left = 0;
    float Top = 0;
    float Width = 0;
    float Height = 0;

    friend bool operator==(const Bounds&, const Bounds&) = default;
};

struct Font {
    String Name;
    float Size = 8.25F; ///< points

    friend bool operator==(const Font&, const Font&) = default;
};

/// Anything that stands somewhere in its container.
class ZANDOR_CONTROL_EXPORT Control {
public:
    Control() = default;
    Control(const Control&) = delete;
    Control& operator=(const Control&) = delete;
    virtual ~Control() = default;

    /// The placement exactly as it was last set or as the user left it, fractions of a pixel kept.
    virtual Bounds bounds() const = 0;
    virtual void setBounds(const Bounds& bounds) = 0;

    float Left() const { return bounds().Left; }
    float Top() const { return bounds().Top; }
    float Width() const { return bounds().Width; }
    float Height() const { return bounds().Height; }

    void Left(float value) { set(&Bounds::Left, value); }
    void Top(float value) { set(&Bounds::Top, value); }
    void Width(float value) { set(&Bounds::Width, value); }
    void Height(float value) { set(&Bounds::Height, value); }

private:
    void set(float Bounds::*side, float value) {
        Bounds changed = bounds();
        changed.*side = value;
        setBounds(changed);
    }
};

/// What a constituent control is born with: the settings of design time.
struct Design {
    StringView Name;          ///< the control's name, "hsbTable"
    StringView FontName = {}; ///< empty: the container's font
    StringView Caption = {};
    Control* Container = nullptr; ///< nullptr: the control's own surface
};

} // namespace zandor::platform
