// Records what the process writes to the debugger output while an object of
// this class lives. OutputDebugString raises DBG_PRINTEXCEPTION_WIDE_C
// (0x4001000A) and/or DBG_PRINTEXCEPTION_C (0x40010006); a vectored handler
// records the text and lets execution continue. One call that raises both
// kinds is recorded once.
#ifndef VANTORBASE_TESTS_DEBUG_CAPTURE_H
#define VANTORBASE_TESTS_DEBUG_CAPTURE_H

#include <windows.h>

#include <mutex>
#include <string>
#include <vector>

class DebugCapture {
public:
    DebugCapture() {
        std::lock_guard<std::mutex> lock(Mutex());
        Active() = this;
        m_handler = AddVectoredExceptionHandler(1, &DebugCapture::Handler);
    }
    ~DebugCapture() {
        RemoveVectoredExceptionHandler(m_handler);
        std::lock_guard<std::mutex> lock(Mutex());
        Active() = nullptr;
    }
    DebugCapture(const DebugCapture&) = delete;
    DebugCapture& operator=(const DebugCapture&) = delete;

    // Every text written so far, one element per OutputDebugString call.
    std::vector<std::wstring> Texts() const {
        std::lock_guard<std::mutex> lock(Mutex());
        return m_texts;
    }
    // Every text written so far, joined.
    std::wstring Joined() const {
        std::wstring all;
        for (const auto& text : Texts()) all += text;
        return all;
    }
    void Reset() {
        std::lock_guard<std::mutex> lock(Mutex());
        m_texts.clear();
    }

private:
    static constexpr DWORD kNarrow = 0x40010006;
    static constexpr DWORD kWide = 0x4001000A;

    static std::mutex& Mutex() {
        static std::mutex mutex;
        return mutex;
    }
    static DebugCapture*& Active() {
        static DebugCapture* active = nullptr;
        return active;
    }

    static LONG CALLBACK Handler(EXCEPTION_POINTERS* info) {
        const EXCEPTION_RECORD* record = info->ExceptionRecord;
        if (record->ExceptionCode != kNarrow && record->ExceptionCode != kWide)
            return EXCEPTION_CONTINUE_SEARCH;
        // The wide text last recorded on this thread, whose narrow twin may follow.
        thread_local std::wstring pendingTwin;
        thread_local bool twinPending = false;
        std::wstring text;
        if (record->ExceptionCode == kWide) {
            const auto* chars = reinterpret_cast<const wchar_t*>(record->ExceptionInformation[1]);
            if (chars) text = chars;
            pendingTwin = text;
            twinPending = true;
        } else {
            const auto* chars = reinterpret_cast<const char*>(record->ExceptionInformation[1]);
            if (chars) {
                const int n = MultiByteToWideChar(CP_ACP, 0, chars, -1, nullptr, 0);
                if (n > 0) {
                    text.resize(static_cast<size_t>(n));
                    MultiByteToWideChar(CP_ACP, 0, chars, -1, &text[0], n);
                    text.resize(static_cast<size_t>(n - 1));
                }
            }
            const bool twin = twinPending && text == pendingTwin;
            twinPending = false;
            if (twin) return EXCEPTION_CONTINUE_EXECUTION;
        }
        std::lock_guard<std::mutex> lock(Mutex());
        if (Active()) Active()->m_texts.push_back(text);
        return EXCEPTION_CONTINUE_EXECUTION;
    }

    PVOID m_handler = nullptr;
    std::vector<std::wstring> m_texts;
};

#endif  // VANTORBASE_TESTS_DEBUG_CAPTURE_H
