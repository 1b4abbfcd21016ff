// The control in a window of a program in C++, by its interfaces: it shows a query, its events are
// heard, and the statement below it is always that of the drawing.

#include "Listener.h"
#include "Site.h"
#include "calls.h"
#include "query.h"

#include <control.h>

#include <optional>

namespace {

class Window {
public:
    Window() {
        WNDCLASSW kind{};
        kind.lpfnWndProc = &procedure;
        kind.hInstance = GetModuleHandleW(nullptr);
        kind.hCursor = LoadCursorW(nullptr, reinterpret_cast<const wchar_t*>(IDC_ARROW));
        kind.hbrBackground = GetSysColorBrush(COLOR_BTNFACE);
        kind.lpszClassName = L"ZandorExampleHost";
        RegisterClassW(&kind);
        CreateWindowExW(0, kind.lpszClassName, L"A query", WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN,
                        60, 60, 760, 620, nullptr, nullptr, kind.hInstance, this);
        if (!mHandle) throw std::runtime_error("The system has no window to give");
        mStatement = child(L"EDIT", ES_MULTILINE | ES_READONLY | WS_VSCROLL | WS_BORDER);
        mStatus = child(L"STATIC", SS_LEFTNOWORDWRAP);
        putControlIn();
        layOut();
        ShowWindow(mHandle, SW_SHOW);
    }
    Window(const Window&) = delete;
    Window& operator=(const Window&) = delete;

    int run() {
        MSG message{};
        while (GetMessageW(&message, nullptr, 0, 0) > 0) {
            const bool isKey = message.message >= WM_KEYFIRST && message.message <= WM_KEYLAST;
            const auto active = mSite->active;
            if (isKey && active && active->TranslateAccelerator(&message) == S_OK) continue;
            TranslateMessage(&message);
            DispatchMessageW(&message);
        }
        return static_cast<int>(message.wParam);
    }

private:
    HWND child(const wchar_t* kind, DWORD style) const {
        const HWND made = CreateWindowExW(0, kind, L"", WS_CHILD | WS_VISIBLE | style, 0, 0, 0, 0,
                                          mHandle, nullptr, nullptr, nullptr);
        const auto font = reinterpret_cast<WPARAM>(GetStockObject(DEFAULT_GUI_FONT));
        SendMessageW(made, WM_SETFONT, font, FALSE);
        return made;
    }

    void putControlIn() {
        mSite.emplace(mHandle);
        mControl = create<_Zandor>(L"TalvikDBxZandor.Zandor");
        SHORT noTraces = 0;
        check(mControl->put_DebugSwitch(&noTraces), "Turning traces off");
        check(mControl->put_OnlyJoin(VARIANT_FALSE), "Showing the grid");
        check(as<IOleObject>(mControl.Get())->SetClientSite(&*mSite), "Giving the control a site");
        mListener.emplace(mControl.Get(), [this](const std::wstring& event) { heard(event); });
        mQuery = makeQuery();
        check(mControl->putref_Zandor(mQuery.Get()), "Showing the query");
        mSite->place = placeOfControl();
        tell(OLEIVERB_SHOW);
        heard(L"Drag columns from table to table, and into the grid");
    }
    void tell(LONG verb) {
        check(as<IOleObject>(mControl.Get())
                  ->DoVerb(verb, nullptr, &*mSite, 0, mHandle, &mSite->place),
              "Activating the control");
    }

    void heard(const std::wstring& what) {
        SetWindowTextW(mStatus, what.c_str());
        BSTR text = nullptr;
        if (mQuery && SUCCEEDED(mQuery->SQL(zdSQLite, &text))) {
            std::wstring lines;
            for (const wchar_t* unit = text; unit && *unit; ++unit) {
                if (*unit == L'\n') lines += L'\r';
                lines += *unit;
            }
            SetWindowTextW(mStatement, lines.c_str());
        }
        SysFreeString(text);
    }

    RECT placeOfControl() const {
        RECT area{};
        GetClientRect(mHandle, &area);
        area.bottom = area.bottom > 150 ? area.bottom - 150 : 0;
        return area;
    }
    void layOut() {
        if (!mControl) return;
        RECT area{};
        GetClientRect(mHandle, &area);
        const RECT place = mSite->place = placeOfControl();
        as<IOleInPlaceObject>(mControl.Get())->SetObjectRects(&place, &place);
        MoveWindow(mStatus, 6, place.bottom + 4, area.right - 12, 16, TRUE);
        MoveWindow(mStatement, 0, place.bottom + 24, area.right, area.bottom - place.bottom - 24,
                   TRUE);
    }

    void close() {
        mListener.reset();
        if (mControl) {
            const auto object = as<IOleObject>(mControl.Get());
            object->Close(OLECLOSE_NOSAVE);
            object->SetClientSite(nullptr);
        }
        mControl.Reset();
        mQuery.Reset();
        PostQuitMessage(0);
    }

    static LRESULT CALLBACK procedure(HWND handle, UINT message, WPARAM w, LPARAM l) {
        if (message == WM_NCCREATE) {
            const auto& made = *reinterpret_cast<const CREATESTRUCTW*>(l);
            SetWindowLongPtrW(handle, GWLP_USERDATA,
                              reinterpret_cast<LONG_PTR>(made.lpCreateParams));
            static_cast<Window*>(made.lpCreateParams)->mHandle = handle;
        }
        auto* const window = reinterpret_cast<Window*>(GetWindowLongPtrW(handle, GWLP_USERDATA));
        if (!window) return DefWindowProcW(handle, message, w, l);
        switch (message) {
        case WM_SIZE: window->layOut(); return 0;
        case WM_SETFOCUS:
            if (window->mControl) window->tell(OLEIVERB_UIACTIVATE);
            return 0;
        case WM_DESTROY: window->close(); return 0;
        default: return DefWindowProcW(handle, message, w, l);
        }
    }

    HWND mHandle = nullptr;
    HWND mStatement = nullptr;
    HWND mStatus = nullptr;
    std::optional<Site> mSite;
    ComPtr<_Zandor> mControl;
    ComPtr<_ZDQuery> mQuery;
    std::optional<Listener> mListener;
};

} // namespace

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR, int) {
    OleInitialize(nullptr);
    int result = 1;
    try {
        Window window;
        result = window.run();
    } catch (const std::exception& failure) {
        MessageBoxA(nullptr, failure.what(), "A query", MB_OK | MB_ICONERROR);
    }
    OleUninitialize();
    return result;
}
