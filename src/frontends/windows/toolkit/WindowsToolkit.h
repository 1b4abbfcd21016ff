#pragma once

#include "frontends/windows/toolkit/ControlWindow.h"
#include "frontends/windows/toolkit/ModalBox.h"
#include "frontends/windows/toolkit/Surroundings.h"

#include <Zandor/platform/Toolkit.h>

#include <functional>

namespace zandor::platform::windows {

/// Makes one control's constituents as windows of the system's, in a window of the control's own
/// that is a child of its host's. Of one thread, which runs the host's message loop.
class WindowsToolkit final : public Toolkit {
public:
    /// The control's window begins without a size and hidden, until `setBounds` and `show`.
    /// `keeper` stays as long as one of the windows.
    explicit WindowsToolkit(HWND parent, std::shared_ptr<void> keeper = {});
    ~WindowsToolkit() override;

    /// The control's own window; nullptr once it has gone with its host's.
    HWND window() const { return mSurface->hwnd(); }
    /// In the host's pixels. The control lays itself out before this returns.
    void setBounds(const RECT& place) { mSurface->place(place); }
    void show(bool value) { mSurface->show(value); }
    /// The font of the host's surroundings; the host keeps its handle. nullptr: the system's own.
    void setFont(HFONT font);
    /// What the canvas and its lines are painted with; none: the system's own.
    void setColours(std::optional<COLORREF> ground, std::optional<COLORREF> ink);
    /// What the parts say that no property of the control does.
    void setWords(const Words& words);
    comforts::Comforts& comforts() { return mSurroundings->comforts; }
    /// What the windows of this control share.
    Surroundings& surroundings() { return *mSurroundings; }

    /// The control is to lay itself out, to paint (see ControlWindow).
    void onResize(PlainEvent event) { mSurface->onResize = std::move(event); }
    void onPaint(PlainEvent event) { mSurface->onPaint = std::move(event); }
    void onLeave(std::function<bool(bool next)> event) { mSurface->onLeave = std::move(event); }
    void onFocus(std::function<void(bool has)> event) { mSurroundings->onFocus = std::move(event); }
    void onModal(std::function<std::function<void()>()> event) {
        mSurroundings->onModal = std::move(event);
    }
    /// onPaint follows from the message loop.
    void paintLater() { mSurface->paintLater(); }
    /// Boxes are left out.
    void setSilent(bool silent) { mSilent = silent; }
    /// The host's window is about to go: boxes shown from now on stand on their own.
    void close() { mClosing = true; }
    /// The control has ended: its boxes, its dialog, its menu and its drag end too, untold, and its
    /// window leaves the screen.
    void dismiss();

    void MsgBox(const String& prompt, std::int32_t style, const String& title) override;
    std::unique_ptr<Frame> makeFrame(const Design& design, FrameEvents events) override;
    std::unique_ptr<platform::CommandButton> makeCommandButton(const Design& design,
                                                               CommandButtonEvents events) override;
    std::unique_ptr<platform::ComboBox>
    makeComboBox(const Design& design, const std::vector<String>& items, KeyEvent KeyDown) override;
    std::unique_ptr<platform::TextBox> makeTextBox(const Design& design, KeyEvent KeyDown) override;
    std::unique_ptr<platform::Label> makeLabel(const Design& design) override;
    std::unique_ptr<platform::ScrollBar>
    makeScrollBar(const Design& design, Orientation orientation, ScrollBarEvents events) override;
    std::unique_ptr<MSFlexGridLib::MSFlexGrid> makeGrid(const Design& design, std::int32_t rows,
                                                        std::int32_t cols,
                                                        MSFlexGridLib::GridEvents events) override;
    std::unique_ptr<platform::PopupMenu> makePopupMenu(const Design& design,
                                                       PlainEvent Click) override;
    std::unique_ptr<platform::Dialog> makeDialog(const Design& design,
                                                 DialogEvents events) override;
    std::unique_ptr<PickList> makePickList(const Design& design, PickListEvents events) override;
    Ref<ImageList> makeImageList(const Design& design,
                                 const std::vector<Picture>& pictures) override;
    Ref<TalvikTabulet::Tabulet> makeTabulet(const Design& design, std::int16_t index,
                                            const TalvikTabulet::Tabulet* pattern,
                                            const TalvikTabulet::TabuletEvents& events) override;
    Ref<Line> makeLine(const Design& design, std::int16_t index) override;
    Ref<Shape> makeShape(const Design& design, std::int16_t index) override;

    Font AmbientFont() const override;
    Font ControlFont() const override;
    float TextWidth(const String& text) const override;
    float ScaleWidth() const override;
    float ScaleHeight() const override;
    std::uint32_t RegisterWindowMessage(const String& name) override;
    void SendMessage(std::uint32_t message, std::uintptr_t wParam, std::int32_t* lParam) override;

private:
    HWND parentOf(const Design& design) const;
    HWND owner() const;
    template <class Part, class W, class... Arguments>
    std::unique_ptr<Part> make(const Design& design, Arguments&&... arguments);

    const std::shared_ptr<Surroundings> mSurroundings;
    const std::shared_ptr<ControlWindow> mSurface;
    ModalBoxes mBoxes;
    HWND mDialog = nullptr; ///< the last made
    bool mClosing = false;
    bool mSilent = false;
    bool mDismissed = false;
};

} // namespace zandor::platform::windows
