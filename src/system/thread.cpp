#include <stdexcept>
#include <string>

#include "system/handle.h"
#include "vantorbase/thread.h"

namespace vantorbase::detail {

// What a Thread owns: the system thread it holds, if any, and its name.
struct ThreadState {
    UniqueHandle thread;
    std::wstring name;
};

}  // namespace vantorbase::detail

namespace {

const wchar_t* RequireName(const wchar_t* name, const char* operation) {
    if (name == nullptr) throw std::invalid_argument(std::string(operation) + ": null name");
    return name;
}

// The start routine of every system thread: runs the object's body.
DWORD WINAPI RunThread(LPVOID parameter) {
    static_cast<Thread*>(parameter)->OnThread();
    return 0;
}

// Opens the named mutex for the duration of one wait or release.
vantorbase::detail::UniqueHandle OpenNamedMutex(const wchar_t* name) {
    return vantorbase::detail::UniqueHandle(OpenMutexW(MUTEX_ALL_ACCESS, FALSE, name));
}

}  // namespace

const int Thread::P_IDLE = THREAD_PRIORITY_IDLE;
const int Thread::P_LOWEST = THREAD_PRIORITY_LOWEST;
const int Thread::P_BELOW_NORMAL = THREAD_PRIORITY_BELOW_NORMAL;
const int Thread::P_NORMAL = THREAD_PRIORITY_NORMAL;
const int Thread::P_ABOVE_NORMAL = THREAD_PRIORITY_ABOVE_NORMAL;
const int Thread::P_HIGHEST = THREAD_PRIORITY_HIGHEST;
const int Thread::P_CRITICAL = THREAD_PRIORITY_TIME_CRITICAL;

Thread::Thread() : m_state(new vantorbase::detail::ThreadState{{}, L"null"}) {}

Thread::Thread(const wchar_t* name)
    : m_state(new vantorbase::detail::ThreadState{{}, RequireName(name, "Thread::Thread")}) {}

Thread::~Thread() { StopThread(); }

void Thread::setName(const wchar_t* name) { m_state->name = RequireName(name, "Thread::setName"); }

std::wstring Thread::getName() const { return m_state->name; }

void Thread::sleep(long milliseconds) { Sleep(static_cast<DWORD>(milliseconds)); }

void Thread::StartThread() {
    // A thread still held runs on this object: collect it before the object
    // takes another, so that no thread outlives the object unobserved.
    StopThread();
    DWORD threadId = 0;
    m_state->thread.reset(CreateThread(nullptr, 0, &RunThread, this, 0, &threadId));
    if (!m_state->thread) throw ThreadException(L"Failed to create thread");
    setPriority(P_NORMAL);
}

void Thread::StopThread() {
    if (!m_state->thread) return;
    WaitForSingleObject(m_state->thread.get(), INFINITE);
    m_state->thread.reset();
}

void Thread::setPriority(int priority) {
    if (!m_state->thread) throw ThreadException(L"Thread object is null");
    if (SetThreadPriority(m_state->thread.get(), priority) == 0)
        throw ThreadException(L"Failed to set priority");
}

void Thread::suspend() {
    if (!m_state->thread) throw ThreadException(L"Thread object is null");
    SuspendThread(m_state->thread.get());
}

void Thread::resume() {
    if (!m_state->thread) throw ThreadException(L"Thread object is null");
    ResumeThread(m_state->thread.get());
}

bool Thread::wait(const wchar_t* name, long milliseconds) {
    const auto mutex = OpenNamedMutex(RequireName(name, "Thread::wait"));
    if (!mutex) throw ThreadException(L"Mutex not found");
    switch (WaitForSingleObject(mutex.get(), static_cast<DWORD>(milliseconds))) {
    case WAIT_OBJECT_0:
        return true;
    case WAIT_ABANDONED:
        throw ThreadException(L"Mutex not signaled");
    case WAIT_TIMEOUT:
        throw ThreadException(L"Wait timed out");
    default:
        return false;
    }
}

void Thread::release(const wchar_t* name) {
    const auto mutex = OpenNamedMutex(RequireName(name, "Thread::release"));
    if (!mutex) throw ThreadException(L"Invalid mutex handle");
    if (ReleaseMutex(mutex.get()) == 0) throw ThreadException(L"Failed to release mutex");
}

void Thread::OnThread() {}
