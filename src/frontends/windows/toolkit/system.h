#pragma once

// The system's headers, without those of their macros that are names of ours. Whatever of the
// system has two forms is called in its wide one by name.

#include <windows.h>

#include <commctrl.h>
#include <windowsx.h>

#undef MessageBox
#undef NEAR
#undef RegisterWindowMessage
#undef SendMessage
#undef near
#define NEAR // stood for the other
