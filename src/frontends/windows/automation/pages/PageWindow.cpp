#include "frontends/windows/automation/pages/PageWindow.h"

#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/com/Text.h"
#include "frontends/windows/automation/pages/resource.h"

#include <new>

#include <commctrl.h>

namespace zandor::automation {

namespace {

using platform::String;

String textIn(HWND window) {
    String text(static_cast<std::size_t>(GetWindowTextLengthW(window)) + 1, u'\0');
    const int length = GetWindowTextW(window, reinterpret_cast<wchar_t*>(text.data()),
                                      static_cast<int>(text.size()));
    text.resize(static_cast<std::size_t>(length));
    return text;
}

const wchar_t* number(int of) { return MAKEINTRESOURCEW(of); }

INT_PTR CALLBACK leaveAll(HWND, UINT, WPARAM, LPARAM) { return FALSE; }

RECT placeIn(HWND dialog, HWND window) {
    RECT place{};
    GetWindowRect(window, &place);
    MapWindowPoints(nullptr, dialog, reinterpret_cast<POINT*>(&place), 2);
    return place;
}

void place(HWND window, LONG left, LONG top, LONG width, LONG height) {
    SetWindowPos(window, nullptr, left, top, width, height, SWP_NOZORDER | SWP_NOACTIVATE);
}

} // namespace

PageWindow::PageWindow(PageValues& values, std::function<void()> changed)
    : mValues(values), mChanged(std::move(changed)) {}

std::shared_ptr<PageWindow> PageWindow::open(HWND parent, PageValues& values,
                                             std::function<void()> changed) {
    INITCOMMONCONTROLSEX lists{sizeof lists, ICC_LISTVIEW_CLASSES};
    InitCommonControlsEx(&lists);
    std::shared_ptr<PageWindow> made(new PageWindow(values, std::move(changed)));
    made->mHandle = CreateDialogParamW(module::instance(), number(ZANDOR_PAGE), parent, &procedure,
                                       reinterpret_cast<LPARAM>(made.get()));
    if (!made->mHandle) throw std::bad_alloc();
    made->fill();
    return made;
}

SIZE PageWindow::wanted() {
    const HWND measured = CreateDialogParamW(module::instance(), number(ZANDOR_PAGE),
                                             GetDesktopWindow(), &leaveAll, 0);
    RECT area{};
    GetClientRect(measured, &area);
    DestroyWindow(measured);
    return {area.right, area.bottom};
}

PageWindow::~PageWindow() {
    if (mHandle) DestroyWindow(mHandle);
}

void PageWindow::move(const RECT& at) const {
    place(mHandle, at.left, at.top, at.right - at.left, at.bottom - at.top);
}

void PageWindow::fill() {
    mFilling = true;
    const HWND list = item(ZANDOR_PAGE_LIST);
    SendMessageW(list, LVM_SETEXTENDEDLISTVIEWSTYLE, 0, LVS_EX_FULLROWSELECT);
    wchar_t title[] = L"Property";
    LVCOLUMNW column{};
    column.mask = LVCF_TEXT | LVCF_SUBITEM;
    column.pszText = title;
    SendMessageW(list, LVM_INSERTCOLUMNW, 0, reinterpret_cast<LPARAM>(&column));
    wchar_t value[] = L"Value";
    column.pszText = value;
    column.iSubItem = 1;
    SendMessageW(list, LVM_INSERTCOLUMNW, 1, reinterpret_cast<LPARAM>(&column));
    for (std::size_t row = 0; row < mValues.size(); ++row) {
        String name(mValues.name(row));
        LVITEMW entry{};
        entry.mask = LVIF_TEXT;
        entry.iItem = static_cast<int>(row);
        entry.pszText = const_cast<wchar_t*>(wide(name));
        SendMessageW(list, LVM_INSERTITEMW, 0, reinterpret_cast<LPARAM>(&entry));
    }
    for (const wchar_t* const word : {L"True", L"False"})
        SendMessageW(item(ZANDOR_PAGE_FLAG), CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(word));
    mFilling = false;
    refresh();
    layOut();
    select(0);
}

void PageWindow::refresh() {
    mFilling = true;
    for (std::size_t row = 0; row < mValues.size(); ++row) show(row, mValues.text(row));
    mFilling = false;
    chosen(mRow);
}

void PageWindow::layOut() const {
    RECT area{};
    GetClientRect(mHandle, &area);
    RECT units{7, 4, 0, 0}; // the template's distances
    MapDialogRect(mHandle, &units);
    const LONG margin = units.left;
    const LONG gap = units.top;
    const RECT text = placeIn(mHandle, item(ZANDOR_PAGE_TEXT));
    const RECT label = placeIn(mHandle, item(ZANDOR_PAGE_LABEL));
    const LONG height = text.bottom - text.top;
    const LONG top = area.bottom - margin - height;
    const LONG lineHeight = label.bottom - label.top;
    const LONG width = area.right - margin - text.left;
    place(item(ZANDOR_PAGE_LABEL), margin, top + (height - lineHeight) / 2,
          label.right - label.left, lineHeight);
    place(item(ZANDOR_PAGE_TEXT), text.left, top, width, height);
    place(item(ZANDOR_PAGE_FLAG), text.left, top, width, 6 * height); // with its list
    const HWND list = item(ZANDOR_PAGE_LIST);
    place(list, margin, margin, area.right - 2 * margin, top - gap - margin);
    RECT inside{};
    GetClientRect(list, &inside);
    const int names = inside.right * 55 / 100;
    SendMessageW(list, LVM_SETCOLUMNWIDTH, 0, names);
    SendMessageW(list, LVM_SETCOLUMNWIDTH, 1, inside.right - names);
}

HWND PageWindow::editor() const {
    return item(mValues.isFlag(mRow) ? ZANDOR_PAGE_FLAG : ZANDOR_PAGE_TEXT);
}

void PageWindow::chosen(std::size_t row) {
    mFilling = true;
    mRow = row;
    const bool flag = mValues.isFlag(row);
    const String text = mValues.text(row);
    if (flag) {
        SendMessageW(item(ZANDOR_PAGE_FLAG), CB_SETCURSEL,
                     text == u"True" ? 0
                     : text.empty()  ? -1
                                     : 1,
                     0);
    } else {
        SetWindowTextW(item(ZANDOR_PAGE_TEXT), wide(text));
    }
    ShowWindow(item(ZANDOR_PAGE_FLAG), flag ? SW_SHOW : SW_HIDE);
    ShowWindow(item(ZANDOR_PAGE_TEXT), flag ? SW_HIDE : SW_SHOW);
    for (const int each : {ZANDOR_PAGE_FLAG, ZANDOR_PAGE_TEXT})
        EnableWindow(item(each), mValues.hasObjects());
    mFilling = false;
}

void PageWindow::typed() {
    const std::size_t row = mRow;
    const String text = textIn(editor());
    if (text == mValues.text(row)) return;
    mValues.want(row, text);
    show(row, text);
    mChanged(); // which may be the end of this
}

/// The other one of the two; of a text, its editor has the keyboard.
void PageWindow::toggle() {
    if (!mValues.hasObjects()) return;
    if (!mValues.isFlag(mRow)) return edit(mRow);
    SendMessageW(item(ZANDOR_PAGE_FLAG), CB_SETCURSEL, mValues.text(mRow) == u"True" ? 1 : 0, 0);
    typed();
}

void PageWindow::select(std::size_t row) const {
    const HWND list = item(ZANDOR_PAGE_LIST);
    LVITEMW entry{};
    entry.state = entry.stateMask = LVIS_SELECTED | LVIS_FOCUSED;
    SendMessageW(list, LVM_SETITEMSTATE, row, reinterpret_cast<LPARAM>(&entry));
    SendMessageW(list, LVM_ENSUREVISIBLE, row, FALSE);
}

void PageWindow::show(std::size_t row, const String& text) const {
    LVITEMW entry{};
    entry.iSubItem = 1;
    entry.pszText = const_cast<wchar_t*>(wide(text));
    SendMessageW(item(ZANDOR_PAGE_LIST), LVM_SETITEMTEXTW, row, reinterpret_cast<LPARAM>(&entry));
}

void PageWindow::edit(std::size_t row) {
    select(row);
    SetFocus(editor());
    if (!mValues.isFlag(row)) SendMessageW(editor(), EM_SETSEL, 0, -1);
}

void PageWindow::refuse(const PageValues::Refusal& refusal) {
    const auto meanwhile = shared_from_this();
    MessageBoxW(mHandle, wide(refusal.words), L"Zandor", MB_OK | MB_ICONWARNING);
    if (mHandle) edit(refusal.row);
}

bool PageWindow::isLeftBy(const MSG& message) const {
    if (message.message != WM_KEYDOWN || message.wParam != VK_TAB || GetKeyState(VK_CONTROL) < 0)
        return false;
    const bool back = GetKeyState(VK_SHIFT) < 0;
    const HWND stop = GetFocus();
    const HWND next = GetNextDlgTabItem(mHandle, stop, back);
    // The way goes round: the next one stands on the other side then.
    for (HWND each = back ? stop : next; each; each = GetWindow(each, GW_HWNDNEXT))
        if (each == (back ? next : stop)) return true;
    return false;
}

bool PageWindow::take(MSG& message) const {
    if (!IsChild(mHandle, message.hwnd)) return false;
    const bool dropped = SendMessageW(item(ZANDOR_PAGE_FLAG), CB_GETDROPPEDSTATE, 0, 0) != 0;
    const bool pressed = message.message == WM_KEYDOWN;
    // They press the frame's buttons, unless a list hangs open.
    if (pressed && (message.wParam == VK_RETURN || message.wParam == VK_ESCAPE)) {
        if (!dropped) return false;
        TranslateMessage(&message);
        DispatchMessageW(&message);
        return true;
    }
    return IsDialogMessageW(mHandle, &message) != FALSE;
}

bool PageWindow::notified(const NMHDR& what) {
    if (what.idFrom != ZANDOR_PAGE_LIST || mFilling) return false;
    switch (what.code) {
    case LVN_ITEMCHANGED: {
        const auto& change = reinterpret_cast<const NMLISTVIEW&>(what);
        if (change.iItem >= 0 && change.uNewState & LVIS_SELECTED)
            chosen(static_cast<std::size_t>(change.iItem));
        return true;
    }
    case NM_DBLCLK: toggle(); return true;
    case LVN_KEYDOWN: {
        const WORD key = reinterpret_cast<const NMLVKEYDOWN&>(what).wVKey;
        if (key == VK_F2) edit(mRow);
        if (key == VK_SPACE) toggle();
        return true;
    }
    default: return false;
    }
}

bool PageWindow::handle(UINT message, WPARAM w, LPARAM l) {
    switch (message) {
    case WM_SIZE: layOut(); return true;
    case WM_NOTIFY: return notified(*reinterpret_cast<const NMHDR*>(l));
    case WM_COMMAND: {
        const bool written = w == MAKEWPARAM(ZANDOR_PAGE_TEXT, EN_CHANGE) ||
                             w == MAKEWPARAM(ZANDOR_PAGE_FLAG, CBN_SELCHANGE);
        if (written && !mFilling) typed();
        return written;
    }
    case WM_NCDESTROY: // with its parent
        SetWindowLongPtrW(mHandle, DWLP_USER, 0);
        mHandle = nullptr;
        return false;
    default: return false;
    }
}

INT_PTR CALLBACK PageWindow::procedure(HWND dialog, UINT message, WPARAM w, LPARAM l) {
    if (message == WM_INITDIALOG) {
        SetWindowLongPtrW(dialog, DWLP_USER, l);
        return FALSE;
    }
    auto* const page = reinterpret_cast<PageWindow*>(GetWindowLongPtrW(dialog, DWLP_USER));
    if (!page || !page->mHandle) return FALSE;
    const auto meanwhile = page->weak_from_this().lock();
    return page->handle(message, w, l);
}

} // namespace zandor::automation
