#pragma once

#include <Zandor/platform/ImageList.h>
#include <Zandor/platform/Intrinsic.h>
#include <Zandor/platform/MSFlexGrid.h>
#include <Zandor/platform/PickList.h>
#include <Zandor/platform/Tabulet.h>
#include <Zandor/platform/export.h>

namespace zandor::platform {

inline constexpr std::int32_t styleOkOnly = 0;         ///< an OK button
inline constexpr std::int32_t styleExclamation = 48;   ///< an exclamation mark
inline constexpr std::int32_t styleSystemModal = 4096; ///< before all windows

/// Shows message boxes; styles are added up.
class ZANDOR_CONTROL_EXPORT MessageBoxes {
public:
    virtual ~MessageBoxes() = default;
    /// Shows a modal box with an OK button and returns when the user has closed it.
    virtual void MsgBox(const String& prompt, std::int32_t style, const String& title) = 0;
};

/// All that one control asks of a user-interface toolkit. The toolkit outlives everything that it
/// makes. Design-time controls are made once, in the order in which they stack.
class ZANDOR_CONTROL_EXPORT Toolkit : public MessageBoxes {
public:
    /// A frame to put other controls into.
    virtual std::unique_ptr<Frame> makeFrame(const Design& design, FrameEvents events) = 0;
    /// A button with a caption.
    virtual std::unique_ptr<CommandButton> makeCommandButton(const Design& design,
                                                             CommandButtonEvents events) = 0;
    /// A list to choose one of the items from; nothing is chosen at first.
    virtual std::unique_ptr<ComboBox>
    makeComboBox(const Design& design, const std::vector<String>& items, KeyEvent KeyDown) = 0;
    /// A box for one line of text, empty at first.
    virtual std::unique_ptr<TextBox> makeTextBox(const Design& design, KeyEvent KeyDown) = 0;
    /// A text that cannot be typed into.
    virtual std::unique_ptr<Label> makeLabel(const Design& design) = 0;
    /// A scroll bar at 0.
    virtual std::unique_ptr<ScrollBar> makeScrollBar(const Design& design, Orientation orientation,
                                                     ScrollBarEvents events) = 0;
    /// A grid of so many rows and columns, the first of each for titles.
    virtual std::unique_ptr<MSFlexGridLib::MSFlexGrid>
    makeGrid(const Design& design, std::int32_t rows, std::int32_t cols,
             MSFlexGridLib::GridEvents events) = 0;
    /// Click is the menu's own, fired as it opens.
    virtual std::unique_ptr<PopupMenu> makePopupMenu(const Design& design, PlainEvent Click) = 0;
    /// A dialog window, not shown yet.
    virtual std::unique_ptr<Dialog> makeDialog(const Design& design, DialogEvents events) = 0;

    /// Closed at first.
    virtual std::unique_ptr<PickList> makePickList(const Design& design, PickListEvents events) = 0;

    /// The pictures have the numbers from 1 on.
    virtual Ref<ImageList> makeImageList(const Design& design,
                                         const std::vector<Picture>& pictures) = 0;

    /// Elements of control arrays stand inside design.Container. A table list takes font, images
    /// and lock from the pattern, the array's element 0 (nullptr when element 0 itself is made),
    /// and starts invisible; `events` outlives the element.
    virtual Ref<TalvikTabulet::Tabulet> makeTabulet(const Design& design, std::int16_t index,
                                                    const TalvikTabulet::Tabulet* pattern,
                                                    const TalvikTabulet::TabuletEvents& events) = 0;
    /// A line, invisible at first.
    virtual Ref<Line> makeLine(const Design& design, std::int16_t index) = 0;
    /// A mark, invisible at first.
    virtual Ref<Shape> makeShape(const Design& design, std::int16_t index) = 0;

    /// The font that the host's surroundings use.
    virtual Font AmbientFont() const = 0;
    /// The control's own font.
    virtual Font ControlFont() const = 0;
    /// Width of a text in the control's own font, in twips.
    virtual float TextWidth(const String& text) const = 0;
    /// Inner size of the control, in twips.
    virtual float ScaleWidth() const = 0;
    virtual float ScaleHeight() const = 0; ///< as ScaleWidth

    /// A number for a window message of that name, the same for the same name; 0 on failure.
    virtual std::uint32_t RegisterWindowMessage(const String& name) = 0;
    /// Delivers the message to the control's own window, where the host's framework sees it.
    virtual void SendMessage(std::uint32_t message, std::uintptr_t wParam,
                             std::int32_t* lParam) = 0;
};

} // namespace zandor::platform
