#pragma once

#include "frontends/windows/toolkit/Drags.h"
#include "frontends/windows/toolkit/Focus.h"
#include "frontends/windows/toolkit/Fonts.h"
#include "frontends/windows/toolkit/Hints.h"
#include "frontends/windows/toolkit/KeyboardMenu.h"
#include "frontends/windows/toolkit/Navigation.h"
#include "frontends/windows/toolkit/Scale.h"
#include "frontends/windows/toolkit/Window.h"

#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/Words.h>

namespace zandor::platform::windows {

class Canvas;
class GridWindow;
class PopupMenu;
class ScrollBarWindow;
class TableWindow;

/// What the windows of one control share. It is there as long as one of them is, and so longer than
/// the toolkit where the host ends the control from within a message.
class Surroundings : public std::enable_shared_from_this<Surroundings> {
public:
    Surroundings(Toolkit& toolkit, int dpi, std::shared_ptr<void> keeper)
        : keeper(std::move(keeper)), scale(dpi), fonts(dpi), drags(*this), navigation(*this),
          comforts(toolkit) {}
    Surroundings(const Surroundings&) = delete;
    Surroundings& operator=(const Surroundings&) = delete;

    const std::shared_ptr<void> keeper; ///< of the host's; goes last
    Scale scale;
    Fonts fonts;
    Words words;
    Focus focus;
    KeyboardMenu menu;
    Drags drags;
    Hints hints;
    Navigation navigation;
    comforts::Comforts comforts;

    // The parts, as far as they are there.
    Window* surface = nullptr;
    Canvas* canvas = nullptr;
    GridWindow* grid = nullptr;
    ScrollBarWindow* across = nullptr;
    ScrollBarWindow* down = nullptr;
    Window* home = nullptr;
    TableWindow* currentTable = nullptr; ///< the activated one
    PopupMenu* contextMenu = nullptr;
    PopupMenu* openMenu = nullptr; ///< while it stands open

    // The host's, where it has some for what stands in it.
    std::optional<COLORREF> hostsGround, hostsInk;
    /// What the canvas is painted with, and its lines.
    COLORREF ground() const;
    COLORREF ink() const;

    /// Whether a window is the control's own or one in it.
    bool holds(HWND window) const;
    /// The focus has come into the control from elsewhere, or has gone there.
    std::function<void(bool has)> onFocus;
    /// Something modal opens (Modal.h); what comes back is called when it has closed.
    std::function<std::function<void()>()> onModal;

    /// The control's own window as a handle; nullptr: it has gone.
    HWND surfaceHandle() const { return surface ? surface->hwnd() : nullptr; }
    /// The part of the canvas that is not scrolled away or covered by bars and grid, in its own
    /// pixels.
    RECT seen() const;
    /// Scrolls the canvas, as far as the bars go.
    void scrollBy(POINT way) const;
    /// One step of the keyboard, of a drag at the edge.
    void scrollByStep(POINT direction) const;
    void scrollByWheel(const Message& message) const;
    /// Scrolls as little as shows a place of the canvas; of one larger than the view its beginning.
    void reveal(const RECT& place) const;
};

} // namespace zandor::platform::windows
