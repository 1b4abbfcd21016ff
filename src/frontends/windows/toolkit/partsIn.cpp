#include "frontends/windows/toolkit/partsIn.h"

namespace zandor::platform::windows {

namespace {

using Parts = std::vector<std::shared_ptr<Window>>;

BOOL CALLBACK add(HWND handle, LPARAM parts) {
    Window* const part = Window::of(handle);
    if (part && part->isAlive())
        reinterpret_cast<Parts*>(parts)->push_back(part->shared_from_this());
    return TRUE;
}

} // namespace

std::vector<std::shared_ptr<Window>> partsIn(HWND outer) {
    Parts parts;
    if (outer) EnumChildWindows(outer, &add, reinterpret_cast<LPARAM>(&parts));
    return parts;
}

} // namespace zandor::platform::windows
