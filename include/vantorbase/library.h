// VantorBase: starting and stopping the library.
//
// VANTOR_Init makes the library's hidden window, on which every Timer sets
// its system timer, on the calling thread; that thread then dispatches the
// timers' messages. It also switches on the PropertyException report to the
// debugger output. VANTOR_Exit destroys the window and switches the report
// off. Both are called from the thread that is to own the timer window.
#ifndef VANTORBASE_LIBRARY_H
#define VANTORBASE_LIBRARY_H

#include "vantorbase/export.h"

extern "C" {

// Makes the hidden window (class and title "VantorBaseTimerWin") unless the
// library is initialised already. The first Timer::StartTimer does the same.
VANTORBASE_API void VANTOR_Init(void);

// Destroys the hidden window and clears the initialised state; does nothing
// if the library is not initialised. Started timers stop firing but still
// report IsTimerOn() until stopped or restarted.
VANTORBASE_API void VANTOR_Exit(void);

}

#endif  // VANTORBASE_LIBRARY_H
