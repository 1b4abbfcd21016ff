#include "frontends/windows/toolkit/Buttons.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>

namespace zandor::platform::windows {

ButtonWindow::ButtonWindow(std::shared_ptr<Surroundings> around, HWND parent, Kind kind,
                           const String& caption, CommandButtonEvents events)
    : Window(std::move(around)), mKind(kind), mEvents(std::move(events)) {
    createNative(L"BUTTON", parent,
                 WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS |
                     (kind == Kind::home ? BS_OWNERDRAW : BS_PUSHBUTTON),
                 0, caption);
    if (kind == Kind::home) surroundings().home = this;
}

ButtonWindow::~ButtonWindow() {
    if (surroundings().home == this) surroundings().home = nullptr;
}

void ButtonWindow::forget() {
    mEvents = {};
    if (surroundings().home == this) surroundings().home = nullptr;
}

void ButtonWindow::setCaption(const String& caption) {
    SetWindowTextW(hwnd(), wide(caption));
    if (auto* const row = dynamic_cast<RowWindow*>(of(GetParent(hwnd())))) row->arrange();
}

void ButtonWindow::setDefault(bool value) {
    mDefault = value;
    if (mKind == Kind::caption)
        SendMessageW(hwnd(), BM_SETSTYLE, value ? BS_DEFPUSHBUTTON : BS_PUSHBUTTON, TRUE);
}

void ButtonWindow::press() {
    // A copy: what it does may end the button.
    if (const PlainEvent click = mEvents.Click; isEnabled() && click) click();
}

void ButtonWindow::gotFocus() {
    if (const PlainEvent got = mEvents.GotFocus) got();
}

SIZE ButtonWindow::wanted() const {
    const Scale& scale = surroundings().scale;
    const int text = surroundings().fonts.widthOf(fontHandle(), textOf(hwnd()));
    return {std::max<LONG>(scale.pixels(49), text + scale.pixels(18)),
            surroundings().fonts.heightOf(fontHandle()) + scale.pixels(9)};
}

std::optional<LRESULT> ButtonWindow::told(const Message& message) {
    if (message.id == WM_DRAWITEM) {
        drawHome(*reinterpret_cast<const DRAWITEMSTRUCT*>(message.l));
        return TRUE;
    }
    if (message.id != WM_COMMAND || HIWORD(message.w) != BN_CLICKED) return {};
    press();
    return 0;
}

LRESULT ButtonWindow::handle(const Message& message) {
    if (message.id == WM_KEYDOWN && message.w == VK_RETURN && surroundings().holds(hwnd())) {
        press();
        return 0;
    }
    if (message.id == WM_KEYDOWN && message.w == VK_ESCAPE)
        // Beside an input, Escape is the input's as well.
        if (auto* const row = dynamic_cast<RowWindow*>(of(GetParent(hwnd())))) {
            row->escape();
            return 0;
        }
    return Window::handle(message);
}

void ButtonWindow::drawHome(const DRAWITEMSTRUCT& item) const {
    const Buffer buffer(item.hDC, item.rcItem);
    const bool down = item.itemState & ODS_SELECTED;
    RECT place = item.rcItem;
    DrawFrameControl(buffer.dc(), &place, DFC_BUTTON, DFCS_BUTTONPUSH | (down ? DFCS_PUSHED : 0));
    const COLORREF colour =
        systemColour(item.itemState & ODS_DISABLED ? COLOR_GRAYTEXT : COLOR_BTNTEXT);
    // An arrow into the upper left corner.
    const int side = std::min({widthOf(place), heightOf(place), surroundings().scale.pixels(20)}) -
                     surroundings().scale.pixels(8);
    const int left = place.left + (widthOf(place) - side) / 2 + (down ? 1 : 0);
    const int top = place.top + (heightOf(place) - side) / 2 + (down ? 1 : 0);
    const int width = surroundings().scale.pixels(1);
    line(buffer.dc(), {left, top}, {left + side, top + side}, colour, width);
    line(buffer.dc(), {left, top}, {left, top + side * 2 / 3}, colour, width);
    line(buffer.dc(), {left, top}, {left + side * 2 / 3, top}, colour, width);
    if (item.itemState & ODS_FOCUS) frame(buffer.dc(), place, systemColour(COLOR_HIGHLIGHT), 2);
}

} // namespace zandor::platform::windows
