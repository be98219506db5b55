// The library-wide state: the module instance, the hidden timer window and
// its window class; the entry point and the exported start and stop.
#include "foundation/library_state.h"
#include "system/handle.h"
#include "vantorbase/library.h"
#include "vantorbase/timer.h"

namespace {

constexpr wchar_t kHiddenWindowName[] = L"VantorBaseTimerWin";

// Recorded when the process loads the library.
HINSTANCE g_module = nullptr;
// Both exist from VANTOR_Init (or the first StartTimer) to VANTOR_Exit.
vantorbase::detail::WindowClassRegistration g_hiddenWindowClass;
vantorbase::detail::UniqueWindow g_hiddenWindow;

// The hidden window makes itself the timer window when it is created and
// otherwise behaves as the default window does. Timer ticks do not come
// here: every timer is set with Timer's own timer procedure.
LRESULT CALLBACK HiddenWindowProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_CREATE) Timer::SetWindow(window);
    return DefWindowProcW(window, message, wParam, lParam);
}

void MakeHiddenWindow() {
    WNDCLASSW windowClass{};
    windowClass.style = CS_HREDRAW | CS_VREDRAW;
    windowClass.lpfnWndProc = &HiddenWindowProc;
    windowClass.hInstance = g_module;
    windowClass.hIcon = LoadIconW(nullptr, IDI_APPLICATION);
    windowClass.hCursor = LoadCursorW(nullptr, IDC_ARROW);
    windowClass.hbrBackground = static_cast<HBRUSH>(GetStockObject(WHITE_BRUSH));
    windowClass.lpszClassName = kHiddenWindowName;
    g_hiddenWindowClass.Register(windowClass);

    HWND window = CreateWindowExW(0, kHiddenWindowName, kHiddenWindowName, WS_OVERLAPPEDWINDOW,
                                  0, 0, 0, 0, nullptr, nullptr, g_module, nullptr);
    if (window == nullptr) {
        // No timer may be set on a window that is not there, nor on one that
        // the failed creation may have named on its way.
        Timer::SetWindow(nullptr);
        return;
    }
    ShowWindow(window, SW_HIDE);
    g_hiddenWindow.reset(window);
}

}  // namespace

extern "C" {

void VANTOR_Init(void) {
    if (vantorbase::detail::IsLibraryInitialized()) return;
    vantorbase::detail::SetLibraryInitialized(true);
    MakeHiddenWindow();
}

void VANTOR_Exit(void) {
    if (!vantorbase::detail::IsLibraryInitialized()) return;
    if (g_hiddenWindow) {
        // Destroying the window ends every system timer set on it.
        g_hiddenWindow.reset();
        Timer::SetWindow(nullptr);
    }
    g_hiddenWindowClass.reset();
    vantorbase::detail::SetLibraryInitialized(false);
}

BOOL WINAPI DllMain(HINSTANCE instance, DWORD reason, LPVOID) {
    if (reason == DLL_PROCESS_ATTACH) g_module = instance;
    if (reason == DLL_PROCESS_DETACH) VANTOR_Exit();
    return TRUE;
}

}  // extern "C"
