#pragma once

#include <Zandor/platform/Control.h>
#include <Zandor/platform/export.h>

#include <functional>
#include <memory>
#include <vector>

/// The intrinsic controls that the control is built of. Event parameters keep their classic
/// meaning: Button 1 left, 2 right, 4 middle, added up; Shift 1 shift, 2 control, 4 alt, added up;
/// X and Y in twips in the coordinates of the control that reports.
namespace zandor::platform {

inline constexpr std::int16_t leftButton = 1;  ///< as Button of the events has it
inline constexpr std::int16_t rightButton = 2; ///< as Button of the events has it
inline constexpr std::int16_t keyEscape = 27;  ///< as KeyCode of the events has it

/// A button goes down or comes up.
using MouseEvent = std::function<void(std::int16_t Button, std::int16_t Shift, float X, float Y)>;
/// A key goes down.
using KeyEvent = std::function<void(std::int16_t KeyCode, std::int16_t Shift)>;
using PlainEvent = std::function<void()>; ///< without anything besides

/// What a frame tells.
struct FrameEvents {
    MouseEvent MouseDown; ///< beside what stands in it
    MouseEvent MouseUp;   ///< beside what stands in it
};

/// A frame that other controls stand in.
class ZANDOR_CONTROL_EXPORT Frame : public Control {
public:
    /// As set last, whatever is true of the containers.
    virtual bool Visible() const = 0;
    virtual void Visible(bool value) = 0;
    /// Brings the frame before its siblings.
    virtual void ZOrder() = 0;
};

/// What a button tells.
struct CommandButtonEvents {
    PlainEvent Click;    ///< by mouse or key
    PlainEvent GotFocus; ///< it has the focus now
};

/// A button.
class ZANDOR_CONTROL_EXPORT CommandButton : public Control {
public:
    virtual void Caption(const String& value) = 0; ///< an ampersand marks the mnemonic
    virtual void Enabled(bool value) = 0;          ///< whether it can be pressed
    /// Enter in a sibling input presses the default button.
    virtual void Default(bool value) = 0;
    virtual void Font(const platform::Font& value) = 0; ///< of its caption
};

/// A list to choose from.
class ZANDOR_CONTROL_EXPORT ComboBox : public Control {
public:
    /// The chosen position, 0-based; -1 when nothing is chosen.
    virtual std::int16_t ListIndex() const = 0;
    /// Error 380 outside -1 to the last position; the choice then stays.
    virtual void ListIndex(std::int16_t value) = 0;
    /// Of the chosen item; empty: nothing is chosen.
    virtual String Text() const = 0;
    virtual void Clear() = 0;                           ///< leaves no item
    virtual void AddItem(const String& text) = 0;       ///< behind the others
    virtual void Enabled(bool value) = 0;               ///< whether it can be used
    virtual void Font(const platform::Font& value) = 0; ///< of its items
    virtual void SetFocus() = 0; ///< error 5 when it cannot take the focus now
    /// Shows the list, with the chosen item as its current one, as soon as its user's hands are
    /// free for it. A list that has dropped down so takes Enter for its current item; Escape, and
    /// Tab with its current item chosen, close it and reach the box.
    virtual void DropDown() = 0;
};

/// A box for one line of text.
class ZANDOR_CONTROL_EXPORT TextBox : public Control {
public:
    /// What stands in it.
    virtual String Text() const = 0;
    virtual void Text(const String& value) = 0;
    virtual void SetFocus() = 0; ///< error 5 when it cannot take the focus now
};

/// A text that cannot be typed into.
class ZANDOR_CONTROL_EXPORT Label : public Control {
public:
    virtual void Caption(const String& value) = 0;      ///< an ampersand marks the mnemonic
    virtual void Font(const platform::Font& value) = 0; ///< of its text
};

/// Of a scroll bar.
enum class Orientation { horizontal, vertical };

/// What a scroll bar tells.
struct ScrollBarEvents {
    PlainEvent Change;   ///< value is another one
    PlainEvent GotFocus; ///< it has the focus now
};

/// A scroll bar from 0 to Max. Change fires whenever Value changes, whoever changed it.
class ZANDOR_CONTROL_EXPORT ScrollBar : public Control {
public:
    /// The end of its range; one below Value moves Value down to it. Error 380 for a negative one.
    virtual std::int16_t Max() const = 0;
    /// A Max below Value moves Value down to it. Error 380 for a negative one.
    virtual void Max(std::int16_t value) = 0;
    /// Where it stands. Error 380 outside 0 to Max; the position then stays.
    virtual std::int16_t Value() const = 0;
    /// Error 380 outside 0 to Max; the position then stays.
    virtual void Value(std::int16_t value) = 0;
    virtual void LargeChange(std::int16_t value) = 0; ///< by how much a page moves it
    virtual void Enabled(bool value) = 0;             ///< whether it can be moved
};

/// Short texts at a line, from its first end to its second, and the whole in a sentence. Empty ones
/// are not shown.
struct LineNotes {
    String First;    ///< at the first end
    String Middle;   ///< at the middle
    String Second;   ///< at the second end
    String Sentence; ///< the whole, in its tooltip

    friend bool operator==(const LineNotes&, const LineNotes&) = default;
};

/// A line painted by the canvas, below every table. Coordinates in canvas twips.
class ZANDOR_CONTROL_EXPORT Line {
public:
    virtual ~Line() = default;
    virtual float X1() const = 0;                                     ///< of its first end
    virtual float Y1() const = 0;                                     ///< of its first end
    virtual float X2() const = 0;                                     ///< of its second end
    virtual float Y2() const = 0;                                     ///< of its second end
    virtual void setEnds(float X1, float Y1, float X2, float Y2) = 0; ///< both at once
    /// In logical pixels; 1 is plain, 2 highlighted.
    virtual void BorderWidth(std::int16_t value) = 0;
    virtual void Visible(bool value) = 0; ///< whether it is shown
    /// A line has none at first.
    virtual void Notes(const LineNotes& value) = 0;
};

inline constexpr std::int16_t shapeSquare = 1; ///< of a mark
inline constexpr std::int16_t shapeCircle = 3; ///< of a mark

/// A mark painted by the canvas, below every table.
class ZANDOR_CONTROL_EXPORT Shape : public Control {
public:
    virtual void ShapeStyle(std::int16_t value) = 0; ///< one of the two above
    virtual void Visible(bool value) = 0;            ///< whether it is shown
};

/// An entry of a menu; it goes with the object.
class ZANDOR_CONTROL_EXPORT MenuEntry {
public:
    virtual ~MenuEntry() = default;
    virtual void Caption(const String& value) = 0; ///< an ampersand marks the mnemonic
    virtual void Enabled(bool value) = 0;          ///< whether it can be chosen
    virtual void Visible(bool value) = 0;          ///< whether it is shown
};

/// A menu that is only ever popped up.
class ZANDOR_CONTROL_EXPORT PopupMenu {
public:
    virtual ~PopupMenu() = default;
    /// Caption "-" makes a separator. An ampersand marks the mnemonic. The entry stands right
    /// before another one of this menu, or at its end.
    virtual std::unique_ptr<MenuEntry> makeEntry(const Design& design, PlainEvent Click,
                                                 const MenuEntry* before) = 0;
    /// Fires the menu's own click, shows it at the mouse and returns when it has closed; the
    /// chosen entry's handler has run by then.
    virtual void PopupMenuAtMouse() = 0;
};

/// What a dialog tells.
struct DialogEvents {
    /// The user closes the window by its frame or with Escape.
    PlainEvent Close;
};

/// A modal dialog window; labels, inputs and buttons are made with it as their container.
class ZANDOR_CONTROL_EXPORT Dialog : public Control {
public:
    virtual void Caption(const String& value) = 0; ///< of its window
    /// Returns when the dialog has been hidden.
    virtual void ShowModal() = 0;
    virtual void Hide() = 0; ///< ends ShowModal
};

} // namespace zandor::platform
