#pragma once

#include <cstdint>

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
