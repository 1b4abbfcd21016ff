#include <Zandor/windows/WindowControl.h>

#include "frontends/windows/toolkit/WindowsToolkit.h"
#include "frontends/windows/toolkit/print.h"

#include <optional>

namespace zandor::platform::windows {

struct WindowControl::House final : TalvikDBxZandor::ZandorEvents {
    House(HWND parent, TalvikDBxZandor::ZandorEvents& host, std::shared_ptr<void> keeper)
        : toolkit(parent, std::move(keeper)), host(host) {}

    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override {
        if (toolkit.comforts().raised(event, arguments)) host.Raise(event, arguments);
    }

    WindowsToolkit toolkit;
    TalvikDBxZandor::ZandorEvents& host;
    std::optional<TalvikDBxZandor::Zandor> control;
};

WindowControl::WindowControl(HWND parent, TalvikZandorLib::Library& library,
                             TalvikDBxZandor::ZandorEvents& events, std::shared_ptr<void> keeper)
    : mHouse(std::make_shared<House>(parent, events, std::move(keeper))) {
    mHouse->control.emplace(mHouse->toolkit, library, *mHouse, mHouse);
    // Not held by itself: it ends with this.
    House& house = *mHouse;
    house.toolkit.comforts().attach(*house.control);
    house.toolkit.onResize([&house] { house.control->UserControl_Resize(); });
    house.toolkit.onPaint([&house] { house.control->UserControl_Paint(); });
    setWords({});
    house.control->UserControl_Resize();
}

WindowControl::~WindowControl() {
    mHouse->toolkit.onResize(nullptr);
    mHouse->toolkit.onPaint(nullptr);
    mHouse->toolkit.comforts().detach();
    mHouse->control->End();
    mHouse->toolkit.dismiss();
}

TalvikDBxZandor::Zandor& WindowControl::control() const { return *mHouse->control; }

Toolkit& WindowControl::toolkit() const { return mHouse->toolkit; }

comforts::Comforts& WindowControl::comforts() const { return mHouse->toolkit.comforts(); }

HWND WindowControl::window() const { return mHouse->toolkit.window(); }

void WindowControl::setBounds(const RECT& place) const { mHouse->toolkit.setBounds(place); }

void WindowControl::show(bool value) const { mHouse->toolkit.show(value); }

void WindowControl::setFont(HFONT font) const { mHouse->toolkit.setFont(font); }

void WindowControl::onLeave(std::function<bool(bool next)> leave) const {
    mHouse->toolkit.onLeave(std::move(leave));
}

void WindowControl::onFocus(std::function<void(bool has)> change) const {
    mHouse->toolkit.onFocus(std::move(change));
}

void WindowControl::onModal(std::function<std::function<void()>()> open) const {
    mHouse->toolkit.onModal(std::move(open));
}

void WindowControl::setColours(std::optional<COLORREF> ground, std::optional<COLORREF> ink) const {
    mHouse->toolkit.setColours(ground, ink);
}

void WindowControl::setSilent(bool value) const { mHouse->toolkit.setSilent(value); }

void WindowControl::print(HDC dc) const {
    if (const HWND own = window()) windows::print(own, dc);
}

bool WindowControl::hasUseFor(const MSG& message) const {
    if (!mHouse->toolkit.surroundings().holds(message.hwnd)) return false;
    const Window* const part = Window::around(message.hwnd);
    switch (message.message) {
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        return part && part->isAlive() && part->hasUseFor(message.wParam, shiftState());
    case WM_CHAR: return true;
    default: return false;
    }
}

void WindowControl::close() const { mHouse->toolkit.close(); }

void WindowControl::setWords(const Words& words) const {
    mHouse->toolkit.setWords(words);
    mHouse->control->Words(words);
    mHouse->toolkit.comforts().setWords(words);
}

} // namespace zandor::platform::windows
