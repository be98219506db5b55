// Every case starts and ends with the library shut down, so that no case
// depends on the library-wide state another one left.
#include <gtest/gtest.h>

#include <cstring>
#include <new>
#include <vector>

#include "system_support.h"
#include "vantorbase/library.h"
#include "vantorbase/timer.h"

using system_test::AppWindow;
using system_test::PumpFor;
using system_test::PumpUntil;

namespace {

constexpr wchar_t kHiddenName[] = L"VantorBaseTimerWin";

class CountingTimer : public Timer {
public:
    explicit CountingTimer(int* calls = nullptr) : m_calls(calls) {}
    int ticks = 0;
    UINT lastMessage = 0;
    std::vector<UINT_PTR> ids;

protected:
    void OnTimer(UINT message, UINT_PTR timerId, DWORD) override {
        ++ticks;
        lastMessage = message;
        ids.push_back(timerId);
        if (m_calls) ++*m_calls;
    }

private:
    int* m_calls;
};

HINSTANCE LibraryModule() { return GetModuleHandleW(L"VantorBase.dll"); }

// The windows of class "VantorBaseTimerWin" that this process owns.
std::vector<HWND> HiddenWindows() {
    std::vector<HWND> found;
    EnumWindows(
        [](HWND window, LPARAM param) -> BOOL {
            DWORD pid = 0;
            GetWindowThreadProcessId(window, &pid);
            wchar_t name[64] = {};
            GetClassNameW(window, name, 64);
            if (pid == GetCurrentProcessId() && std::wcscmp(name, kHiddenName) == 0)
                reinterpret_cast<std::vector<HWND>*>(param)->push_back(window);
            return TRUE;
        },
        reinterpret_cast<LPARAM>(&found));
    return found;
}

bool ClassRegistered() {
    WNDCLASSW info;
    return GetClassInfoW(LibraryModule(), kHiddenName, &info) != 0;
}

class TimerTest : public ::testing::Test {
protected:
    void SetUp() override { Reset(); }
    void TearDown() override { Reset(); }
    static void Reset() {
        VANTOR_Exit();
        Timer::SetWindow(nullptr);
    }
};

}  // namespace

TEST_F(TimerTest, StartTimerWithoutInitMakesTheHiddenWindow) {
    EXPECT_TRUE(HiddenWindows().empty());
    EXPECT_EQ(Timer::GetWindow(), nullptr);
    CountingTimer timer;
    EXPECT_EQ(timer.GetTimerId(), reinterpret_cast<UINT_PTR>(static_cast<Timer*>(&timer)));
    timer.StopTimer();  // never started: stays off, makes nothing
    EXPECT_FALSE(timer.IsTimerOn());
    EXPECT_TRUE(HiddenWindows().empty());

    timer.StartTimer(10);
    EXPECT_TRUE(timer.IsTimerOn());
    const HWND window = Timer::GetWindow();
    ASSERT_NE(window, nullptr);
    EXPECT_EQ(HiddenWindows(), std::vector<HWND>{window});
    wchar_t title[64] = {};
    GetWindowTextW(window, title, 64);
    EXPECT_STREQ(title, kHiddenName);
    EXPECT_FALSE(IsWindowVisible(window));
    EXPECT_EQ(GetWindowThreadProcessId(window, nullptr), GetCurrentThreadId());
    EXPECT_EQ(reinterpret_cast<HINSTANCE>(GetWindowLongPtrW(window, GWLP_HINSTANCE)),
              LibraryModule());

    VANTOR_Init();  // already initialised: nothing happens
    EXPECT_EQ(HiddenWindows(), std::vector<HWND>{window});
    EXPECT_EQ(Timer::GetWindow(), window);

    ASSERT_TRUE(PumpUntil([&] { return timer.ticks >= 3; }, 3000)) << timer.ticks << " ticks";
    EXPECT_EQ(timer.lastMessage, static_cast<UINT>(WM_TIMER));
    timer.StopTimer();
    EXPECT_FALSE(timer.IsTimerOn());
    const int stopped = timer.ticks;
    PumpFor(100);
    EXPECT_EQ(timer.ticks, stopped) << "a stopped timer fired";
}

TEST_F(TimerTest, InitTwiceMakesOneWindowAndExitTwiceDestroysItOnce) {
    VANTOR_Exit();  // without VANTOR_Init: nothing
    EXPECT_TRUE(HiddenWindows().empty());

    AppWindow early;
    Timer::SetWindow(early.get());
    VANTOR_Init();
    const HWND window = Timer::GetWindow();
    ASSERT_NE(window, nullptr);
    EXPECT_NE(window, early.get()) << "the hidden window did not replace the earlier choice";
    VANTOR_Init();
    EXPECT_EQ(HiddenWindows(), std::vector<HWND>{window});
    EXPECT_TRUE(ClassRegistered());

    VANTOR_Exit();
    EXPECT_FALSE(IsWindow(window));
    EXPECT_EQ(Timer::GetWindow(), nullptr);
    EXPECT_FALSE(ClassRegistered());

    // The second exit touches nothing, not even a window chosen since.
    AppWindow app;
    Timer::SetWindow(app.get());
    VANTOR_Exit();
    EXPECT_TRUE(IsWindow(app.get()));
    EXPECT_EQ(Timer::GetWindow(), app.get());

    // A later init makes a new window.
    VANTOR_Init();
    EXPECT_EQ(HiddenWindows().size(), 1u);
    EXPECT_NE(Timer::GetWindow(), app.get());
}

TEST_F(TimerTest, TwoTimersGetTheirOwnIds) {
    CountingTimer first, second;
    EXPECT_NE(first.GetTimerId(), second.GetTimerId());
    first.StartTimer(10);
    second.StartTimer(15);
    ASSERT_TRUE(PumpUntil([&] { return first.ticks >= 3 && second.ticks >= 3; }, 3000));
    for (UINT_PTR id : first.ids) EXPECT_EQ(id, first.GetTimerId());
    for (UINT_PTR id : second.ids) EXPECT_EQ(id, second.GetTimerId());
}

TEST_F(TimerTest, RestartingChangesTheIntervalAndLeavesOneSystemTimer) {
    CountingTimer timer;
    timer.StartTimer(10);
    ASSERT_TRUE(PumpUntil([&] { return timer.ticks >= 3; }, 3000));
    timer.StartTimer(60000);
    EXPECT_TRUE(timer.IsTimerOn());
    const int before = timer.ticks;
    PumpFor(400);
    // A 10 ms timer left behind would tick some 40 times; one tick may have
    // been due as the timer was restarted.
    EXPECT_LE(timer.ticks - before, 1);
    timer.StartTimer(20);
    const int restarted = timer.ticks;
    EXPECT_TRUE(PumpUntil([&] { return timer.ticks >= restarted + 3; }, 3000));
}

TEST_F(TimerTest, AfterExitAStartedTimerNoLongerFiresYetReportsOn) {
    CountingTimer timer;
    timer.StartTimer(10);
    ASSERT_TRUE(PumpUntil([&] { return timer.ticks >= 2; }, 3000));
    VANTOR_Exit();
    const int atExit = timer.ticks;
    PumpFor(300);
    EXPECT_EQ(timer.ticks, atExit);
    EXPECT_TRUE(timer.IsTimerOn());
    EXPECT_EQ(Timer::GetWindow(), nullptr);
    timer.StopTimer();
    EXPECT_FALSE(timer.IsTimerOn());

    // Starting again makes a new hidden window.
    timer.StartTimer(10);
    EXPECT_TRUE(timer.IsTimerOn());
    EXPECT_EQ(HiddenWindows().size(), 1u);
    EXPECT_TRUE(PumpUntil([&] { return timer.ticks >= atExit + 2; }, 3000));
}

TEST_F(TimerTest, SetWindowAfterInitMovesLaterTimersThere) {
    VANTOR_Init();
    const HWND hidden = Timer::GetWindow();
    AppWindow app;
    ASSERT_NE(app.get(), nullptr);
    Timer::SetWindow(app.get());
    EXPECT_EQ(Timer::GetWindow(), app.get());

    CountingTimer timer;
    timer.StartTimer(10);
    std::vector<HWND> tickWindows;
    ASSERT_TRUE(PumpUntil([&] { return timer.ticks >= 3; }, 3000, [&](const MSG& msg) {
        if (msg.message == WM_TIMER && msg.wParam == timer.GetTimerId())
            tickWindows.push_back(msg.hwnd);
    }));
    for (HWND window : tickWindows) EXPECT_EQ(window, app.get());
    EXPECT_TRUE(IsWindow(hidden));
    timer.StopTimer();

    // Once the window is destroyed by others, timers stay off and it is forgotten.
    app.reset();
    timer.StartTimer(10);
    EXPECT_FALSE(timer.IsTimerOn());
    EXPECT_EQ(Timer::GetWindow(), nullptr);
    timer.StartTimer(10);
    EXPECT_FALSE(timer.IsTimerOn());

    AppWindow other;
    Timer::SetWindow(other.get());
    other.reset();
    EXPECT_EQ(Timer::GetWindow(), nullptr);
}

TEST_F(TimerTest, ATickRetrievedBeforeItsTimerStoppedOrWentIsNeverDelivered) {
    auto fetchTick = [](UINT_PTR id, MSG& msg) {
        const ULONGLONG deadline = GetTickCount64() + 3000;
        while (GetTickCount64() < deadline) {
            if (PeekMessageW(&msg, nullptr, WM_TIMER, WM_TIMER, PM_REMOVE) && msg.wParam == id)
                return true;
            MsgWaitForMultipleObjects(0, nullptr, FALSE, 10, QS_ALLINPUT);
        }
        return false;
    };
    int calls = 0;
    MSG msg;

    CountingTimer stopped(&calls);
    stopped.StartTimer(10);
    ASSERT_TRUE(fetchTick(stopped.GetTimerId(), msg));
    stopped.StopTimer();
    DispatchMessageW(&msg);
    EXPECT_EQ(calls, 0) << "a stopped timer was called";

    alignas(CountingTimer) unsigned char storage[sizeof(CountingTimer)];
    auto* gone = new (storage) CountingTimer(&calls);
    gone->StartTimer(10);
    ASSERT_TRUE(fetchTick(gone->GetTimerId(), msg));
    gone->~CountingTimer();
    // The storage is reused before the tick is dispatched: by an object
    // whose every virtual slot records a call and whose flags are all set.
    // (The system swallows faults inside timer callbacks, so reused memory
    // of any other content could hide a stale call.)
    static int staleCalls;
    staleCalls = 0;
    using Slot = void (*)(void*, UINT, UINT_PTR, DWORD);
    static Slot fakeTable[16];
    for (Slot& slot : fakeTable) slot = [](void*, UINT, UINT_PTR, DWORD) { ++staleCalls; };
    std::memset(storage, 0x01, sizeof storage);
    const Slot* table = fakeTable;
    std::memcpy(storage, &table, sizeof table);
    DispatchMessageW(&msg);
    EXPECT_EQ(staleCalls, 0) << "a destroyed timer was called through";
    EXPECT_EQ(calls, 0);
}

TEST_F(TimerTest, ATimerTheSystemRefusesIsNotReportedOn) {
    VANTOR_Init();
    // The desktop window is a window, but of another process: the system
    // sets no timer of ours on it.
    Timer::SetWindow(GetDesktopWindow());
    CountingTimer timer;
    timer.StartTimer(10);
    EXPECT_FALSE(timer.IsTimerOn());
    timer.StopTimer();
    Timer::SetWindow(nullptr);
}

TEST_F(TimerTest, AFailedHiddenWindowLeavesEveryTimerOff) {
    // A class of the library's name and module whose windows refuse to be
    // created makes the creation of the hidden window fail.
    WNDCLASSW refusing{};
    refusing.lpfnWndProc = [](HWND window, UINT message, WPARAM wParam, LPARAM lParam) -> LRESULT {
        if (message == WM_CREATE) return -1;
        return DefWindowProcW(window, message, wParam, lParam);
    };
    refusing.hInstance = LibraryModule();
    refusing.lpszClassName = kHiddenName;
    ASSERT_NE(RegisterClassW(&refusing), 0);

    AppWindow app;
    Timer::SetWindow(app.get());
    VANTOR_Init();
    EXPECT_EQ(Timer::GetWindow(), nullptr);
    EXPECT_TRUE(HiddenWindows().empty());
    CountingTimer timer;
    timer.StartTimer(10);
    EXPECT_FALSE(timer.IsTimerOn());
    PumpFor(100);
    EXPECT_EQ(timer.ticks, 0);

    // Shutting down leaves the class that the library did not register.
    VANTOR_Exit();
    EXPECT_TRUE(ClassRegistered());
    EXPECT_TRUE(UnregisterClassW(kHiddenName, LibraryModule()));
}
