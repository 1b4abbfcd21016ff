#include "frontends/windows/toolkit/Window.h"

#include "frontends/windows/toolkit/Accessible.h"
#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/Surroundings.h"
#include "frontends/windows/toolkit/Text.h"

#include <new>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr wchar_t ownClass[] = L"ZandorPart";

/// Whoever this code belongs to, a program or a library.
HINSTANCE instance() {
    HMODULE module = nullptr;
    GetModuleHandleExW(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                           GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                       reinterpret_cast<const wchar_t*>(&instance), &module);
    return module;
}

/// The class of our own windows, for as long as this code is there: the system keeps that of a
/// library that has gone.
class OwnClass {
public:
    explicit OwnClass(WNDPROC procedure) {
        WNDCLASSEXW ours{};
        ours.cbSize = sizeof ours;
        ours.style = CS_DBLCLKS;
        ours.lpfnWndProc = procedure;
        ours.hInstance = instance();
        ours.hCursor = LoadCursorW(nullptr, reinterpret_cast<const wchar_t*>(IDC_ARROW));
        ours.lpszClassName = ownClass;
        RegisterClassExW(&ours);
    }
    OwnClass(const OwnClass&) = delete;
    OwnClass& operator=(const OwnClass&) = delete;
    ~OwnClass() { UnregisterClassW(ownClass, instance()); }
};

} // namespace

Window::Window(std::shared_ptr<Surroundings> surroundings)
    : mSurroundings(std::move(surroundings)) {}

Window::~Window() {
    const HWND handle = std::exchange(mHandle, nullptr);
    if (!handle) return;
    SetWindowLongPtrW(handle, GWLP_USERDATA, 0);
    if (mNative) SetWindowLongPtrW(handle, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(mNative));
    DestroyWindow(handle);
}

void Window::create(HWND parent, DWORD style, DWORD extended) {
    static const OwnClass registered(&procedure);
    if (!CreateWindowExW(extended, ownClass, L"", style, 0, 0, 0, 0, parent, nullptr, instance(),
                         this))
        throw std::bad_alloc();
    if (style & WS_CHILD) raise();
}

void Window::createNative(const wchar_t* nativeClass, HWND parent, DWORD style, DWORD extended,
                          const String& text) {
    const HWND made = CreateWindowExW(extended, nativeClass, wide(text), style, 0, 0, 0, 0, parent,
                                      nullptr, instance(), nullptr);
    if (!made) throw std::bad_alloc();
    adopt(made);
    if (style & WS_CHILD) raise();
    applyFont();
}

void Window::adopt(HWND handle) {
    mHandle = handle;
    SetWindowLongPtrW(handle, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
    mNative = reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(handle, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&procedure)));
}

Window* Window::of(HWND handle) {
    if (!handle) return nullptr;
    // Of our class it is ours although a host has put a procedure of its own before.
    const auto ours = reinterpret_cast<LONG_PTR>(&procedure);
    if (GetWindowLongPtrW(handle, GWLP_WNDPROC) != ours &&
        GetClassLongPtrW(handle, GCLP_WNDPROC) != static_cast<ULONG_PTR>(ours))
        return nullptr;
    return reinterpret_cast<Window*>(GetWindowLongPtrW(handle, GWLP_USERDATA));
}

Window* Window::around(HWND handle) {
    for (; handle; handle = GetAncestor(handle, GA_PARENT))
        if (Window* const found = of(handle)) return found;
    return nullptr;
}

LRESULT CALLBACK Window::procedure(HWND handle, UINT message, WPARAM w, LPARAM l) {
    if (message == WM_NCCREATE) {
        const auto& made = *reinterpret_cast<const CREATESTRUCTW*>(l);
        SetWindowLongPtrW(handle, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(made.lpCreateParams));
        static_cast<Window*>(made.lpCreateParams)->mHandle = handle;
    }
    auto* const window = reinterpret_cast<Window*>(GetWindowLongPtrW(handle, GWLP_USERDATA));
    if (!window) return DefWindowProcW(handle, message, w, l);
    return window->dispatch({message, w, l});
}

LRESULT Window::dispatch(const Message& message) {
    // In its constructor nobody holds it yet, and in its destructor nobody any more.
    const std::shared_ptr<Window> held = weak_from_this().lock();
    ++mDepth;
    LRESULT result = 0;
    if (message.id == WM_NCDESTROY) {
        const HWND handle = mHandle;
        result = passOn(message);
        SetWindowLongPtrW(handle, GWLP_USERDATA, 0);
        if (mNative) SetWindowLongPtrW(handle, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(mNative));
        mHandle = nullptr;
        mSelf = nullptr;
    } else {
        result = mEnded || !held ? passOn(message) : handle(message);
        if (message.id == WM_SETFOCUS && isAlive()) mSurroundings->focus.entered(*this);
        if (message.id == WM_KILLFOCUS) lostFocus(reinterpret_cast<HWND>(message.w));
        tellHostOfFocus(message);
    }
    --mDepth;
    destroyIfIdle();
    return result;
}

void Window::lostFocus(HWND to) {
    mSurroundings->focus.left(*this, to);
    // An editor has been left when the focus has gone elsewhere in the window around, be it the
    // host's.
    const RowWindow* const editor = editorAround(mHandle);
    if (!editor || !to || IsChild(editor->hwnd(), to)) return;
    if (GetAncestor(to, GA_ROOT) == GetAncestor(mHandle, GA_ROOT))
        mSurroundings->comforts.editorLeft();
}

void Window::tellHostOfFocus(const Message& message) const {
    if (message.id != WM_SETFOCUS && message.id != WM_KILLFOCUS) return;
    if (!mSurroundings->holds(mHandle) || mSurroundings->holds(reinterpret_cast<HWND>(message.w)))
        return;
    if (const auto tell = mSurroundings->onFocus) tell(message.id == WM_SETFOCUS);
}

LRESULT Window::passOn(const Message& message) const {
    if (!mHandle) return 0;
    return mNative ? CallWindowProcW(mNative, mHandle, message.id, message.w, message.l)
                   : DefWindowProcW(mHandle, message.id, message.w, message.l);
}

void Window::end() {
    if (std::exchange(mEnded, true)) return;
    forget();
    mSurroundings->focus.forget(*this);
    if (!mHandle) return;
    mSelf = weak_from_this().lock();
    ShowWindow(mHandle, SW_HIDE);
    destroyIfIdle();
}

void Window::destroyIfIdle() {
    if (!mEnded || mDepth != 0 || !mHandle) return;
    // Its last messages are part of this and do not begin it again.
    mDepth = 1;
    DestroyWindow(mHandle);
}

LRESULT Window::handle(const Message& message) {
    HWND from = nullptr;
    switch (message.id) {
    case WM_COMMAND:
    case WM_HSCROLL:
    case WM_VSCROLL: from = reinterpret_cast<HWND>(message.l); break;
    case WM_DRAWITEM: from = reinterpret_cast<const DRAWITEMSTRUCT*>(message.l)->hwndItem; break;
    case WM_CTLCOLOREDIT:
    case WM_CTLCOLORSTATIC:
    case WM_CTLCOLORLISTBOX: from = reinterpret_cast<HWND>(message.l); break;
    case WM_SYSCOLORCHANGE: repaint(); break;
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        if (mSurroundings->navigation.keyPressed(*this, message)) return 0;
        break;
    case WM_GETOBJECT:
        if (const auto answered = answerReader(*this, message)) return *answered;
        break;
    case WM_GETDLGCODE:
        // Within the control, Tab and the like go the way of the navigation, whatever loop the
        // host runs.
        if (mSurroundings->holds(mHandle)) return passOn(message) | DLGC_WANTALLKEYS;
        break;
    case WM_MOUSEWHEEL:
    case WM_MOUSEHWHEEL:
        if (!mNative && mSurroundings->holds(mHandle))
            return mSurroundings->scrollByWheel(message), 0;
        break;
    default: break;
    }
    if (Window* const part = of(from); part && part->isAlive())
        if (const auto result = part->told(message)) return *result;
    return passOn(message);
}

bool Window::hasUseFor(WPARAM key, std::int16_t shift) const {
    constexpr std::int16_t control = 2;
    constexpr std::int16_t alt = 4;
    // The current column goes to the left and to the right, and lists drop down.
    if (shift & alt) return key >= VK_LEFT && key <= VK_DOWN && !(shift & control);
    switch (key) {
    case VK_TAB: return !(shift & control);
    case VK_ESCAPE: return GetCapture() != nullptr; // what is in hand ends by it
    case VK_F2:
    case VK_F6:
    // All that walks, by words and to the ends too.
    case VK_LEFT:
    case VK_RIGHT:
    case VK_UP:
    case VK_DOWN:
    case VK_HOME:
    case VK_END:
    case VK_PRIOR:
    case VK_NEXT:
    case VK_SPACE:
    case VK_RETURN:
    case VK_DELETE:
    case VK_INSERT:
    case VK_BACK: return true;
    default: return !(shift & control) && !(key >= VK_F1 && key <= VK_F24);
    }
}

bool hasUseAsEditor(WPARAM key, std::int16_t shift) {
    constexpr std::int16_t control = 2;
    constexpr std::int16_t alt = 4;
    switch (key) {
    case VK_ESCAPE:
    case VK_F4: return !(shift & alt);
    case 'A':
    case 'C':
    case 'V':
    case 'X':
    case 'Z': return (shift & ~1) == control;
    default: return false;
    }
}

void Window::setFont(const std::optional<Font>& font) {
    mFont = font;
    applyFont();
}

Font Window::font() const { return mFont.value_or(mSurroundings->fonts.own()); }

HFONT Window::fontHandle() const { return mSurroundings->fonts.of(font()); }

void Window::applyFont() {
    if (mHandle && mNative)
        SendMessageW(mHandle, WM_SETFONT, reinterpret_cast<WPARAM>(fontHandle()), TRUE);
    if (!mHandle) return;
    fontChanged();
    repaint();
}

void Window::show(bool value) {
    if (!mHandle) return;
    // Or the system would hand the focus to whatever this stands in.
    if (!value) mSurroundings->focus.release(*this);
    ShowWindow(mHandle, value ? SW_SHOWNA : SW_HIDE);
}

void Window::raise() {
    if (mHandle)
        SetWindowPos(mHandle, HWND_TOP, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);
}

void Window::place(const RECT& place) {
    if (!mHandle) return;
    if (const RECT before = placeInParent(); EqualRect(&before, &place)) return;
    SetWindowPos(mHandle, nullptr, place.left, place.top, place.right - place.left,
                 place.bottom - place.top, SWP_NOZORDER | SWP_NOACTIVATE);
}

RECT Window::placeInParent() const {
    RECT place{};
    if (!mHandle) return place;
    GetWindowRect(mHandle, &place);
    MapWindowPoints(nullptr, GetAncestor(mHandle, GA_PARENT), reinterpret_cast<POINT*>(&place), 2);
    return place;
}

Bounds Window::bounds() const {
    return mBounds.value_or(mSurroundings->scale.toTwips(placeInParent()));
}

void Window::setBounds(const Bounds& bounds) {
    mBounds = bounds;
    if (!mLaidOut) place(mSurroundings->scale.toPixels(bounds));
}

void Window::applyScale() {
    applyFont();
    if (mBounds && !mLaidOut) place(mSurroundings->scale.toPixels(*mBounds));
}

void Window::enable(bool value) {
    if (!mHandle || isEnabled() == value) return;
    if (!value) mSurroundings->focus.release(*this);
    EnableWindow(mHandle, value);
}

bool Window::isEnabled() const {
    return mHandle && !(GetWindowLongW(mHandle, GWL_STYLE) & WS_DISABLED);
}

RECT Window::area() const {
    RECT area{};
    if (mHandle) GetClientRect(mHandle, &area);
    return area;
}

void Window::repaint() const {
    if (mHandle) InvalidateRect(mHandle, nullptr, FALSE);
}

std::int16_t buttonOf(UINT message) {
    switch (message) {
    case WM_LBUTTONDOWN:
    case WM_LBUTTONDBLCLK:
    case WM_LBUTTONUP: return 1;
    case WM_RBUTTONDOWN:
    case WM_RBUTTONDBLCLK:
    case WM_RBUTTONUP: return 2;
    case WM_MBUTTONDOWN:
    case WM_MBUTTONDBLCLK:
    case WM_MBUTTONUP: return 4;
    default: return 0;
    }
}

std::int16_t buttonsOf(WPARAM keys) {
    return static_cast<std::int16_t>((keys & MK_LBUTTON ? 1 : 0) + (keys & MK_RBUTTON ? 2 : 0) +
                                     (keys & MK_MBUTTON ? 4 : 0));
}

std::int16_t shiftState() {
    const auto down = [](int key) { return GetKeyState(key) < 0; };
    return static_cast<std::int16_t>((down(VK_SHIFT) ? 1 : 0) + (down(VK_CONTROL) ? 2 : 0) +
                                     (down(VK_MENU) ? 4 : 0));
}

std::int16_t shiftState(WPARAM keys) {
    return static_cast<std::int16_t>((keys & MK_SHIFT ? 1 : 0) + (keys & MK_CONTROL ? 2 : 0) +
                                     (GetKeyState(VK_MENU) < 0 ? 4 : 0));
}

bool isPress(UINT message) { return buttonOf(message) != 0 && !isRelease(message); }

bool isRelease(UINT message) {
    return message == WM_LBUTTONUP || message == WM_RBUTTONUP || message == WM_MBUTTONUP;
}

} // namespace zandor::platform::windows
