#include "writeBitmap.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>

namespace {

/// The example in C++ as a program of its own, and somebody who works in its window.
class TheExampleHost : public testing::Test {
protected:
    TheExampleHost() {
        STARTUPINFOW how{};
        how.cb = sizeof how;
        wchar_t program[] = ZANDOR_EXAMPLE_HOST;
        EXPECT_TRUE(CreateProcessW(program, nullptr, nullptr, nullptr, FALSE, 0, nullptr, nullptr,
                                   &how, &mProgram));
        EXPECT_TRUE(await([this] {
            window = FindWindowW(L"ZandorExampleHost", nullptr);
            return window && IsWindowVisible(window);
        })) << "no window";
    }
    ~TheExampleHost() override {
        if (WaitForSingleObject(mProgram.hProcess, 0) != WAIT_OBJECT_0)
            TerminateProcess(mProgram.hProcess, 1);
        CloseHandle(mProgram.hThread);
        CloseHandle(mProgram.hProcess);
    }

    static bool await(const std::function<bool()>& isSo) {
        const ULONGLONG end = GetTickCount64() + 30000;
        while (!isSo()) {
            if (GetTickCount64() > end) return false;
            Sleep(5);
        }
        return true;
    }

    static std::wstring textOf(HWND window) {
        wchar_t text[2000] = {};
        SendMessageW(window, WM_GETTEXT, 2000, reinterpret_cast<LPARAM>(text));
        return text;
    }
    std::wstring statement() const {
        return textOf(FindWindowExW(window, nullptr, L"EDIT", nullptr));
    }
    std::wstring status() const {
        return textOf(FindWindowExW(window, nullptr, L"STATIC", nullptr));
    }
    /// A table's window by its title; nullptr: there is none.
    HWND table(const wchar_t* title) const {
        struct Search {
            const wchar_t* title;
            HWND found;
            static BOOL CALLBACK test(HWND child, LPARAM l) {
                auto& wanted = *reinterpret_cast<Search*>(l);
                wchar_t kind[20] = {};
                GetClassNameW(child, kind, 20);
                if (std::wstring(kind) != L"ZandorPart" || textOf(child) != wanted.title)
                    return TRUE;
                wanted.found = child;
                return FALSE;
            }
        } search{title, nullptr};
        EnumChildWindows(window, &Search::test, reinterpret_cast<LPARAM>(&search));
        return search.found;
    }
    DWORD result() const {
        DWORD code = 77;
        if (WaitForSingleObject(mProgram.hProcess, 30000) == WAIT_OBJECT_0)
            GetExitCodeProcess(mProgram.hProcess, &code);
        return code;
    }

    HWND window = nullptr;

private:
    PROCESS_INFORMATION mProgram{};
};

} // namespace

TEST_F(TheExampleHost, ShowsTheStatementThatItsUserDraws) {
    ASSERT_TRUE(await([&] { return !statement().empty(); }));
    EXPECT_EQ(statement(), L"SELECT\r\n"
                           L"    customers.name\r\n"
                           L"FROM customers\r\n"
                           L"    INNER JOIN orders ON orders.customer_id = customers.id");
    const HWND orders = table(L"orders");
    ASSERT_TRUE(orders);
    RECT place{};
    GetClientRect(window, &place);
    MapWindowPoints(window, nullptr, reinterpret_cast<POINT*>(&place), 2);
    Sleep(300); // until it is painted, for the picture alone
    const HDC screen = GetDC(nullptr);
    writeBitmap(screen, place, "example-host");
    ReleaseDC(nullptr, screen);

    RECT area{};
    GetClientRect(orders, &area);
    const LPARAM cross = MAKELPARAM(area.right - 12, 11);
    PostMessageW(orders, WM_LBUTTONDOWN, MK_LBUTTON, cross);
    PostMessageW(orders, WM_LBUTTONUP, 0, cross);
    EXPECT_TRUE(await([&] { return status() == L"TableDeleted"; })) << "the event";
    EXPECT_EQ(statement(), L"SELECT\r\n"
                           L"    customers.name\r\n"
                           L"FROM customers");
    EXPECT_FALSE(table(L"orders"));
}

TEST_F(TheExampleHost, EndsWithItsWindow) {
    PostMessageW(window, WM_CLOSE, 0, 0);
    EXPECT_EQ(result(), 0U);
}

TEST_F(TheExampleHost, LaysTheControlOutInItsWindow) {
    ASSERT_TRUE(table(L"customers"));
    const HWND control = GetAncestor(GetParent(table(L"customers")), GA_PARENT);
    SetWindowPos(window, nullptr, 0, 0, 500, 400, SWP_NOMOVE | SWP_NOZORDER);
    RECT area{};
    GetClientRect(window, &area);
    EXPECT_TRUE(await([&] {
        RECT stands{};
        GetClientRect(control, &stands);
        return stands.right == area.right && stands.bottom == area.bottom - 150;
    }));
}
