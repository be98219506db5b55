// A program outside the library's tree that derives from its classes.
#include <cstdio>
#include <string>

#include <vantorbase/vantorbase.h>

namespace consumer {
class Greeting : public Command {
public:
    Greeting() {
        SetDesc(L"Greets");
        AddParam(L"name", 1, L"whom");
        AddResult(L"text", 1, L"the greeting");
    }
    void Run() override {
        std::string name;
        GetParam(0, name);
        SetResult(0, "hello " + name);
    }
};
}  // namespace consumer

int main() {
    consumer::Greeting greeting;
    greeting.SetParam(0, std::string("world"));
    greeting.Run();
    std::string text;
    greeting.GetResult(0, text);
    const bool named = greeting.GetCommandDesc()->GetCommandName() == "consumer::Greeting";
    try {
        greeting.GetParam(5, text);
        return 1;
    } catch (const CommandDescException&) {
    }
    if (text != "hello world" || !named) return 1;
    std::printf("consumer works\n");
    return 0;
}
