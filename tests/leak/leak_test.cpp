// Runs each family's representative work ten thousand times and checks that
// neither the live bytes of the C runtime heap nor the open handles grow.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "process_probe.h"
#include "vantorbase/vantorbase.h"

namespace {

constexpr int kWarmUp = 200;
constexpr int kIterations = 10000;
// Growth that bookkeeping outside the scenario may cause (the test
// framework's own buffers, the heap's block rounding). A leak of a single
// smallest allocation per iteration is 160 kB or more.
constexpr long long kHeapSlackBytes = 8 * 1024;
constexpr long long kHandleSlack = 2;

struct Growth {
    long long bytes;
    long long handles;
};

Growth MeasureGrowth(const std::function<void()>& scenario) {
    for (int i = 0; i < kWarmUp; ++i) scenario();
    const long long bytesBefore = probe::LiveHeapBytes();
    const long long handlesBefore = probe::OpenHandleCount();
    for (int i = 0; i < kIterations; ++i) scenario();
    const long long bytesAfter = probe::LiveHeapBytes();
    const long long handlesAfter = probe::OpenHandleCount();
    EXPECT_GE(bytesBefore, 0) << "the heap could not be walked";
    EXPECT_GE(handlesBefore, 0) << "the handle table could not be read";
    return {bytesAfter - bytesBefore, handlesAfter - handlesBefore};
}

void ExpectNoGrowth(const std::function<void()>& scenario) {
    const Growth growth = MeasureGrowth(scenario);
    EXPECT_LE(growth.bytes, kHeapSlackBytes) << "live heap bytes grew";
    EXPECT_LE(growth.handles, kHandleSlack) << "open handles grew";
}

}  // namespace

TEST(LeakCheck, DetectsOneLeakedAllocationPerIteration) {
    std::vector<char*> leaked;
    leaked.reserve(kWarmUp + kIterations);
    const Growth growth = MeasureGrowth([&] { leaked.push_back(new char[1]); });
    for (char* block : leaked) delete[] block;
    EXPECT_GT(growth.bytes, kHeapSlackBytes);
}

TEST(LeakCheck, PropertyStoresWithCopiesAndDestruction) {
    ExpectNoGrowth([] {
        Property store;
        store.SetValue("Volume", 75);
        store.SetString("Device", "a device name longer than a short string");
        store.SetStringW("Title", L"a title longer than any short-string buffer");
        store.SetPointer("Owner", &store);
        for (int i = 0; i < 4; ++i) store.SetString("Items", i, "an element value of some length");
        Property copy(store);
        Property assigned;
        assigned.SetValue("own", 1);
        assigned = copy;
        copy.SetValue("Volume", 40);
        (void)store.GetString("Device");
        (void)assigned.GetStringW("Title");
        try {
            store.GetValue("Device");
        } catch (const PropertyException& e) {
            (void)e.getMessageW();
        }
        store.Erase("Items", 0, 1);
        store.Erase("Items", INT_MIN, INT_MAX);
        store.Erase("Title");
        std::string key;
        for (int i = 0; i < store.getCount(); ++i) store.getKey(i, key);
        store.Clear();
        std::wstring wide;
        string2wstring(wide, std::string(300, 'x'));
        wstring2string(key, wide);
    });
}

namespace {

class Sink : public Observer {
public:
    void Update(Subject*) override { ++calls; }
    int calls = 0;
};

class Named : public Command {
public:
    Named() {
        SetDesc(L"a command with a description of some length");
        AddParam(L"level", 0, L"the level to set");
        AddParam(L"label", 1, L"a label");
        AddResult(L"state", 1, L"what happened");
        AddEvent(L"items", 3, L"");
    }
};

class Empty : public Thread {
public:
    ~Empty() { StopThread(); }
    void OnThread() override {}
};

class Quiet : public Timer {
protected:
    void OnTimer(UINT, UINT_PTR, DWORD) override {}
};

}  // namespace

TEST(LeakCheck, ObserversAttachNotifyAndDetachWithCopies) {
    ExpectNoGrowth([] {
        Model model;
        Sink a, b;
        model.Attach(&a);
        Model copy(model);
        copy.Attach(&b);
        model.Notify();
        copy.Detach(&a);
        Subject assigned;
        assigned = copy;
        assigned.Notify(nullptr);
        (void)model.GetSubjectNameW();
        model.Detach(&b);
    });
}

TEST(LeakCheck, CommandsDeclareSetGetAndCopy) {
    ExpectNoGrowth([] {
        Named command;
        command.SetParam(0, 75);
        command.SetParam(1, std::string("a label longer than a short string"));
        command.SetResult(0, std::wstring(L"a state longer than a short string"));
        command.SetEventArraySize(0, 2);
        command.SetEvent(0, 1, std::string("an element"));
        Named copy(command);
        int level = 0;
        copy.GetParam(0, level);
        std::string text;
        copy.GetResult(0, text);
        (void)command.GetCommandDesc()->GetDescW();
        try {
            command.GetParam(7, level);
        } catch (const CommandDescException& e) {
            (void)e.getMessageW();
        }
        Command assigned;
        assigned = copy;
        assigned.SetRunFlag(false);
    });
}

TEST(LeakCheck, ThreadsStartAndStop) {
    ExpectNoGrowth([] {
        Empty thread;
        thread.setName(L"a thread name");
        thread.StartThread();
        thread.StopThread();
    });
}

TEST(LeakCheck, MutexesCreateWaitAndRelease) {
    const std::wstring name = L"VantorBaseLeak." + std::to_wstring(GetCurrentProcessId());
    ExpectNoGrowth([&] {
        Mutex mutex(name.c_str());
        Mutex copy(mutex);
        Thread self;
        self.wait(name.c_str(), 1000);
        self.release(name.c_str());
        mutex.create(name.c_str());
        copy.release();
        mutex.release();
    });
}

TEST(LeakCheck, TimersStartAndStop) {
    VANTOR_Init();
    ExpectNoGrowth([] {
        Quiet timer;
        timer.StartTimer(1000);
        timer.StartTimer(500);
        timer.StopTimer();
    });
    VANTOR_Exit();
}
