#pragma once

#include <Zandor/comforts/Comforts.h>
#include <Zandor/headless/Dialog.h>
#include <Zandor/headless/Faults.h>
#include <Zandor/headless/Grid.h>
#include <Zandor/headless/ImageList.h>
#include <Zandor/headless/Intrinsic.h>
#include <Zandor/headless/Menu.h>
#include <Zandor/headless/PickList.h>
#include <Zandor/headless/Tabulet.h>
#include <Zandor/headless/export.h>
#include <Zandor/platform/Toolkit.h>

#include <map>
#include <stdexcept>

namespace zandor::platform::headless {

struct MessageBox {
    String prompt;
    std::int32_t style = 0;
    String title;

    friend bool operator==(const MessageBox&, const MessageBox&) = default;
};

struct WindowMessage {
    String name;
    std::uintptr_t wParam = 0;
    bool menuOpen = false; ///< whether a menu stood open when the message came
    bool hasLParam = false;
};

/// The control's own surface, which stands in its host's window.
class ZANDOR_HEADLESS_EXPORT Surface final : public Element {
public:
    explicit Surface(Toolkit& toolkit);
    void resize(float width, float height) { place({0, 0, width, height}); }
    void hide() { setVisible(false); }
};

/// A toolkit without a screen. It keeps everything that a user could see, for tests to look at; the
/// user's side is the class User. Single-threaded, as every toolkit is.
class ZANDOR_HEADLESS_EXPORT Toolkit : public platform::Toolkit {
public:
    Toolkit();
    ~Toolkit() override;

    Faults faults;
    /// What the user does passes here first. A test attaches it to its control.
    comforts::Comforts comforts{*this};

    // The surroundings, which a test may change.
    platform::Font ambientFont{u"Segoe UI", 9};
    platform::Font controlFont{u"Comic Sans MS", 8.25F};
    bool registrationFails = false;
    /// The front end's notifications of the surface.
    PlainEvent onPaint;
    PlainEvent onResize;

    // The user's part of what is modal.
    /// Called with each message box before it closes.
    std::function<void(const MessageBox&)> onBox;
    std::function<void(const WindowMessage&)> onMessage;
    /// Called while a menu stands open; returns the name of the entry chosen. Empty: dismissed. An
    /// entry that is disabled, invisible or a separator is not chosen. Unset: dismissed.
    std::function<std::string(const PopupMenu&)> onMenu;
    /// Called while a dialog stands open. Unset: the user closes it.
    std::function<void(Dialog&)> onDialog;

    /// The control has ended: what stands open closes, and its user can reach nothing of it.
    void close();

    const std::vector<MessageBox>& boxes() const { return mBoxes; }
    const std::vector<WindowMessage>& messages() const { return mMessages; }
    Surface& surface() { return mSurface; }
    /// The element that has the focus, or nothing.
    Element* focus() const { return mFocus; }
    /// The table list being dragged, or nothing.
    Tabulet* dragged() const { return mDragged; }
    bool menuOpen() const { return mMenuOpen; }
    /// The innermost dialog that is open, or nothing.
    Dialog* dialog() const { return mDialogs.empty() ? nullptr : mDialogs.back(); }

    bool exists(const std::string& name) const { return mObjects.count(name) != 0; }
    Object& find(const std::string& name) const;
    /// std::logic_error when there is nothing of that name, or something of another kind.
    template <class T>
    T& find(const std::string& name) const {
        if (auto* found = dynamic_cast<T*>(&find(name))) return *found;
        throw std::logic_error(name + " is of another kind");
    }

    void MsgBox(const String& prompt, std::int32_t style, const String& title) override;
    std::unique_ptr<platform::Frame> makeFrame(const Design& design, FrameEvents events) override;
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
    std::unique_ptr<platform::PickList> makePickList(const Design& design,
                                                     PickListEvents events) override;
    Ref<platform::ImageList> makeImageList(const Design& design,
                                           const std::vector<Picture>& pictures) override;
    Ref<TalvikTabulet::Tabulet> makeTabulet(const Design& design, std::int16_t index,
                                            const TalvikTabulet::Tabulet* pattern,
                                            const TalvikTabulet::TabuletEvents& events) override;
    Ref<platform::Line> makeLine(const Design& design, std::int16_t index) override;
    Ref<platform::Shape> makeShape(const Design& design, std::int16_t index) override;
    platform::Font AmbientFont() const override;
    platform::Font ControlFont() const override;
    float TextWidth(const String& text) const override;
    float ScaleWidth() const override;
    float ScaleHeight() const override;
    std::uint32_t RegisterWindowMessage(const String& name) override;
    void SendMessage(std::uint32_t message, std::uintptr_t wParam, std::int32_t* lParam) override;

    // For the toolkit's own parts.
    void enrol(Object& object);
    void strike(Object& object);
    void moveFocus(Element* element);
    void beginDrag(Tabulet& table) { mDragged = &table; }
    void endDragOf(const Tabulet* table);
    std::string openMenu(const PopupMenu& menu);
    void runModal(Dialog& dialog);

private:
    void called(const char* member) const;
    Element* containerOf(const Design& design);

    std::map<std::string, Object*> mObjects;
    Element* mFocus = nullptr;
    Tabulet* mDragged = nullptr;
    std::vector<Dialog*> mDialogs;
    std::vector<MessageBox> mBoxes;
    std::vector<WindowMessage> mMessages;
    std::vector<String> mRegistered;
    bool mMenuOpen = false;
    bool mClosed = false;
    Surface mSurface;
};

} // namespace zandor::platform::headless
