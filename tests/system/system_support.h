// Helpers of the thread, mutex and timer tests: a Thread that runs a given
// function, unique mutex names, an application window and a message pump
// with a deadline.
#ifndef VANTORBASE_TESTS_SYSTEM_SUPPORT_H
#define VANTORBASE_TESTS_SYSTEM_SUPPORT_H

#include <windows.h>

#include <functional>
#include <string>
#include <vector>

#include "process_probe.h"
#include "vantorbase/thread.h"

namespace system_test {

// Runs `body` on its own thread; the destructor collects the thread before
// the function goes.
class Worker : public Thread {
public:
    explicit Worker(std::function<void()> body) : m_body(std::move(body)) {}
    ~Worker() { StopThread(); }
    void OnThread() override { m_body(); }

private:
    std::function<void()> m_body;
};

// A manual-reset event, closed with the object.
struct Event {
    Event() : handle(CreateEventW(nullptr, TRUE, FALSE, nullptr)) {}
    ~Event() { CloseHandle(handle); }
    Event(const Event&) = delete;
    Event& operator=(const Event&) = delete;
    bool WaitFor(DWORD milliseconds) const {
        return WaitForSingleObject(handle, milliseconds) == WAIT_OBJECT_0;
    }
    HANDLE handle;
};

// The message of the ThreadException that `operation` raises.
template <typename Operation>
std::wstring FailureOf(Operation operation) {
    try {
        operation();
    } catch (const ThreadException& e) {
        return e.getMessage();
    }
    return L"no exception";
}

// A mutex name no other test process uses.
inline std::wstring UniqueName(const wchar_t* stem) {
    static int counter = 0;
    return std::wstring(L"VantorBaseTest.") + stem + L"." + std::to_wstring(GetCurrentProcessId()) +
           L"." + std::to_wstring(++counter);
}

// A hidden top-level window of the calling thread, destroyed with the object
// unless reset earlier.
class AppWindow {
public:
    AppWindow() {
        WNDCLASSW windowClass{};
        windowClass.lpfnWndProc = &DefWindowProcW;
        windowClass.hInstance = GetModuleHandleW(nullptr);
        windowClass.lpszClassName = L"VantorBaseTestApp";
        RegisterClassW(&windowClass);
        m_window = CreateWindowExW(0, L"VantorBaseTestApp", L"test", WS_OVERLAPPEDWINDOW, 0, 0,
                                   0, 0, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    }
    ~AppWindow() { reset(); }
    AppWindow(const AppWindow&) = delete;
    AppWindow& operator=(const AppWindow&) = delete;

    HWND get() const { return m_window; }
    void reset() {
        if (m_window != nullptr) DestroyWindow(m_window);
        m_window = nullptr;
    }

private:
    HWND m_window = nullptr;
};

// Dispatches the calling thread's messages until `done` holds or
// `milliseconds` have passed; `seen` is shown every message first. Returns
// whether `done` held.
inline bool PumpUntil(const std::function<bool()>& done, DWORD milliseconds,
                      const std::function<void(const MSG&)>& seen = {}) {
    const ULONGLONG deadline = GetTickCount64() + milliseconds;
    for (;;) {
        MSG msg;
        while (PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE)) {
            if (seen) seen(msg);
            TranslateMessage(&msg);
            DispatchMessageW(&msg);
        }
        if (done()) return true;
        const ULONGLONG now = GetTickCount64();
        if (now >= deadline) return false;
        const ULONGLONG left = deadline - now;
        MsgWaitForMultipleObjects(0, nullptr, FALSE, static_cast<DWORD>(left < 10 ? left : 10),
                                  QS_ALLINPUT);
    }
}

inline void PumpFor(DWORD milliseconds, const std::function<void(const MSG&)>& seen = {}) {
    PumpUntil([] { return false; }, milliseconds, seen);
}

}  // namespace system_test

#endif  // VANTORBASE_TESTS_SYSTEM_SUPPORT_H
