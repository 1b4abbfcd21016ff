#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>

#include <windows.h>

/// The objects of this process that the system counts; where it does not count them, as Wine does
/// not, those that there is a handle of.
struct SystemObjects {
    int drawing = 0;
    int windows = 0; ///< and menus

    static SystemObjects now() {
        SystemObjects objects{
            static_cast<int>(GetGuiResources(GetCurrentProcess(), GR_GDIOBJECTS)),
            static_cast<int>(GetGuiResources(GetCurrentProcess(), GR_USEROBJECTS))};
        if (objects.drawing != 0) return objects;
        for (std::uintptr_t handle = 1; handle <= 0xFFFF; ++handle)
            if (GetObjectType(reinterpret_cast<HGDIOBJ>(handle))) ++objects.drawing;
        for (std::uintptr_t handle = 0x20; handle <= 0xFFFF; handle += 2) {
            DWORD process = 0;
            GetWindowThreadProcessId(reinterpret_cast<HWND>(handle), &process);
            if (process == GetCurrentProcessId() || IsMenu(reinterpret_cast<HMENU>(handle)))
                ++objects.windows;
        }
        return objects;
    }
};

/// That what is done over and over, as often as ZANDOR_ROUNDS says, leaves no object behind.
template <class Work>
void expectNothingLeftBehind(const Work& work) {
    const char* const given = std::getenv("ZANDOR_ROUNDS");
    const int rounds = given ? std::atoi(given) : 100;
    constexpr int settled = 10;
    for (int i = 0; i < settled; ++i) work();
    const SystemObjects before = SystemObjects::now();
    for (int i = 0; i < rounds; ++i) work();
    const SystemObjects after = SystemObjects::now();
    std::printf("%d rounds: %d drawing objects before, %d after; %d windows before, %d after\n",
                rounds, before.drawing, after.drawing, before.windows, after.windows);
    EXPECT_GT(before.drawing, 0);
    EXPECT_LE(after.drawing, before.drawing);
    EXPECT_LE(after.windows, before.windows);
}
