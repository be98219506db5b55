// VantorBase: window timers.
//
// A Timer calls its OnTimer back at a fixed interval. Every Timer sets its
// system timer on one window, normally the library's hidden window (see
// VANTOR_Init), and OnTimer runs from the message dispatch of the thread
// that owns that window; the library runs no message loop of its own.
//
//   class Blink : public Timer {
//   protected:
//       void OnTimer(UINT, UINT_PTR, DWORD) override { /* ... */ }
//   };
//   Blink blink;
//   blink.StartTimer(500);   // makes the hidden window if there is none
//   // ... the thread's message loop dispatches the ticks ...
//   blink.StopTimer();
//
// Nothing here reports failure: a missing or destroyed timer window shows
// only in IsTimerOn() staying false after StartTimer and in GetWindow()
// returning null.
#ifndef VANTORBASE_TIMER_H
#define VANTORBASE_TIMER_H

#include "vantorbase/export.h"
#include "vantorbase/platform.h"

// The base class of an application's timers; see the top of this header.
//
// Timers are started, stopped and destroyed on the thread that owns the
// timer window. A timer's id is its own address: unique among live timers.
// A tick that reaches the library after its timer was stopped or destroyed
// is ignored. A Timer cannot be copied: a copy would carry, and route ticks
// to, its source's id.
class VANTORBASE_API Timer {
public:
    // Off, interval 0; nothing is given to the system.
    Timer();
    Timer(const Timer&) = delete;
    Timer& operator=(const Timer&) = delete;
    // Kills the timer's system timer on the current timer window.
    virtual ~Timer();

    // Makes the hidden window first if the library is not initialised. Then
    // (re)sets the system timer at the new interval on the timer window and
    // turns the timer on; restarting a running timer replaces its system
    // timer. If there is no valid timer window the timer is left off.
    void StartTimer(DWORD milliseconds);
    // Kills the system timer and turns the timer off.
    void StopTimer();
    bool IsTimerOn();
    UINT_PTR GetTimerId();

    // Makes `window` the window on which later timers are set, unchecked.
    // Not to be changed while any timer is on: a timer is killed on the
    // window named at that time. The hidden window replaces it when made.
    static void SetWindow(HWND window);
    // The timer window, or null; a window destroyed meanwhile is forgotten.
    static HWND GetWindow();

protected:
    // The application's callback: the message number (WM_TIMER), this
    // timer's id and the system time in milliseconds of the tick.
    virtual void OnTimer(UINT message, UINT_PTR timerId, DWORD time) = 0;

private:
    static void CALLBACK TimerProc(HWND window, UINT message, UINT_PTR timerId, DWORD time);
    void SetInterval(DWORD milliseconds);
    DWORD GetInterval();
    void SetTimerOnOff(bool on);

    static HWND m_hWnd;

    UINT_PTR m_timerId;
    DWORD m_interval;
    bool m_on;
};

#endif  // VANTORBASE_TIMER_H
