#include "frontends/windows/toolkit/Frames.h"

#include "frontends/windows/toolkit/Buttons.h"
#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/GridWindow.h"
#include "frontends/windows/toolkit/Inputs.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>

namespace zandor::platform::windows {

namespace {

constexpr int childGap = 5; ///< between children, logical pixels

} // namespace

RowWindow::RowWindow(std::shared_ptr<Surroundings> around, HWND parent, bool outermost)
    : Window(std::move(around)), mOutermost(outermost) {
    create(parent, WS_CHILD | WS_CLIPCHILDREN | WS_CLIPSIBLINGS | (outermost ? 0 : WS_VISIBLE));
}

void RowWindow::add(Window& child) {
    child.beLaidOut();
    mChildren.push_back(child.weak_from_this());
    arrange();
}

int RowWindow::margin() const { return surroundings().scale.pixels(mOutermost ? 2 : 5); }

SIZE RowWindow::wanted() const {
    SIZE size{2 * margin(), 0};
    bool first = true;
    for (const auto& child : mChildren) {
        const auto held = child.lock();
        if (!held || !held->isAlive()) continue;
        const SIZE part = held->wanted();
        size.cx += part.cx + (first ? 0 : surroundings().scale.pixels(childGap));
        size.cy = std::max(size.cy, part.cy);
        first = false;
    }
    size.cy += 2 * margin();
    return size;
}

void RowWindow::arrange() {
    if (auto* const around = dynamic_cast<RowWindow*>(of(GetParent(hwnd())))) around->arrange();
    const RECT room = within(area(), margin(), margin(), margin(), margin());
    const int between = surroundings().scale.pixels(childGap);
    int taken = -between;
    int others = 0;
    for (const auto& child : mChildren)
        if (const auto held = child.lock()) {
            const bool button = dynamic_cast<ButtonWindow*>(held.get());
            taken += between + (button ? held->wanted().cx : 0);
            if (!button) ++others;
        }
    int left = room.left;
    for (const auto& child : mChildren)
        if (const auto held = child.lock()) {
            // What is no button has the room that buttons leave.
            const SIZE part = held->wanted();
            const bool button = dynamic_cast<ButtonWindow*>(held.get());
            const int width = button ? static_cast<int>(part.cx)
                                     : std::max(0, widthOf(room) - taken) / std::max(1, others);
            const bool frame = dynamic_cast<RowWindow*>(held.get());
            const int height = frame ? heightOf(room) : static_cast<int>(part.cy);
            const int top = room.top + (heightOf(room) - height) / 2;
            held->place({left, top, left + width, top + height});
            left += width + between;
        }
}

void RowWindow::escape() {
    for (const auto& child : mChildren) {
        const auto held = child.lock();
        if (auto* const row = dynamic_cast<RowWindow*>(held.get())) return row->escape();
        if (auto* const input = dynamic_cast<Input*>(held.get())) return input->escape();
    }
}

bool RowWindow::pressDefault() {
    for (const auto& child : mChildren) {
        const auto held = child.lock();
        auto* const button = dynamic_cast<ButtonWindow*>(held.get());
        if (!button || !button->isDefault() || !button->isEnabled()) continue;
        button->press();
        return true;
    }
    return false;
}

LRESULT RowWindow::handle(const Message& message) {
    switch (message.id) {
    case WM_SIZE: arrange(); return 0;
    case WM_ERASEBKGND: return 1;
    case WM_LBUTTONDOWN: return 0;
    case WM_CTLCOLORSTATIC: return reinterpret_cast<LRESULT>(GetSysColorBrush(COLOR_BTNFACE));
    case WM_PRINTCLIENT:
    case WM_PAINT: {
        const Painting painting(hwnd(), message);
        fill(painting.dc(), area(), systemColour(COLOR_BTNFACE));
        if (mOutermost) frame(painting.dc(), area(), systemColour(COLOR_HIGHLIGHT));
        return 0;
    }
    default: return Window::handle(message);
    }
}

Bounds RowFrame::bounds() const {
    Bounds result = Constituent::bounds();
    if (mSized) return result;
    const SIZE wanted = mWindow->wanted();
    result.Width = surroundings().scale.toTwips(wanted.cx);
    result.Height = surroundings().scale.toTwips(wanted.cy);
    return result;
}

void RowFrame::setBounds(const Bounds& wanted) {
    const Bounds now = bounds();
    mSized = mSized || wanted.Width != now.Width || wanted.Height != now.Height;
    Constituent::setBounds(wanted);
}

void RowFrame::Visible(bool value) {
    if (value && !mWindow->isLaidOut()) mWindow->place(surroundings().scale.toPixels(bounds()));
    // Spoken, of what is opened over a cell.
    if (value && mWindow->isOutermost() && surroundings().grid)
        SetWindowTextW(mWindow->hwnd(), wide(surroundings().grid->titleOfCurrent()));
    mWindow->show(value);
}

RowWindow* editorAround(HWND window) {
    for (Window* at = Window::around(window); at;
         at = Window::around(GetAncestor(at->hwnd(), GA_PARENT)))
        if (auto* const row = dynamic_cast<RowWindow*>(at); row && row->isOutermost()) return row;
    return nullptr;
}

} // namespace zandor::platform::windows
