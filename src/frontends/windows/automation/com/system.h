#pragma once

// The system's headers, without those of their macros that are names of ours. Whatever of the
// system has two forms is called in its wide one by name.

#include <windows.h>

#include <objsafe.h>
#include <ocidl.h>
#include <ole2.h>
#include <oleauto.h>
#include <olectl.h>

#undef MessageBox
#undef RegisterWindowMessage
#undef SendMessage
#undef near

#ifdef __CRT_UUID_DECL
// The one interface here whose header leaves it out.
__CRT_UUID_DECL(IObjectSafety, 0xcb5bdc81, 0x93c1, 0x11cf, 0x8f, 0x20, 0x0, 0x80, 0x5f, 0x2c, 0xd0,
                0x64)
#endif
