#pragma once

#include <Zandor/platform/String.h>
#include <Zandor/platform/export.h>

namespace zandor::platform {

/// A placement inside the container, in twips (1/1440 inch, 15 to a logical pixel at 96 dpi).
struct Bounds {
    float Left = 0;   ///< of the left edge
    float Top = 0;    ///< of the upper edge
    float Width = 0;  ///< 0 or more
    float Height = 0; ///< 0 or more

    friend bool operator==(const Bounds&, const Bounds&) = default;
};

/// A font as a host names it.
struct Font {
    String Name;        ///< of the family
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

    /// Of bounds.
    float Left() const { return bounds().Left; }
    /// Of bounds.
    float Top() const { return bounds().Top; }
    /// Of bounds.
    float Width() const { return bounds().Width; }
    /// Of bounds.
    float Height() const { return bounds().Height; }

    /// The others of bounds stay.
    void Left(float value) { set(&Bounds::Left, value); }
    /// The others of bounds stay.
    void Top(float value) { set(&Bounds::Top, value); }
    /// The others of bounds stay.
    void Width(float value) { set(&Bounds::Width, value); }
    /// The others of bounds stay.
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
    StringView Name;              ///< the control's name, "hsbTable"
    StringView FontName = {};     ///< empty: the container's font
    StringView Caption = {};      ///< what stands on it at first
    Control* Container = nullptr; ///< nullptr: the control's own surface
};

} // namespace zandor::platform
