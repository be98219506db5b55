// Small owners of the Win32 handles of the system layer: kernel handles,
// windows and window classes.
#ifndef VANTORBASE_SRC_SYSTEM_HANDLE_H
#define VANTORBASE_SRC_SYSTEM_HANDLE_H

#include <windows.h>

namespace vantorbase::detail {

// Owns one kernel handle and closes it with CloseHandle when it goes or is
// replaced. Null means "no handle"; a null from a failed call is never
// closed. Movable, not copyable.
class UniqueHandle {
public:
    UniqueHandle() noexcept = default;
    explicit UniqueHandle(HANDLE handle) noexcept : m_handle(handle) {}
    UniqueHandle(UniqueHandle&& other) noexcept : m_handle(other.detach()) {}
    UniqueHandle& operator=(UniqueHandle&& other) noexcept {
        if (this != &other) reset(other.detach());
        return *this;
    }
    UniqueHandle(const UniqueHandle&) = delete;
    UniqueHandle& operator=(const UniqueHandle&) = delete;
    ~UniqueHandle() { reset(); }

    HANDLE get() const noexcept { return m_handle; }
    explicit operator bool() const noexcept { return m_handle != nullptr; }

    // Closes the handle held, if any, and takes `handle` instead.
    void reset(HANDLE handle = nullptr) noexcept {
        if (m_handle != nullptr) CloseHandle(m_handle);
        m_handle = handle;
    }
    // Gives the handle up without closing it.
    HANDLE detach() noexcept {
        HANDLE handle = m_handle;
        m_handle = nullptr;
        return handle;
    }

private:
    HANDLE m_handle = nullptr;
};

// Owns one window and destroys it with DestroyWindow when it goes or is
// replaced; a null from a failed creation is never acted on. Only the thread
// that owns a window can destroy it.
class UniqueWindow {
public:
    UniqueWindow() noexcept = default;
    UniqueWindow(const UniqueWindow&) = delete;
    UniqueWindow& operator=(const UniqueWindow&) = delete;
    ~UniqueWindow() { reset(); }

    HWND get() const noexcept { return m_window; }
    explicit operator bool() const noexcept { return m_window != nullptr; }

    void reset(HWND window = nullptr) noexcept {
        if (m_window != nullptr) DestroyWindow(m_window);
        m_window = window;
    }

private:
    HWND m_window = nullptr;
};

// One window class registered by this library, unregistered when the object
// goes or is reset. A registration that failed (the class existed already,
// for instance) holds nothing, so a class this library did not register is
// never unregistered by it.
class WindowClassRegistration {
public:
    WindowClassRegistration() noexcept = default;
    WindowClassRegistration(const WindowClassRegistration&) = delete;
    WindowClassRegistration& operator=(const WindowClassRegistration&) = delete;
    ~WindowClassRegistration() { reset(); }

    // Registers `windowClass`, after giving up a class registered before.
    // The outcome is kept, not reported.
    void Register(const WNDCLASSW& windowClass) noexcept {
        reset();
        if (RegisterClassW(&windowClass) != 0) {
            m_name = windowClass.lpszClassName;
            m_instance = windowClass.hInstance;
        }
    }

    void reset() noexcept {
        if (m_name != nullptr) UnregisterClassW(m_name, m_instance);
        m_name = nullptr;
        m_instance = nullptr;
    }

private:
    const wchar_t* m_name = nullptr;  // a text of static storage
    HINSTANCE m_instance = nullptr;
};

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_SYSTEM_HANDLE_H
