// A small desktop module built on VantorBase: two commands, a model with a
// view and a controller, a worker thread that runs a command under a named
// mutex, and a timer on the library's hidden window whose ticks drive the
// model. Its message loop ends after a fixed number of ticks.
#include <windows.h>

#include <cstdio>
#include <string>

#include "vantorbase/vantorbase.h"

namespace studio {

constexpr wchar_t kLockName[] = L"VantorBaseStudio.MixLock";
constexpr int kTicks = 5;

// Mixes one channel to a level and describes what it did.
class MixCommand : public Command {
public:
    MixCommand() {
        SetDesc(L"Mixes a channel to a level");
        AddParam(L"level", 0, L"the new level, 0 to 100");
        AddParam(L"channel", 1, L"the channel's name");
        AddResult(L"summary", 1, L"what was done");
        AddResult(L"clipped", 0, L"set only when the level was clipped");
        AddEvent(L"overload", 0, L"raised by the mixer");
    }
    void Run() override {
        int level = 0;
        std::string channel;
        GetParam(0, level);
        GetParam(1, channel);
        if (level > 100) {
            SetResult(1, level - 100);
            level = 100;
        }
        SetResult(0, channel + " at " + std::to_string(level) + "%");
    }
};

// Averages a series of samples.
class AverageCommand : public Command {
public:
    AverageCommand() {
        SetDesc(L"Averages samples");
        AddParam(L"samples", 2, L"the samples");
        AddResult(L"average", 0, L"their mean");
    }
    void Run() override {
        const int count = GetParamArraySize(0);
        long sum = 0;
        for (int i = 0; i < count; ++i) {
            int sample = 0;
            GetParam(0, i, sample);
            sum += sample;
        }
        SetResult(0, count > 0 ? static_cast<int>(sum / count) : 0);
    }
};

// The meter's state: the latest tick and level.
class MeterModel : public Model {
public:
    void Tick(int tick, int level) {
        SetValue("tick", tick);
        SetValue("level", level);
        Notify();
    }
};

class MeterController : public Controller {
public:
    using Controller::Controller;

protected:
    void OnUpdate(Subject* subject) override {
        const int level = static_cast<Model*>(subject)->GetValue("level");
        std::printf("    controller: level %d is %s\n", level, level > 80 ? "high" : "fine");
    }
};

class MeterView : public View {
public:
    using View::View;

protected:
    void OnUpdate(Subject* subject) override {
        auto* model = static_cast<Model*>(subject);
        std::printf("    view: tick %d, level %d\n", model->GetValue("tick"), model->GetValue("level"));
    }
    Controller* CreateController() override { return new MeterController(this); }
};

// Runs the average command on its own thread while holding the named mutex.
class AverageWorker : public Thread {
public:
    explicit AverageWorker(AverageCommand& command) : Thread(L"average worker"), m_command(command) {}
    ~AverageWorker() { StopThread(); }
    void OnThread() override {
        if (!wait(kLockName, 5000)) return;
        m_command.SetRunFlag(true);
        m_command.Run();
        m_command.SetRunFlag(false);
        release(kLockName);
    }

private:
    AverageCommand& m_command;
};

// Drives the meter; ends the message loop after kTicks ticks.
class MeterTimer : public Timer {
public:
    explicit MeterTimer(MeterModel& model) : m_model(model) {}
    int ticks() const { return m_ticks; }

protected:
    void OnTimer(UINT, UINT_PTR, DWORD) override {
        ++m_ticks;
        std::printf("  tick %d:\n", m_ticks);
        m_model.Tick(m_ticks, 60 + 10 * m_ticks);
        if (m_ticks == kTicks) PostQuitMessage(0);
    }

private:
    MeterModel& m_model;
    int m_ticks = 0;
};

// Prints what a command reports when it stops running.
class Console : public Observer {
public:
    void Update(Subject* subject) override {
        auto* command = static_cast<Command*>(subject);
        std::printf("  %s stopped\n", command->GetCommandDesc()->GetCommandName().c_str());
    }
};

}  // namespace studio

int main() {
    using namespace studio;
    VANTOR_Init();  // this thread owns the hidden timer window

    MixCommand mix;
    AverageCommand average;
    std::printf("Commands of this module:\n\n%s\n\n%s\n\n", mix.GetCommandDesc()->GetDesc().c_str(),
                average.GetCommandDesc()->GetDesc().c_str());

    Console console;
    mix.Attach(&console);
    average.Attach(&console);

    std::printf("Mixing:\n");
    mix.SetParam(0, 120);
    mix.SetParam(1, std::string("drums"));
    mix.SetRunFlag(true);
    mix.Run();
    mix.SetRunFlag(false);
    std::string summary;
    int clipped = 0;
    mix.GetResult(0, summary);
    mix.GetResult(1, clipped);
    std::printf("  summary: %s, clipped by %d\n\n", summary.c_str(), clipped);

    std::printf("Errors the module provokes and catches:\n");
    try {
        mix.SetParam(1, 5);  // channel is a STRING
    } catch (const CommandDescException& e) {
        std::printf("  CommandDescException: %s\n", e.getMessage().c_str());
    }
    try {
        int overload = 0;
        mix.GetEvent(0, overload);  // never raised
    } catch (const PropertyException& e) {
        std::printf("  PropertyException: %s\n", e.getMessage().c_str());
    }
    try {
        Thread probe;
        probe.wait(L"VantorBaseStudio.NoSuchMutex", 0);
    } catch (const ThreadException& e) {
        std::wstring text = e.getMessage();
        std::string narrow;
        wstring2string(narrow, text);
        std::printf("  ThreadException: %s\n\n", narrow.c_str());
    }

    std::printf("Averaging on a worker thread under the named mutex:\n");
    Mutex lock(kLockName);
    const int samples[] = {40, 55, 70, 85};
    average.SetParamArraySize(0, 4);
    for (int i = 0; i < 4; ++i) average.SetParam(0, i, samples[i]);
    {
        AverageWorker worker(average);
        worker.StartThread();
        worker.StopThread();
    }
    int mean = 0;
    average.GetResult(0, mean);
    std::printf("  average of 40, 55, 70, 85: %d\n\n", mean);

    std::printf("Meter driven by a 50 ms timer:\n");
    MeterModel meter;
    int ticks = 0;
    {
        MeterView view(&meter);
        view.Initialize();
        MeterTimer timer(meter);
        timer.StartTimer(50);
        // The module's own message loop, with a deadline in case no tick comes.
        const ULONGLONG deadline = GetTickCount64() + 10000;
        MSG message;
        bool quit = false;
        while (!quit && GetTickCount64() < deadline) {
            MsgWaitForMultipleObjects(0, nullptr, FALSE, 100, QS_ALLINPUT);
            while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
                if (message.message == WM_QUIT) quit = true;
                DispatchMessageW(&message);
            }
        }
        timer.StopTimer();
        ticks = timer.ticks();
    }
    std::printf("  %d ticks; observers left on the meter: %d\n", ticks, meter.GetObserverCount());

    mix.Detach(&console);
    average.Detach(&console);
    lock.release();
    VANTOR_Exit();
    std::printf("Done.\n");
    return ticks == kTicks ? 0 : 1;
}
