// Threads, named mutexes and timers against the raw system calls they wrap.
#include <windows.h>

#include <algorithm>
#include <string>

#include "harness.h"
#include "vantorbase/vantorbase.h"

namespace {

constexpr wchar_t kBenchMutex[] = L"VantorBaseBench.Mutex";

class Quick : public Thread {
public:
    void OnThread() override {}
};

DWORD WINAPI ReturnAtOnce(LPVOID) { return 0; }

class Counting : public Timer {
public:
    int ticks = 0;

protected:
    void OnTimer(UINT, UINT_PTR, DWORD) override { ++ticks; }
};

}  // namespace

VANTORBASE_BENCH_GROUP(system_thread) {
    const double raw = bench::Measure([](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            DWORD id = 0;
            HANDLE thread = CreateThread(nullptr, 0, &ReturnAtOnce, nullptr, 0, &id);
            WaitForSingleObject(thread, INFINITE);
            CloseHandle(thread);
        }
    });
    bench::ReportBaseline("CreateThread+WaitForSingleObject+CloseHandle", raw);
    Quick quick;
    const double wrapped = bench::Measure([&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            quick.StartThread();
            quick.StopThread();
        }
    });
    bench::Report("Thread::StartThread+StopThread", wrapped,
                  "CreateThread+WaitForSingleObject+CloseHandle", raw);
}

// Named mutex calls go through the system's object manager (the wineserver
// under Wine), whose speed drifts during a run; the three cases are measured
// in interleaved rounds and each keeps its best.
VANTORBASE_BENCH_GROUP(system_mutex) {
    Mutex lock(kBenchMutex);
    Thread self;
    const bench::Body raw = [](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            HANDLE mutex = OpenMutexW(MUTEX_ALL_ACCESS, FALSE, kBenchMutex);
            WaitForSingleObject(mutex, INFINITE);
            ReleaseMutex(mutex);
            CloseHandle(mutex);
        }
    };
    // The system calls that wait and release make: each opens the mutex by
    // its name and closes it again.
    const bench::Body rawPerCall = [](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            HANDLE mutex = OpenMutexW(MUTEX_ALL_ACCESS, FALSE, kBenchMutex);
            WaitForSingleObject(mutex, INFINITE);
            CloseHandle(mutex);
            mutex = OpenMutexW(MUTEX_ALL_ACCESS, FALSE, kBenchMutex);
            ReleaseMutex(mutex);
            CloseHandle(mutex);
        }
    };
    const bench::Body wrapped = [&](std::int64_t iterations) {
        for (std::int64_t it = 0; it < iterations; ++it) {
            self.wait(kBenchMutex, -1);
            self.release(kBenchMutex);
        }
    };
    double rawNs = 1e300, rawPerCallNs = 1e300, wrappedNs = 1e300;
    for (int round = 0; round < 3; ++round) {
        rawNs = std::min(rawNs, bench::Measure(raw));
        rawPerCallNs = std::min(rawPerCallNs, bench::Measure(rawPerCall));
        wrappedNs = std::min(wrappedNs, bench::Measure(wrapped));
    }
    const char* const single = "OpenMutexW+WaitForSingleObject+ReleaseMutex+CloseHandle";
    const char* const twice = "the same, opening and closing for wait and for release";
    bench::ReportBaseline(single, rawNs);
    bench::ReportBaseline(twice, rawPerCallNs);
    bench::Report("Thread::wait+release", wrappedNs, single, rawNs);
    bench::Report("Thread::wait+release", wrappedNs, twice, rawPerCallNs);
    lock.release();
}

// Not a ratio: how many ticks a 10 ms timer delivers in one second of
// message pumping, against the 100 its interval asks for.
VANTORBASE_BENCH_GROUP(system_timer) {
    VANTOR_Init();
    Counting timer;
    timer.StartTimer(10);
    const ULONGLONG end = GetTickCount64() + 1000;
    MSG message;
    for (ULONGLONG now = GetTickCount64(); now < end; now = GetTickCount64()) {
        MsgWaitForMultipleObjects(0, nullptr, FALSE, static_cast<DWORD>(end - now), QS_ALLINPUT);
        while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) DispatchMessageW(&message);
    }
    timer.StopTimer();
    VANTOR_Exit();
    bench::Note("Timer at 10 ms pumped for 1 s: " + std::to_string(timer.ticks) +
                " ticks of 100 asked for");
}
