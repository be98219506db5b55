#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

#include "system_support.h"
#include "vantorbase/mutex.h"
#include "vantorbase/thread.h"

using system_test::Event;
using system_test::FailureOf;
using probe::OpenMutexHandleCount;
using system_test::UniqueName;
using system_test::Worker;

namespace {

HANDLE HandleOf(Mutex& mutex) { return reinterpret_cast<HANDLE>(mutex.getMutexHandle()); }

}  // namespace

TEST(NamedMutex, UnknownNamesRaiseMutexNotFoundAndInvalidMutexHandle) {
    const std::wstring name = UniqueName(L"unknown");
    Thread thread;
    EXPECT_EQ(FailureOf([&] { thread.wait(name.c_str(), 0); }), L"Mutex not found");
    EXPECT_EQ(FailureOf([&] { thread.release(name.c_str()); }), L"Invalid mutex handle");
}

TEST(NamedMutex, WaitTakesAFreeMutexAndReleaseGivesItBack) {
    const std::wstring name = UniqueName(L"free");
    Mutex mutex(name.c_str());
    Thread thread;
    EXPECT_TRUE(thread.wait(name.c_str(), 0));
    EXPECT_TRUE(thread.wait(name.c_str(), 0));  // the holder may take it again
    thread.release(name.c_str());
    thread.release(name.c_str());
    EXPECT_EQ(FailureOf([&] { thread.release(name.c_str()); }), L"Failed to release mutex");

    // Given back, another thread can take it.
    bool taken = false;
    Worker other([&] {
        taken = other.wait(name.c_str(), 0);
        other.release(name.c_str());
    });
    other.StartThread();
    other.StopThread();
    EXPECT_TRUE(taken);
    mutex.release();
}

TEST(NamedMutex, AMutexHeldElsewhereTimesOutAndCannotBeReleasedHere) {
    const std::wstring name = UniqueName(L"held");
    Mutex mutex(name.c_str());
    Event held, done;
    Worker holder([&] {
        if (!holder.wait(name.c_str(), 0)) return;
        SetEvent(held.handle);
        done.WaitFor(5000);
        holder.release(name.c_str());
    });
    holder.StartThread();
    ASSERT_TRUE(held.WaitFor(5000));
    Thread here;
    EXPECT_EQ(FailureOf([&] { here.wait(name.c_str(), 0); }), L"Wait timed out");
    EXPECT_EQ(FailureOf([&] { here.wait(name.c_str(), 30); }), L"Wait timed out");
    EXPECT_EQ(FailureOf([&] { here.release(name.c_str()); }), L"Failed to release mutex");
    SetEvent(done.handle);
    holder.StopThread();
    EXPECT_TRUE(here.wait(name.c_str(), 0));
    here.release(name.c_str());
    mutex.release();
}

TEST(NamedMutex, AnAbandonedMutexRaisesMutexNotSignaledAndPassesToTheCaller) {
    const std::wstring name = UniqueName(L"abandoned");
    Mutex mutex(name.c_str());
    bool taken = false;
    Worker holder([&] { taken = holder.wait(name.c_str(), 0); });  // ends still holding it
    holder.StartThread();
    holder.StopThread();
    ASSERT_TRUE(taken);

    Thread here;
    EXPECT_EQ(FailureOf([&] { here.wait(name.c_str(), 2000); }), L"Mutex not signaled");
    // The caller holds it now: a third thread cannot take it until it is given back.
    std::wstring whileHeld;
    Worker third([&] { whileHeld = FailureOf([&] { third.wait(name.c_str(), 0); }); });
    third.StartThread();
    third.StopThread();
    EXPECT_EQ(whileHeld, L"Wait timed out");
    EXPECT_NO_THROW(here.release(name.c_str()));
    bool takenAfter = false;
    Worker fourth([&] {
        takenAfter = fourth.wait(name.c_str(), 0);
        fourth.release(name.c_str());
    });
    fourth.StartThread();
    fourth.StopThread();
    EXPECT_TRUE(takenAfter);
    mutex.release();
}

TEST(NamedMutex, WaitAndReleaseLeaveNoHandleOpen) {
    const std::wstring name = UniqueName(L"count");
    Mutex mutex(name.c_str());
    Thread thread;
    const long long before = OpenMutexHandleCount();
    ASSERT_GT(before, 0) << "the handle table cannot be read";
    for (int i = 0; i < 10000; ++i) {
        thread.wait(name.c_str(), 0);
        thread.release(name.c_str());
    }
    EXPECT_EQ(OpenMutexHandleCount(), before);
    // Failing calls close their handle too.
    const long long beforeFailures = OpenMutexHandleCount();
    for (int i = 0; i < 100; ++i) FailureOf([&] { thread.release(name.c_str()); });
    EXPECT_EQ(OpenMutexHandleCount(), beforeFailures);
    mutex.release();
}

TEST(Mutex, TwoObjectsOfOneNameShareTheSystemMutex) {
    const std::wstring name = UniqueName(L"shared");
    Mutex first(name.c_str());
    Mutex second(name.c_str());
    ASSERT_NE(first.getMutexHandle(), nullptr);
    ASSERT_NE(second.getMutexHandle(), nullptr);
    EXPECT_NE(first.getMutexHandle(), second.getMutexHandle());
    EXPECT_EQ(second.getName(), name);

    Event held, done;
    Worker holder([&] {
        if (WaitForSingleObject(HandleOf(first), 0) != WAIT_OBJECT_0) return;
        SetEvent(held.handle);
        done.WaitFor(5000);
        ReleaseMutex(HandleOf(first));
    });
    holder.StartThread();
    ASSERT_TRUE(held.WaitFor(5000));
    EXPECT_EQ(WaitForSingleObject(HandleOf(second), 0), static_cast<DWORD>(WAIT_TIMEOUT));
    SetEvent(done.handle);
    holder.StopThread();
    first.release();
    second.release();
}

TEST(Mutex, CreateReplacesTheHandleAndTheName) {
    const std::wstring oldName = UniqueName(L"old");
    const std::wstring newName = UniqueName(L"new");
    Mutex mutex(oldName.c_str());
    const long long before = OpenMutexHandleCount();
    ASSERT_GE(before, 1) << "the handle table cannot be read";
    mutex.create(newName.c_str());
    EXPECT_EQ(OpenMutexHandleCount(), before) << "the old handle was not closed";
    EXPECT_EQ(mutex.getName(), newName);
    Thread thread;
    // The old handle was the only one: its mutex is gone.
    EXPECT_EQ(FailureOf([&] { thread.wait(oldName.c_str(), 0); }), L"Mutex not found");
    EXPECT_TRUE(thread.wait(newName.c_str(), 0));
    thread.release(newName.c_str());

    EXPECT_THROW(mutex.create(nullptr), std::invalid_argument);
    EXPECT_EQ(mutex.getName(), newName);
    EXPECT_NE(mutex.getMutexHandle(), nullptr);
    mutex.release();
    EXPECT_EQ(mutex.getMutexHandle(), nullptr);
    mutex.release();
    EXPECT_EQ(OpenMutexHandleCount(), before - 1);
}

TEST(Mutex, ANameOfAnotherKindOfObjectRaisesFailedToCreateMutex) {
    const std::wstring name = UniqueName(L"event");
    HANDLE event = CreateEventW(nullptr, TRUE, FALSE, name.c_str());
    ASSERT_NE(event, nullptr);
    EXPECT_EQ(FailureOf([&] { Mutex failed(name.c_str()); }), L"Failed to create mutex");

    const std::wstring good = UniqueName(L"good");
    Mutex mutex(good.c_str());
    EXPECT_EQ(FailureOf([&] { mutex.create(name.c_str()); }), L"Failed to create mutex");
    EXPECT_EQ(mutex.getMutexHandle(), nullptr);
    EXPECT_EQ(mutex.getName(), name);
    EXPECT_THROW(Mutex(nullptr), std::invalid_argument);
    CloseHandle(event);
}

TEST(Mutex, CopiesShareOneHandleThatIsClosedOnce) {
    const std::wstring name = UniqueName(L"copies");
    const long long before = OpenMutexHandleCount();
    ASSERT_GE(before, 0) << "the handle table cannot be read";
    Mutex original(name.c_str());
    Mutex copy(original);
    Mutex assigned;
    assigned = original;
    EXPECT_EQ(copy.getMutexHandle(), original.getMutexHandle());
    EXPECT_EQ(assigned.getMutexHandle(), original.getMutexHandle());
    EXPECT_EQ(OpenMutexHandleCount(), before + 1);

    copy.release();
    EXPECT_EQ(original.getMutexHandle(), nullptr);
    EXPECT_EQ(assigned.getMutexHandle(), nullptr);
    EXPECT_EQ(OpenMutexHandleCount(), before);
    original.release();
    assigned.release();

    // A handle opened after the release is not closed by a stale copy.
    HANDLE probe = CreateEventW(nullptr, TRUE, FALSE, nullptr);
    original.release();
    EXPECT_NE(WaitForSingleObject(probe, 0), static_cast<DWORD>(WAIT_FAILED));
    CloseHandle(probe);

    // A new name through one copy is the name of all.
    const std::wstring renamed = UniqueName(L"renamed");
    assigned.create(renamed.c_str());
    EXPECT_EQ(original.getName(), renamed);
    EXPECT_EQ(copy.getMutexHandle(), assigned.getMutexHandle());
    copy.release();
}

TEST(Mutex, TheDestructorLeavesTheNamedMutexOpen) {
    const std::wstring name = UniqueName(L"kept");
    { Mutex scoped(name.c_str()); }
    Thread thread;
    EXPECT_TRUE(thread.wait(name.c_str(), 0)) << "the destructor closed the handle";
    thread.release(name.c_str());
}
