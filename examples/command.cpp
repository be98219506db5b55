// A command at work, from the module that defines it to the observer that
// reads its result.
#include <cstdio>
#include <string>

#include "vantorbase/vantorbase.h"

namespace audio {

// A module's command: one parameter (the level) and one result (the state).
class VolumeCommand : public Command {
public:
    VolumeCommand() {
        SetDesc(L"Sets the level");
        AddParam(L"level", 0, L"new level");
        AddResult(L"state", 1, L"outcome");
        AddResult(L"peak", 1, L"never set");
    }
    void Run() override {
        int level = 0;
        GetParam(0, level);
        std::printf("  Run: setting the level to %d\n", level);
        SetResult(0, std::wstring(level > 100 ? L"clipped" : L"level set"));
    }
};

}  // namespace audio

namespace {

class StatusLine : public Observer {
public:
    void Update(Subject* subject) override {
        auto* command = static_cast<Command*>(subject);
        std::string state;
        command->GetResult(0, state);
        std::printf("  observer: %s stopped, state = %s\n",
                    command->GetCommandDesc()->GetCommandName().c_str(), state.c_str());
    }
};

}  // namespace

int main() {
    audio::VolumeCommand command;
    StatusLine status;
    command.Attach(&status);

    std::printf("Descriptor:\n%s\n\n", command.GetCommandDesc()->GetDesc().c_str());

    std::printf("Running with level 75:\n");
    command.SetParam(0, 75);
    command.SetRunFlag(true);
    command.Run();
    command.SetRunFlag(false);

    std::printf("A wrong-typed access:\n");
    try {
        command.SetParam(0, std::string("loud"));
    } catch (const CommandDescException& e) {
        std::printf("  caught CommandDescException: %s\n", e.getMessage().c_str());
    }
    std::printf("A result that was never set:\n");
    try {
        std::wstring peak;
        command.GetResult(1, peak);
    } catch (const PropertyException& e) {
        std::printf("  caught PropertyException: %s\n", e.getMessage().c_str());
    }
    command.Detach(&status);
    return 0;
}
