#include "frontends/windows/toolkit/DragPicture.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Surroundings.h"

#include <algorithm>

namespace zandor::platform::windows {

namespace {

// In pixels of 96 to an inch
constexpr int picturesMargin = 6;
constexpr int widestPicture = 260;
constexpr POINT besideMouse{12, 8};

constexpr std::size_t mostNames = 8;
constexpr BYTE picturesOpacity = 220;

} // namespace

DragPicture::DragPicture(std::shared_ptr<Surroundings> around) : Window(std::move(around)) {
    create(nullptr, WS_POPUP,
           WS_EX_LAYERED | WS_EX_TRANSPARENT | WS_EX_TOPMOST | WS_EX_TOOLWINDOW | WS_EX_NOACTIVATE);
    SetLayeredWindowAttributes(hwnd(), 0, picturesOpacity, LWA_ALPHA);
}

std::shared_ptr<DragPicture> DragPicture::of(const Drags& drags) {
    const auto picture = std::make_shared<DragPicture>(drags.surroundings().shared_from_this());
    const auto& names = drags.names();
    picture->mLines.assign(names.begin(), names.begin() + static_cast<std::ptrdiff_t>(
                                                              std::min(names.size(), mostNames)));
    if (names.size() > mostNames) picture->mLines.push_back(u"\u2026");
    const SIZE size = picture->wanted();
    picture->place({0, 0, size.cx, size.cy});
    picture->follow();
    picture->show(true);
    return picture;
}

SIZE DragPicture::wanted() const {
    auto& around = surroundings();
    int width = 0;
    for (const String& line : mLines)
        width = std::max(width, around.fonts.widthOf(fontHandle(), line));
    const int edges = 2 * around.scale.pixels(picturesMargin);
    const int lines = static_cast<int>(mLines.size()) * around.fonts.heightOf(fontHandle());
    return {std::min(width, around.scale.pixels(widestPicture)) + edges, lines + edges / 2};
}

void DragPicture::follow() {
    POINT at{};
    if (!isAlive() || !GetCursorPos(&at)) return;
    const Scale& scale = surroundings().scale;
    SetWindowPos(hwnd(), nullptr, at.x + scale.pixels(besideMouse.x),
                 at.y + scale.pixels(besideMouse.y), 0, 0,
                 SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

LRESULT DragPicture::handle(const Message& message) {
    switch (message.id) {
    case WM_NCHITTEST: return HTTRANSPARENT;
    case WM_MOUSEACTIVATE: return MA_NOACTIVATE;
    case WM_ERASEBKGND: return 1;
    case WM_PRINTCLIENT:
    case WM_PAINT: {
        const Painting painting(hwnd(), message);
        const Buffer buffer(painting.dc(), area());
        fill(buffer.dc(), area(), systemColour(COLOR_WINDOW));
        frame(buffer.dc(), area(), systemColour(COLOR_HIGHLIGHT));
        const int edge = surroundings().scale.pixels(picturesMargin);
        const int height = surroundings().fonts.heightOf(fontHandle());
        RECT line = within(area(), edge, edge / 2, edge, 0);
        for (const String& text : mLines) {
            line.bottom = line.top + height;
            write(buffer.dc(), text, line, fontHandle(), systemColour(COLOR_WINDOWTEXT));
            line.top = line.bottom;
        }
        return 0;
    }
    default: return Window::handle(message);
    }
}

} // namespace zandor::platform::windows
