// VantorBase: threads and their exception.
//
// A Thread runs the work of a derived class on one system thread of its own:
//
//   class Worker : public Thread {
//   public:
//       ~Worker() { m_stop = true; StopThread(); }   // stop before members go
//       void OnThread() override { while (!m_stop) { /* work */ } }
//   private:
//       std::atomic<bool> m_stop{false};
//   };
//   Worker worker;
//   worker.StartThread();
//   ...
//   worker.StopThread();                             // waits for OnThread
//
// Thread::wait and Thread::release take and give back a named system mutex
// by its name (see Mutex in vantorbase/mutex.h), on the calling thread.
#ifndef VANTORBASE_THREAD_H
#define VANTORBASE_THREAD_H

#include <memory>
#include <string>

#include "vantorbase/export.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

namespace vantorbase::detail {
struct ThreadState;
}

// Raised by the failing operations of Thread and Mutex. The message is one
// of the fixed texts "Failed to create thread", "Failed to set priority",
// "Thread object is null", "Mutex not found", "Mutex not signaled",
// "Wait timed out", "Invalid mutex handle", "Failed to release mutex" and
// "Failed to create mutex". Every copy owns its own complete message.
//
// ThreadException derives from no other class: catch it by its own type.
class VANTORBASE_API ThreadException {
public:
    // Throws std::invalid_argument if `message` is null.
    explicit ThreadException(const wchar_t* message);
    ThreadException(const ThreadException& other);
    ThreadException& operator=(const ThreadException& other);
    ~ThreadException();

    // A copy of the message.
    std::wstring getMessage() const;

private:
    std::wstring m_message;
};

// A wrapper over one system thread; see the top of this header.
//
// StopThread and the destructor wait, without limit, for OnThread to return;
// they never ask the thread to stop and never terminate it. A derived class
// whose OnThread loops gives it a stop signal of its own, sets it and calls
// StopThread in its own destructor. Neither is called from within OnThread.
//
// A Thread cannot be copied: a copy would share, and close twice, the
// handle of the system thread.
class VANTORBASE_API Thread {
public:
    // The system's own thread priorities, handed to the system unchanged by
    // setPriority: -15, -2, -1, 0, 1, 2 and 15.
    static const int P_IDLE;
    static const int P_LOWEST;
    static const int P_BELOW_NORMAL;
    static const int P_NORMAL;
    static const int P_ABOVE_NORMAL;
    static const int P_HIGHEST;
    static const int P_CRITICAL;

    // No thread; the name "null".
    Thread();
    // No thread; a copy of `name`, a label for the application only.
    // Throws std::invalid_argument if `name` is null.
    explicit Thread(const wchar_t* name);
    Thread(const Thread&) = delete;
    Thread& operator=(const Thread&) = delete;
    // Waits for a thread still held to end, as StopThread does.
    ~Thread();

    // Throws std::invalid_argument if `name` is null (the name is kept).
    void setName(const wchar_t* name);
    std::wstring getName() const;

    // Sleeps on the calling thread (not on the object's thread); the count
    // is read as unsigned, so -1 sleeps without end.
    void sleep(long milliseconds);

    // Creates the system thread, which runs OnThread at once, and sets it
    // to P_NORMAL. Raises "Failed to create thread" (no thread held) or
    // "Failed to set priority" (the thread runs and is held). A thread that
    // the object still holds is first collected as StopThread does.
    void StartThread();
    // If a thread is held: waits for its end and closes its handle.
    // Otherwise, and when called again, does nothing.
    void StopThread();

    // Raise "Thread object is null" while no thread is held. setPriority
    // raises "Failed to set priority" if the system refuses the value;
    // suspend and resume ignore the system's answer.
    void setPriority(int priority);
    void suspend();
    void resume();

    // Opens the named mutex and waits for it; the count is read as unsigned
    // (-1 waits without end). True once the calling thread holds it; false
    // if the wait failed otherwise. Raises "Mutex not found" if no mutex has
    // that name, "Wait timed out" on timeout, and "Mutex not signaled" if
    // its holder ended without giving it back: the calling thread then holds
    // it even so. The handle opened for the call is closed before it returns.
    // Throws std::invalid_argument if `name` is null.
    bool wait(const wchar_t* name, long milliseconds);
    // Gives back the named mutex held by the calling thread. Raises "Invalid
    // mutex handle" if no mutex has that name and "Failed to release mutex"
    // if the calling thread does not hold it. Throws std::invalid_argument
    // if `name` is null.
    void release(const wchar_t* name);

    // The thread's body, run on the new thread; the base version does nothing.
    virtual void OnThread();

private:
    std::unique_ptr<vantorbase::detail::ThreadState> m_state;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_THREAD_H
