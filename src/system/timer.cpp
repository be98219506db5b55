#include <windows.h>

#include <set>

#include "vantorbase/library.h"
#include "vantorbase/timer.h"

HWND Timer::m_hWnd = nullptr;

namespace {

// The ids of the live timers. A tick can reach the timer procedure after its
// timer was destroyed (KillTimer does not withdraw a tick already retrieved
// or queued); its id is then no longer here and the tick is dropped. Timers
// may be constructed on any thread, hence the lock.
class LiveTimers {
public:
    void Enter(UINT_PTR id) {
        Exclusive guard(m_lock);
        m_ids.insert(id);
    }
    void Leave(UINT_PTR id) noexcept {
        Exclusive guard(m_lock);
        m_ids.erase(id);
    }
    bool Contains(UINT_PTR id) noexcept {
        Shared guard(m_lock);
        return m_ids.count(id) != 0;
    }

private:
    struct Exclusive {
        explicit Exclusive(SRWLOCK& lock) : m_lock(lock) { AcquireSRWLockExclusive(&m_lock); }
        ~Exclusive() { ReleaseSRWLockExclusive(&m_lock); }
        Exclusive(const Exclusive&) = delete;
        Exclusive& operator=(const Exclusive&) = delete;
        SRWLOCK& m_lock;
    };
    struct Shared {
        explicit Shared(SRWLOCK& lock) : m_lock(lock) { AcquireSRWLockShared(&m_lock); }
        ~Shared() { ReleaseSRWLockShared(&m_lock); }
        Shared(const Shared&) = delete;
        Shared& operator=(const Shared&) = delete;
        SRWLOCK& m_lock;
    };

    SRWLOCK m_lock = SRWLOCK_INIT;
    std::set<UINT_PTR> m_ids;
};

LiveTimers g_liveTimers;

}  // namespace

Timer::Timer() : m_timerId(reinterpret_cast<UINT_PTR>(this)), m_interval(0), m_on(false) {
    g_liveTimers.Enter(m_timerId);
}

Timer::~Timer() {
    g_liveTimers.Leave(m_timerId);
    if (m_hWnd != nullptr) KillTimer(m_hWnd, m_timerId);
    SetTimerOnOff(false);
}

void Timer::StartTimer(DWORD milliseconds) {
    VANTOR_Init();
    if (m_hWnd != nullptr) KillTimer(m_hWnd, m_timerId);
    SetTimerOnOff(false);
    if (m_hWnd == nullptr) return;
    if (!IsWindow(m_hWnd)) {
        m_hWnd = nullptr;
        return;
    }
    SetInterval(milliseconds);
    // Silent towards the caller, but a timer the system refused (on a window
    // of another thread, for instance) is not reported as on.
    SetTimerOnOff(SetTimer(m_hWnd, m_timerId, milliseconds, &Timer::TimerProc) != 0);
}

void Timer::StopTimer() {
    if (m_hWnd != nullptr) KillTimer(m_hWnd, m_timerId);
    SetTimerOnOff(false);
}

bool Timer::IsTimerOn() { return m_on; }

UINT_PTR Timer::GetTimerId() { return m_timerId; }

void Timer::SetWindow(HWND window) { m_hWnd = window; }

HWND Timer::GetWindow() {
    if (m_hWnd != nullptr && !IsWindow(m_hWnd)) m_hWnd = nullptr;
    return m_hWnd;
}

void CALLBACK Timer::TimerProc(HWND, UINT message, UINT_PTR timerId, DWORD time) {
    if (timerId == 0 || !g_liveTimers.Contains(timerId)) return;
    Timer* timer = reinterpret_cast<Timer*>(timerId);
    if (!timer->m_on) return;
    timer->OnTimer(message, timerId, time);
}

void Timer::SetInterval(DWORD milliseconds) { m_interval = milliseconds; }

DWORD Timer::GetInterval() { return m_interval; }

void Timer::SetTimerOnOff(bool on) { m_on = on; }
