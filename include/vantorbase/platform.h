// VantorBase: the Windows declarations that the public headers need
// (HANDLE, HWND, UINT, UINT_PTR, DWORD, WPARAM, LPARAM, LRESULT).
//
// The Windows headers are included with NOMINMAX in force, so that including
// a VantorBase header never leaves `min` and `max` macros behind. A caller
// that wants those macros includes <windows.h> before any VantorBase header.
#ifndef VANTORBASE_PLATFORM_H
#define VANTORBASE_PLATFORM_H

#ifndef NOMINMAX
#define NOMINMAX
#define VANTORBASE_PLATFORM_SET_NOMINMAX
#endif

#include <windows.h>

#ifdef VANTORBASE_PLATFORM_SET_NOMINMAX
#undef NOMINMAX
#undef VANTORBASE_PLATFORM_SET_NOMINMAX
#endif

#endif  // VANTORBASE_PLATFORM_H
