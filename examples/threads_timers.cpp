// Threads, named mutexes and timers: a worker thread takes a named mutex,
// counts and gives the mutex back, while the main thread runs two timers on
// the library's hidden window from its own message loop.
#include <windows.h>

#include <atomic>
#include <cstdio>

#include "vantorbase/vantorbase.h"

namespace {

constexpr wchar_t kLockName[] = L"VantorBaseExample.Counter";
constexpr int kRounds = 3;
constexpr int kFastTicks = 6;

// Counts in rounds; each round holds the named mutex while it counts.
class Counter : public Thread {
public:
    Counter() : Thread(L"counter") {}
    ~Counter() { StopThread(); }

    int total() const { return m_total.load(); }

    void OnThread() override {
        for (int round = 1; round <= kRounds; ++round) {
            try {
                if (!wait(kLockName, 5000)) return;
            } catch (const ThreadException& e) {
                std::printf("  worker: %ls\n", e.getMessage().c_str());
                return;
            }
            for (int i = 0; i < 1000; ++i) m_total.fetch_add(1);
            std::printf("  worker: round %d counted, total %d\n", round, m_total.load());
            release(kLockName);
            sleep(5);
        }
    }

private:
    std::atomic<int> m_total{0};
};

// Prints its ticks; the fast timer ends the message loop after kFastTicks.
class Ticker : public Timer {
public:
    Ticker(const char* name, bool endsLoop) : m_name(name), m_endsLoop(endsLoop) {}
    int ticks() const { return m_ticks; }

protected:
    void OnTimer(UINT, UINT_PTR, DWORD) override {
        ++m_ticks;
        std::printf("  %s timer: tick %d\n", m_name, m_ticks);
        if (m_endsLoop && m_ticks == kFastTicks) PostQuitMessage(0);
    }

private:
    const char* m_name;
    bool m_endsLoop;
    int m_ticks = 0;
};

}  // namespace

int main() {
    std::setvbuf(stdout, nullptr, _IONBF, 0);

    std::printf("A Mutex makes the named mutex exist:\n");
    Mutex lock(kLockName);
    std::printf("  mutex \"%ls\" %s\n", lock.getName().c_str(),
                lock.getMutexHandle() != nullptr ? "is open" : "failed");

    std::printf("The main thread takes it by name before the worker starts:\n");
    Thread self;
    self.wait(kLockName, 1000);
    std::printf("  main: holds the mutex\n");

    Counter worker;
    worker.StartThread();
    std::printf("  worker \"%ls\" started at normal priority\n", worker.getName().c_str());
    self.sleep(20);
    std::printf("  main: after 20 ms the worker has counted %d (it waits for the mutex)\n",
                worker.total());
    self.release(kLockName);
    std::printf("  main: gave the mutex back\n");

    std::printf("Two timers tick on the hidden window meanwhile:\n");
    VANTOR_Init();
    Ticker fast("fast", true);
    Ticker slow("slow", false);
    fast.StartTimer(30);
    slow.StartTimer(75);
    std::printf("  fast timer on: %s, slow timer on: %s\n", fast.IsTimerOn() ? "yes" : "no",
                slow.IsTimerOn() ? "yes" : "no");

    MSG message;
    while (GetMessageW(&message, nullptr, 0, 0) > 0) {
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
    fast.StopTimer();
    slow.StopTimer();
    std::printf("  message loop ended after %d fast and %d slow ticks\n", fast.ticks(), slow.ticks());

    worker.StopThread();
    std::printf("The worker has ended: total %d of %d\n", worker.total(), kRounds * 1000);

    std::printf("Errors are reported as ThreadException:\n");
    try {
        self.wait(L"VantorBaseExample.NoSuchMutex", 0);
    } catch (const ThreadException& e) {
        std::printf("  wait on an unknown name: %ls\n", e.getMessage().c_str());
    }
    try {
        self.release(kLockName);
    } catch (const ThreadException& e) {
        std::printf("  release of a mutex not held: %ls\n", e.getMessage().c_str());
    }

    lock.release();
    VANTOR_Exit();
    std::printf("Closed the mutex and the hidden window; timer window now %s\n",
                Timer::GetWindow() == nullptr ? "null" : "still set");
    return worker.total() == kRounds * 1000 && fast.ticks() == kFastTicks ? 0 : 1;
}
