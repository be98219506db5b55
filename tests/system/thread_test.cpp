#include <gtest/gtest.h>

#include <atomic>
#include <stdexcept>

#include "system_support.h"
#include "vantorbase/thread.h"

using system_test::Event;
using system_test::FailureOf;
using system_test::Worker;

TEST(Thread, RunsItsBodyOnAnotherThreadAndStopThreadCollectsIt) {
    std::atomic<DWORD> bodyThread{0};
    std::atomic<int> runs{0};
    Worker worker([&] {
        Sleep(50);  // still running when StopThread is called
        bodyThread = GetCurrentThreadId();
        ++runs;
    });
    EXPECT_EQ(worker.getName(), L"null");
    worker.StartThread();
    worker.StopThread();
    EXPECT_EQ(runs, 1) << "StopThread returned before the body ended";
    EXPECT_NE(bodyThread, 0u);
    EXPECT_NE(bodyThread, GetCurrentThreadId());
    worker.StopThread();  // harmless when idle
    EXPECT_EQ(FailureOf([&] { worker.setPriority(Thread::P_NORMAL); }), L"Thread object is null");
    EXPECT_EQ(FailureOf([&] { worker.suspend(); }), L"Thread object is null");
    EXPECT_EQ(FailureOf([&] { worker.resume(); }), L"Thread object is null");

    // Idle again, the object starts a new thread.
    worker.StartThread();
    worker.StopThread();
    EXPECT_EQ(runs, 2);

    // The base body returns at once.
    Thread plain(L"plain");
    EXPECT_EQ(plain.getName(), L"plain");
    plain.setName(L"renamed");
    EXPECT_EQ(plain.getName(), L"renamed");
    plain.StartThread();
    plain.StopThread();
    plain.StopThread();
}

TEST(Thread, StartingAgainCollectsTheThreadStillHeld) {
    std::atomic<int> finished{0};
    Worker worker([&] {
        Sleep(100);
        ++finished;
    });
    worker.StartThread();
    worker.StartThread();
    EXPECT_EQ(finished, 1) << "the first thread was not collected before the second started";
    worker.StopThread();
    EXPECT_EQ(finished, 2);
}

TEST(Thread, SetPriorityHandsTheSystemValueToTheThread) {
    Event started, go;
    std::atomic<int> later{THREAD_PRIORITY_ERROR_RETURN};
    Worker worker([&] {
        SetEvent(started.handle);
        if (!go.WaitFor(5000)) return;
        later = GetThreadPriority(GetCurrentThread());
    });
    worker.StartThread();
    ASSERT_TRUE(started.WaitFor(5000));
    worker.setPriority(Thread::P_BELOW_NORMAL);
    EXPECT_EQ(FailureOf([&] { worker.setPriority(12345); }), L"Failed to set priority");
    SetEvent(go.handle);
    worker.StopThread();
    EXPECT_EQ(later, THREAD_PRIORITY_BELOW_NORMAL);
}

TEST(ThreadException, CarriesItsMessageThroughCopiesAndNullTextsAreRejected) {
    ThreadException first(L"Failed to create thread");
    ThreadException copy(first);
    ThreadException assigned(L"Wait timed out");
    {
        ThreadException other(L"Mutex not found");
        assigned = other;
    }
    EXPECT_EQ(first.getMessage(), L"Failed to create thread");
    EXPECT_EQ(copy.getMessage(), L"Failed to create thread");
    EXPECT_EQ(assigned.getMessage(), L"Mutex not found");
    EXPECT_THROW(ThreadException(nullptr), std::invalid_argument);

    EXPECT_THROW(Thread(nullptr), std::invalid_argument);
    Thread thread(L"kept");
    EXPECT_THROW(thread.setName(nullptr), std::invalid_argument);
    EXPECT_EQ(thread.getName(), L"kept");
    EXPECT_THROW(thread.wait(nullptr, 0), std::invalid_argument);
    EXPECT_THROW(thread.release(nullptr), std::invalid_argument);
}
