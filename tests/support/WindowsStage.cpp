#include "frontends/windows/toolkit/CanvasItems.h"
#include "frontends/windows/toolkit/Dialog.h"
#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/Grid.h"
#include "frontends/windows/toolkit/Inputs.h"
#include "frontends/windows/toolkit/PickList.h"
#include "frontends/windows/toolkit/PopupMenu.h"
#include "frontends/windows/toolkit/ScrollBar.h"
#include "frontends/windows/toolkit/TableWindow.h"
#include "frontends/windows/toolkit/Text.h"
#include "support/Stage.h"
#include "support/StageEvents.h"
#include "support/WindowsHands.h"
#include "support/WindowsLook.h"

#include <Zandor/windows/WindowControl.h>

#include <gtest/gtest.h>

#include <optional>
#include <stdexcept>

using namespace zandor;

namespace {

namespace toolkit = platform::windows;
using toolkit::Window;

constexpr float twipsPerPixel = 15; // of a screen of 96 to an inch, as Wine's is

POINT pixels(float x, float y) {
    return {static_cast<LONG>(x / twipsPerPixel), static_cast<LONG>(y / twipsPerPixel)};
}

/// A place somewhere in a window, in its own pixels.
struct Spot {
    HWND window = nullptr;
    POINT at{};
};

class WindowsStage final : public Stage {
public:
    explicit WindowsStage(TalvikZandorLib::Library& library);
    ~WindowsStage() override;

    TalvikDBxZandor::Zandor& control() override { return mControl->control(); }
    platform::Toolkit& toolkit() override { return mControl->toolkit(); }
    comforts::Comforts& comforts() override { return mControl->comforts(); }
    void closeControl() override {
        mControl.reset();
        settle();
    }

    bool exists(const std::string& name) override {
        return find(name) || findItem(name) || findEntry(name);
    }
    Seen look(const std::string& name) override;
    String cell(std::int32_t row, std::int32_t col) override {
        return std::as_const(grid().cells()).cell(row, col).text;
    }
    String note(std::int32_t row, std::int32_t col) override {
        return std::as_const(grid().cells()).cell(row, col).note;
    }

    void resizeControl(float width, float height) override {
        const POINT size = pixels(width, height);
        mControl->setBounds({0, 0, size.x, size.y});
        settle();
    }
    void repaint() override {
        RedrawWindow(mControl->window(), nullptr, nullptr, RDW_INTERNALPAINT);
        settle();
    }
    void clickButton(const std::string& name) override {
        const HWND button = window<Window>(name).hwnd();
        hands::click(button, hands::middleOf(button));
        settle();
    }
    void focus(const std::string& name) override {
        SetFocus(focusable(window<Window>(name)));
        settle();
    }
    void scrollBarTo(const std::string& name, std::int16_t value) override {
        auto& bar = window<toolkit::ScrollBarWindow>(name);
        SetFocus(bar.hwnd());
        const bool lying = bar.orientation() == platform::Orientation::horizontal;
        if (bar.isAlive() && bar.isEnabled())
            SendMessageW(GetParent(bar.hwnd()), lying ? WM_HSCROLL : WM_VSCROLL,
                         MAKEWPARAM(SB_THUMBPOSITION, value), reinterpret_cast<LPARAM>(bar.hwnd()));
        settle();
    }
    void moveTable(std::int16_t index, float left, float top) override {
        const platform::Bounds from = look(tableName(index)).bounds;
        auto& box = table(index);
        const RECT title = box.titleBar();
        gesture(box.hwnd(), {title.right / 2, title.bottom / 2},
                pixels(left - from.Left, top - from.Top));
    }
    void resizeTable(std::int16_t index, float width, float height) override {
        const platform::Bounds from = look(tableName(index)).bounds;
        auto& box = table(index);
        gesture(box.hwnd(), {box.area().right - 2, box.area().bottom - 2},
                pixels(width - from.Width, height - from.Height));
    }
    void closeTable(std::int16_t index) override {
        auto& box = table(index);
        const RECT cross = box.crossPlace();
        hands::click(box.hwnd(), {(cross.left + cross.right) / 2, (cross.top + cross.bottom) / 2});
        settle();
    }
    void scrollList(std::int16_t index, std::int32_t firstEntry) override {
        PostMessageW(table(index).list().hwnd(), WM_VSCROLL,
                     MAKEWPARAM(SB_THUMBPOSITION, firstEntry - 1), 0);
        settle();
    }
    void scrollGrid(std::int32_t topRow, std::int32_t leftCol) override {
        PostMessageW(grid().hwnd(), WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, topRow), 0);
        PostMessageW(grid().hwnd(), WM_HSCROLL, MAKEWPARAM(SB_THUMBPOSITION, leftCol), 0);
        settle();
    }
    void selectEntries(std::int16_t index, const std::vector<std::int32_t>& entries) override {
        auto& list = table(index).list();
        for (const int row : list.selected()) list.select(row, false);
        for (const std::int32_t entry : entries) list.select(entry - 1, true);
    }
    void pressEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        press(entrySpot(index, entry), button);
    }
    void releaseEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        release(entrySpot(index, entry), button);
    }
    void moveOverEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        // By a pixel, for the system tells of moves where there are none.
        Spot spot = entrySpot(index, entry);
        ++spot.at.x;
        move(spot, button);
    }
    void doubleClickEntry(std::int16_t index, std::int32_t entry) override {
        const Spot spot = entrySpot(index, entry);
        press(spot, 1);
        release(spot, 1);
        hands::mouse(spot.window, WM_LBUTTONDBLCLK, spot.at, MK_LBUTTON);
        settle();
        release(spot, 1);
    }
    void dragToEntry(std::int16_t from, std::int32_t entry, std::int16_t to,
                     std::int32_t target) override {
        drag(from, entry, {}, entrySpot(to, target));
    }
    void dragAcross(std::int16_t from, std::int32_t entry, std::int16_t across, std::int32_t passed,
                    std::int32_t row, std::int32_t col) override {
        drag(from, entry, entrySpot(across, passed), cellSpot(row, col));
    }
    void dragToCell(std::int16_t from, std::int32_t entry, std::int32_t row,
                    std::int32_t col) override {
        drag(from, entry, {}, cellSpot(row, col));
    }
    void pressCanvas(std::int16_t button, float x, float y) override {
        press({window<toolkit::Canvas>("fraTable").hwnd(), pixels(x, y)}, button);
    }
    void releaseCanvas(std::int16_t button, float x, float y) override {
        release({window<toolkit::Canvas>("fraTable").hwnd(), pixels(x, y)}, button);
    }
    void pressCell(std::int16_t button, std::int32_t row, std::int32_t col) override {
        press(cellSpot(row, col), button);
    }
    void releaseCell(std::int16_t button, std::int32_t row, std::int32_t col) override {
        release(cellSpot(row, col), button);
    }
    void type(const std::string& name, const String& text) override {
        const HWND input = window<toolkit::TextWindow>(name).hwnd();
        SetFocus(input);
        SendMessageW(input, EM_SETSEL, 0, -1);
        if (text.empty()) hands::key(input, VK_DELETE, 0, [this] { settle(); });
        for (const char16_t unit : text) PostMessageW(input, WM_CHAR, unit, 1);
        settle();
    }
    void choose(const std::string& name, std::int16_t listIndex) override {
        auto& list = window<toolkit::ChoiceWindow>(name);
        if (!list.isEnabled()) return;
        SetFocus(list.hwnd());
        hands::key(list.hwnd(), VK_HOME, 0, [this] { settle(); });
        for (std::int16_t i = 0; i < listIndex; ++i)
            hands::key(list.hwnd(), VK_DOWN, 0, [this] { settle(); });
    }
    void pick(const std::string& name, std::int16_t listIndex) override;
    void key(const std::string& name, std::int16_t keyCode, std::int16_t shift) override {
        keyTo(focusable(window<Window>(name)), keyCode, shift);
    }
    void typeInGrid(const String& text) override {
        SetFocus(grid().hwnd());
        for (const char16_t unit : text) {
            PostMessageW(GetFocus(), WM_CHAR, unit, 1);
            settle();
        }
    }
    void pickField(const String& text) override {
        const HWND box = window<toolkit::PickWindow>("lstFields").box().hwnd();
        for (const char16_t unit : text) PostMessageW(box, WM_CHAR, unit, 1);
        settle();
        hands::key(box, VK_RETURN, 0, [this] { settle(); });
    }
    void clickField(std::int32_t col) override {
        pressCell(1, 0, col);
        releaseCell(1, 0, col);
    }
    void dragField(std::int32_t col, std::int32_t to) override {
        const Spot from = cellSpot(0, col);
        // Past the middle of the other column, so that this one takes its place.
        const RECT target = grid().cellPlace(0, to);
        const LONG x = to > col ? target.right - 6 : target.left + 6;
        const Spot end{from.window, {x, (target.top + target.bottom) / 2}};
        press(from, 1);
        move(end, 1);
        held();
        release(end, 1);
    }
    void dragBorder(std::int32_t col, float width) override {
        const RECT cell = grid().cellPlace(0, col);
        const Spot border{grid().hwnd(), {cell.right - 1, (cell.top + cell.bottom) / 2}};
        if (width == 0) {
            hands::mouse(border.window, WM_LBUTTONDBLCLK, border.at, MK_LBUTTON);
            settle();
            return release(border, 1);
        }
        Spot end = border;
        end.at.x += pixels(width, 0).x - (cell.right - cell.left);
        press(border, 1);
        move(end, 1);
        held();
        release(end, 1);
    }
    void editCell() override { keyTo(grid().hwnd(), VK_F2, 0); }
    void moveCurrentColumn(std::int32_t step) override {
        keyTo(grid().hwnd(), step < 0 ? VK_LEFT : VK_RIGHT, 4);
    }
    void leaveControl() override {
        SetFocus(mHostField);
        settle();
    }

private:
    static std::string tableName(int index) { return "lstTable(" + std::to_string(index) + ")"; }
    static HWND focusable(Window& given) {
        if (const auto* const table = dynamic_cast<toolkit::TableWindow*>(&given))
            return table->list().hwnd();
        if (const auto* const list = dynamic_cast<toolkit::PickWindow*>(&given))
            return list->box().hwnd();
        return given.hwnd();
    }

    void settle() { hands::pump(mDialog); }
    toolkit::Surroundings& surroundings() const {
        return Window::of(mControl->window())->surroundings();
    }

    Window* find(const std::string& name) const;
    toolkit::CanvasItem* findItem(const std::string& name) const;
    std::shared_ptr<const toolkit::MenuItem> findEntry(const std::string& name) const;
    template <class W>
    W& window(const std::string& name) const {
        if (auto* const found = dynamic_cast<W*>(find(name))) return *found;
        throw std::logic_error("there is no " + name);
    }
    toolkit::TableWindow& table(int index) const {
        return window<toolkit::TableWindow>(tableName(index));
    }
    toolkit::GridWindow& grid() const { return window<toolkit::GridWindow>("sprColumn"); }

    Spot entrySpot(int index, std::int32_t entry) const;
    Spot cellSpot(std::int32_t row, std::int32_t col) const;
    void press(const Spot& spot, std::int16_t button);
    void move(const Spot& spot, std::int16_t buttons);
    void release(const Spot& spot, std::int16_t button);
    void keyTo(HWND window, int keyCode, std::int16_t shift) {
        SetFocus(window);
        hands::key(window, keyCode, shift, [this] { settle(); });
    }
    void gesture(HWND box, POINT grip, POINT way);
    void drag(std::int16_t from, std::int32_t entry, const Spot& across, const Spot& to);
    void carry(toolkit::Drags& drags);
    void held() const {
        if (onHeld) onHeld();
    }

    // What opens, answered from within its own message loop.
    static LRESULT CALLBACK activated(int code, WPARAM w, LPARAM l);
    static LRESULT CALLBACK overheard(HWND window, UINT message, WPARAM w, LPARAM l);
    static LRESULT CALLBACK backstage(HWND window, UINT message, WPARAM w, LPARAM l);
    void boxOpened(HWND box);
    void menuOpened();
    void dialogOpened(HWND dialog);

    static constexpr UINT menuMessage = WM_APP + 1;
    static constexpr UINT dialogMessage = WM_APP + 2;
    static constexpr UINT boxMessage = WM_APP + 3;
    static inline WindowsStage* sStage = nullptr;
    static inline WNDPROC sControls = nullptr; ///< procedure of a control's own window

    StageEvents mEvents;
    HWND mHost = nullptr;
    HWND mHostField = nullptr;
    HWND mDialog = nullptr;  ///< the join dialog while it stands open
    std::vector<POINT> mWay; ///< of a drag that begins now, on the screen; empty: it is given up
    bool mMenuSeen = false;
    HHOOK mActivated = nullptr;
    WindowsStage* const mBefore = sStage; ///< a test may have two
    std::optional<toolkit::WindowControl> mControl;
};

WindowsStage::WindowsStage(TalvikZandorLib::Library& library) : mEvents(*this) {
    sStage = this;
    mActivated = SetWindowsHookExW(WH_CBT, &activated, nullptr, GetCurrentThreadId());
    const wchar_t* const hosts = hands::hostClass(&backstage);
    mHost = CreateWindowExW(0, hosts, L"Host", WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN, 60, 40, 840,
                            700, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    mHostField = CreateWindowExW(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE | WS_TABSTOP, 0, 640, 100,
                                 20, mHost, nullptr, nullptr, nullptr);
    mControl.emplace(mHost, library, mEvents);
    // Not by a hook, of which each message of each window would have to be asked.
    sControls = reinterpret_cast<WNDPROC>(SetWindowLongPtrW(
        mControl->window(), GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&overheard)));
    surroundings().drags.setCarrier([this](toolkit::Drags& drags) { carry(drags); }); // its mouse
    mControl->setBounds({0, 0, 800, 600});
    mControl->show(true);
    ShowWindow(mHost, SW_SHOWNORMAL);
    SetForegroundWindow(mHost);
    settle();
}

WindowsStage::~WindowsStage() {
    closeControl();
    DestroyWindow(mHost);
    settle();
    UnhookWindowsHookEx(mActivated);
    sStage = mBefore;
}

Window* WindowsStage::find(const std::string& name) const {
    return hands::findPart(platform::fromUtf8(name), mControl ? mControl->window() : nullptr);
}

toolkit::CanvasItem* WindowsStage::findItem(const std::string& name) const {
    const auto* const canvas = mControl ? surroundings().canvas : nullptr;
    if (!canvas) return nullptr;
    for (toolkit::CanvasItem* item : canvas->items())
        if (platform::toUtf8(item->name()) == name) return item;
    return nullptr;
}

std::shared_ptr<const toolkit::MenuItem> WindowsStage::findEntry(const std::string& name) const {
    const auto* const menu = mControl ? surroundings().contextMenu : nullptr;
    if (!menu) return {};
    for (const auto& item : menu->items())
        if (platform::toUtf8(item->name) == name) return item;
    return {};
}

Stage::Seen WindowsStage::look(const std::string& name) {
    settle();
    Seen seen;
    if (const auto entry = findEntry(name)) {
        seen.text = entry->caption;
        seen.enabled = entry->enabled;
        seen.visible = entry->visible;
    } else if (const auto* const item = findItem(name)) {
        hands::lookAt(*item, seen);
    } else if (Window* const part = find(name)) {
        // What the control takes for its place is what stands on the screen.
        const auto* const frame = dynamic_cast<toolkit::RowWindow*>(part);
        seen.bounds = part->bounds();
        if (!part->isLaidOut() && IsWindowVisible(part->hwnd()) && GetParent(part->hwnd()) &&
            !dynamic_cast<toolkit::FormWindow*>(part)) {
            const RECT stands = part->placeInParent();
            const RECT wanted = surroundings().scale.toPixels(seen.bounds);
            EXPECT_TRUE(EqualRect(&stands, &wanted) || frame) << name;
        }
        seen.visible = IsWindowVisible(part->hwnd());
        seen.enabled = part->isEnabled();
        seen.focused = GetFocus() == focusable(*part);
        seen.font = part->font().Name;
        hands::lookAtKind(*part, seen);
    } else {
        ADD_FAILURE() << "there is no " << name;
    }
    return seen;
}

void WindowsStage::pick(const std::string& name, std::int16_t listIndex) {
    const HWND combo = window<toolkit::ChoiceWindow>(name).hwnd();
    // The button that has opened the editor comes up before.
    ReleaseCapture();
    settle();
    if (!SendMessageW(combo, CB_GETDROPPEDSTATE, 0, 0)) {
        hands::click(combo, hands::middleOf(combo));
        settle();
    }
    COMBOBOXINFO info{};
    info.cbSize = sizeof info;
    GetComboBoxInfo(combo, &info);
    RECT item{};
    SendMessageW(info.hwndList, LB_GETITEMRECT, static_cast<WPARAM>(listIndex),
                 reinterpret_cast<LPARAM>(&item));
    const POINT at{(item.left + item.right) / 2, (item.top + item.bottom) / 2};
    hands::mouse(info.hwndList, WM_MOUSEMOVE, at, 0);
    hands::click(info.hwndList, at);
    settle();
}

Spot WindowsStage::entrySpot(int index, std::int32_t entry) const {
    auto& list = table(index).list();
    const RECT inside = list.area();
    if (entry == 0) return {list.hwnd(), {inside.right / 2, inside.bottom - 4}};
    const RECT row = list.placeOf(entry - 1);
    RECT shown{};
    if (!IntersectRect(&shown, &row, &inside))
        throw std::logic_error("the entry is scrolled out of view");
    return {list.hwnd(), {(shown.left + shown.right) / 2, (shown.top + shown.bottom) / 2}};
}

Spot WindowsStage::cellSpot(std::int32_t row, std::int32_t col) const {
    const RECT cell = grid().cellPlace(row, col);
    const RECT inside = grid().area();
    RECT shown{};
    if (!IntersectRect(&shown, &cell, &inside))
        throw std::logic_error("the cell is scrolled out of view");
    return {grid().hwnd(), {(shown.left + shown.right) / 2, (shown.top + shown.bottom) / 2}};
}

void WindowsStage::press(const Spot& spot, std::int16_t button) {
    // Cells are left out: an editor opened over one cell may cover its neighbours.
    if (spot.window != grid().hwnd()) {
        POINT at = spot.at;
        MapWindowPoints(spot.window, mControl->window(), &at, 1);
        RECT all{};
        GetClientRect(mControl->window(), &all);
        EXPECT_TRUE(!PtInRect(&all, at) || hands::windowAt(mControl->window(), at) == spot.window)
            << "something covers the place pressed";
    }
    hands::mouse(spot.window, hands::pressOf(button), spot.at, hands::keysOf(button));
    settle();
}

void WindowsStage::move(const Spot& spot, std::int16_t buttons) {
    hands::mouse(spot.window, WM_MOUSEMOVE, spot.at, hands::keysOf(buttons));
    settle();
}

void WindowsStage::release(const Spot& spot, std::int16_t button) {
    // Whoever has captured the mouse gets it.
    POINT at = spot.at;
    const HWND captured = GetCapture();
    if (captured && captured != spot.window) MapWindowPoints(spot.window, captured, &at, 1);
    hands::mouse(captured ? captured : spot.window, hands::releaseOf(button), at, 0);
    settle();
}

void WindowsStage::gesture(HWND box, POINT grip, POINT way) {
    // The mouse moves on the screen while the box moves below it.
    POINT start = grip;
    ClientToScreen(box, &start);
    const auto at = [&](int share) {
        POINT place{start.x + way.x * share / 2, start.y + way.y * share / 2};
        ScreenToClient(box, &place);
        return place;
    };
    hands::mouse(box, WM_LBUTTONDOWN, grip, MK_LBUTTON);
    settle();
    for (const int share : {1, 2})
        if (IsWindow(box)) {
            hands::mouse(box, WM_MOUSEMOVE, at(share), MK_LBUTTON);
            settle();
        }
    held();
    if (IsWindow(box)) hands::mouse(box, WM_LBUTTONUP, at(2), 0);
    settle();
}

void WindowsStage::drag(std::int16_t from, std::int32_t entry, const Spot& across, const Spot& to) {
    const Spot start = entrySpot(from, entry);
    for (const Spot& spot : {across, to}) {
        if (!spot.window) continue;
        POINT at = spot.at;
        ClientToScreen(spot.window, &at);
        mWay.push_back(at);
    }
    POINT end = mWay.back();
    press(start, 1);
    move({start.window, {start.at.x + 1, start.at.y}}, 1);
    // Where no drag has begun the button is still down.
    const bool carried = mWay.empty();
    mWay.clear();
    if (!carried && ScreenToClient(start.window, &end))
        hands::mouse(start.window, WM_LBUTTONUP, end, 0);
    settle();
}

void WindowsStage::carry(toolkit::Drags& drags) {
    const auto way = std::exchange(mWay, {});
    for (const POINT& at : way) {
        drags.moved(at);
        settle();
    }
    if (way.empty()) return;
    held();
    drags.letGo(way.back());
}

LRESULT CALLBACK WindowsStage::activated(int code, WPARAM w, LPARAM l) {
    const HWND window = reinterpret_cast<HWND>(w);
    wchar_t kind[16] = {};
    if (sStage && code == HCBT_ACTIVATE && GetClassNameW(window, kind, 16) &&
        lstrcmpW(kind, L"#32770") == 0) {
        // Its texts and buttons come later; by the time that its loop runs they are there.
        if (!Window::of(window))
            PostMessageW(sStage->mHost, boxMessage, w, 0);
        else if (sStage->mDialog != window)
            PostMessageW(sStage->mHost, dialogMessage,
                         reinterpret_cast<WPARAM>(sStage->mDialog = window), 0);
    }
    if (sStage && code == HCBT_DESTROYWND && window == sStage->mDialog) sStage->mDialog = nullptr;
    return CallNextHookEx(nullptr, code, w, l);
}

LRESULT CALLBACK WindowsStage::overheard(HWND window, UINT message, WPARAM w, LPARAM l) {
    static const UINT registered = RegisterWindowMessageA("TALVIKDISABLEVELT");
    WindowsStage* stage = sStage;
    while (stage && !(stage->mControl && stage->mControl->window() == window))
        stage = stage->mBefore;
    if (stage && message == registered) {
        const bool open = stage->surroundings().openMenu != nullptr;
        stage->messages.push_back({u"TALVIKDISABLEVELT", w, open});
        stage->transcript.push_back("message:" + std::to_string(w));
    } else if (stage && message == WM_ENTERIDLE && w == MSGF_MENU &&
               !std::exchange(stage->mMenuSeen, true)) {
        PostMessageW(stage->mHost, menuMessage, 0, 0);
    } else if (stage && message == WM_EXITMENULOOP) {
        stage->mMenuSeen = false;
    }
    return CallWindowProcW(sControls, window, message, w, l);
}

LRESULT CALLBACK WindowsStage::backstage(HWND window, UINT message, WPARAM w, LPARAM l) {
    if (sStage && message == menuMessage) return sStage->menuOpened(), 0;
    if (sStage && message == boxMessage) return sStage->boxOpened(reinterpret_cast<HWND>(w)), 0;
    if (sStage && message == dialogMessage)
        return sStage->dialogOpened(reinterpret_cast<HWND>(w)), 0;
    return DefWindowProcW(window, message, w, l);
}

void WindowsStage::boxOpened(HWND box) {
    // A box that comes to the front again has been answered already.
    if (!IsWindow(box) || GetPropW(box, L"ZandorStageSeen")) return;
    SetPropW(box, L"ZandorStageSeen", box);
    const Box seen = hands::readBox(box);
    boxes.push_back(seen);
    transcript.push_back("box:" + platform::toUtf8(seen.text));
    PostMessageW(FindWindowExW(box, nullptr, L"Button", nullptr), BM_CLICK, 0, 0);
}

void WindowsStage::menuOpened() {
    const HWND owner = mControl ? mControl->window() : nullptr;
    const auto* const menu = mControl ? surroundings().openMenu : nullptr;
    if (!menu) return;
    transcript.push_back("menu");
    const auto items = menu->items();
    std::vector<Entry> entries;
    for (const auto& item : items)
        entries.push_back({item->name, item->caption, item->enabled, item->visible});
    const String chosen = onMenu ? onMenu(entries) : String();
    // By keys: down to the entry, past separators and what is not shown.
    bool found = false;
    bool choosable = false;
    int steps = 0;
    for (const auto& item : items) {
        if (!item->visible || item->isSeparator()) continue;
        ++steps;
        if (item->name != chosen) continue;
        found = true;
        choosable = item->isChoosable();
        break;
    }
    for (int i = 0; found && i < steps; ++i) PostMessageW(owner, WM_KEYDOWN, VK_DOWN, 1);
    if (found) PostMessageW(owner, WM_KEYDOWN, VK_RETURN, 1);
    // An entry that is disabled leaves the menu open.
    if (!choosable) PostMessageW(owner, WM_KEYDOWN, VK_ESCAPE, 1);
}

void WindowsStage::dialogOpened(HWND dialog) {
    transcript.push_back("dialog");
    if (onDialog) onDialog();
    if (IsWindow(dialog) && IsWindowVisible(dialog)) PostMessageW(dialog, WM_KEYDOWN, VK_ESCAPE, 1);
}

} // namespace

std::unique_ptr<Stage> Stage::open(TalvikZandorLib::Library& library) {
    return std::make_unique<WindowsStage>(library);
}
