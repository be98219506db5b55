#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "vantorbase/command.h"

namespace app {
// Declares one parameter, one result and one event of each type code 0 to 5.
class AllTypesCommand : public Command {
public:
    AllTypesCommand() {
        SetDesc(L"every type");
        for (int code = 0; code <= 5; ++code) {
            const std::wstring n = std::to_wstring(code);
            AddParam(L"p" + n, code, L"");
            AddResult(L"r" + n, code, L"");
            AddEvent(L"e" + n, code, L"");
        }
    }
};
}  // namespace app

namespace {

class Watcher : public Observer {
public:
    void Update(Subject* subject) override { seen.push_back(subject); }
    std::vector<Subject*> seen;
};

std::string DescFailure(const std::function<void()>& access) {
    try {
        access();
    } catch (const CommandDescException& e) {
        return e.getMessage();
    } catch (const PropertyException&) {
        return "PropertyException";
    }
    return "passed";
}

}  // namespace

TEST(Command, ValidatesEveryAccessAgainstTheEntryTypeCode) {
    app::AllTypesCommand command;
    // For each entry code 0..5: which accessor shapes pass validation. A
    // passing access may still find no value (PropertyException) or, for a
    // parameter text read, an empty text.
    struct Shape {
        const char* name;
        std::function<void(int)> param, result, event;
        std::vector<bool> accepts;  // by entry code 0..5
    };
    int i = 0;
    std::string s;
    std::wstring w;
    void* p = nullptr;
    const std::vector<Shape> shapes = {
        {"int", [&](int x) { command.SetParam(x, 1); }, [&](int x) { command.SetResult(x, 1); },
         [&](int x) { command.SetEvent(x, 1); }, {true, false, true, true, false, false}},
        {"text", [&](int x) { command.SetParam(x, std::wstring(L"t")); },
         [&](int x) { command.SetResult(x, std::string("t")); },
         [&](int x) { command.GetEvent(x, w); }, {false, true, false, true, false, false}},
        {"pointer", [&](int x) { command.SetParam(x, &i); }, [&](int x) { command.GetResult(x, p); },
         [&](int x) { command.SetEvent(x, nullptr); }, {false, false, false, false, true, false}},
        {"int element", [&](int x) { command.SetParam(x, 2, 5); },
         [&](int x) { command.GetResult(x, 0, i); }, [&](int x) { command.SetEvent(x, -1, 5); },
         {false, false, true, false, false, false}},
        {"text element", [&](int x) { command.GetParam(x, 1, s); },
         [&](int x) { command.SetResult(x, 1, std::wstring(L"t")); },
         [&](int x) { command.SetEvent(x, 1, std::string("t")); },
         {false, false, false, true, false, false}},
    };
    for (const Shape& shape : shapes) {
        for (int code = 0; code <= 5; ++code) {
            SCOPED_TRACE(std::string(shape.name) + " on code " + std::to_string(code));
            const bool ok = shape.accepts[static_cast<size_t>(code)];
            const std::string idx = ", idx= " + std::to_string(code);
            const auto check = [&](const std::function<void(int)>& access, const char* text) {
                const std::string outcome = DescFailure([&] { access(code); });
                if (ok) {
                    EXPECT_TRUE(outcome == "passed" || outcome == "PropertyException") << outcome;
                } else {
                    EXPECT_EQ(outcome, text + idx);
                }
            };
            check(shape.param, "Property::GetParam(key,value) Exception");
            check(shape.result, "Property::GetResult(key,value) Exception");
            check(shape.event, "Property::GetEvent(key,value) Exception");
        }
    }
    // Indexes outside the lists, in getters, setters and size operations.
    EXPECT_EQ(DescFailure([&] { command.GetParam(-1, i); }),
              "Property::GetParam(key,value) Exception, idx= -1");
    EXPECT_EQ(DescFailure([&] { command.SetResultArraySize(6, 3); }),
              "Property::GetResult(key,value) Exception, idx= 6");
    EXPECT_EQ(DescFailure([&] { command.GetEventArraySize(99); }),
              "Property::GetEvent(key,value) Exception, idx= 99");
    Command empty;
    EXPECT_EQ(DescFailure([&] { empty.GetParam(0, s); }),
              "Property::GetParam(key,value) Exception, idx= 0");
    EXPECT_EQ(DescFailure([&] { empty.SetResult(2, 7); }),
              "Property::GetResult(key,value) Exception, idx= 2");
}

TEST(Command, FailedAccessesChangeNothing) {
    app::AllTypesCommand command;
    command.SetParam(0, 5);
    int value = -1;
    std::string text = "kept";
    EXPECT_THROW(command.GetParam(0, text), CommandDescException);
    EXPECT_EQ(text, "kept");
    EXPECT_THROW(command.SetParam(0, &value), CommandDescException);
    EXPECT_EQ(command.getCount(), 1);
    EXPECT_THROW(command.GetParam(2, value), PropertyException);  // never set
    EXPECT_EQ(value, -1);
    void* pointer = &value;
    try {
        command.GetResult(4, pointer);
        FAIL();
    } catch (const PropertyException& e) {
        EXPECT_EQ(e.getMessage(), "Property::GetPointer(key) Exception, Key= r4");
    }
    EXPECT_EQ(pointer, &value);
    try {
        command.GetResultArraySize(2);
    } catch (PropertyException e) {
        EXPECT_EQ(e.getMessage(), "Property::GetValue(key) Exception, Key= r2");
    }
}

TEST(Command, ParameterTextsKeepTheirFormAndResultTextsAreWide) {
    app::AllTypesCommand command;
    std::string narrow = "kept";
    std::wstring wide = L"kept";
    command.GetParam(1, narrow);  // never set: empty, no exception
    EXPECT_EQ(narrow, "");
    command.SetParam(1, std::string("caf\xE9"));
    std::string type;
    EXPECT_TRUE(command.getType("p1", type));
    EXPECT_EQ(type, "string");
    command.GetParam(1, wide);
    EXPECT_EQ(wide, L"caf\u00E9");
    command.SetParam(1, std::wstring(L"\u20AC and \u4E2D"));
    EXPECT_TRUE(command.getType("p1", type));
    EXPECT_EQ(type, "wstring");
    command.GetParam(1, narrow);
    EXPECT_EQ(narrow, "\x80 and ?");
    command.SetParam(1, std::string("before\0after", 12));
    command.GetParam(1, narrow);
    EXPECT_EQ(narrow, "before");

    EXPECT_THROW(command.GetResult(1, narrow), PropertyException);
    try {
        command.GetResult(1, wide);
    } catch (const PropertyException& e) {
        EXPECT_EQ(e.getMessage(), "Property::GetString(key) Exception, Key= r1");
    }
    command.SetResult(1, std::string("caf\xE9"));
    EXPECT_TRUE(command.getType("r1", type));
    EXPECT_EQ(type, "wstring");
    command.GetResult(1, narrow);
    EXPECT_EQ(narrow, "caf\xE9");
    // A result does not fall back to a narrow record under its key.
    command.SetString("r1", "narrow");
    EXPECT_THROW(command.GetResult(1, wide), PropertyException);
    command.SetEvent(3, 4, std::string("elem"));
    command.GetEvent(3, 4, wide);
    EXPECT_EQ(wide, L"elem");
    EXPECT_THROW(command.GetEvent(3, 5, narrow), PropertyException);
}

TEST(Command, ArraysKeepTheirSizeUnderThePlainName) {
    app::AllTypesCommand command;
    EXPECT_THROW(command.GetParamArraySize(2), PropertyException);
    command.SetParamArraySize(2, 3);
    int value = 0;
    command.GetParam(2, value);
    EXPECT_EQ(value, 3);
    EXPECT_EQ(command.GetParamArraySize(2), 3);
    EXPECT_EQ(command.GetValue("p2"), 3);
    command.SetParam(2, 5, 9);  // beyond the size
    command.SetParam(2, -7, 1);
    command.GetParam(2, 5, value);
    EXPECT_EQ(value, 9);
    EXPECT_EQ(command.GetValue("p2[-7]"), 1);
    command.SetParamArraySize(2, 1);
    command.GetParam(2, 5, value);
    EXPECT_EQ(value, 9);

    command.SetParamArraySize(3, 2);
    command.SetParam(3, 0, std::string("zero"));
    command.SetParam(3, 1, std::wstring(L"one"));
    std::string narrow = "kept";
    command.GetParam(3, narrow);  // the plain name holds the size, not text
    EXPECT_EQ(narrow, "");
    command.GetParam(3, 1, narrow);
    EXPECT_EQ(narrow, "one");
}

TEST(Command, EntriesOfOneNameShareTheirValue) {
    Command command;
    command.AddParam(L"level", 0, L"");
    command.AddParam(L"level", 0, L"again");
    command.AddResult(std::string("level"), 0, L"");
    command.SetParam(0, 5);
    int value = 0;
    command.GetResult(0, value);
    EXPECT_EQ(value, 5);
    command.SetParam(1, 6);
    command.GetParam(0, value);
    EXPECT_EQ(value, 6);
}

TEST(Command, StopsNotifyAndFlagsAreItsOwn) {
    Command::COMMAND_TYPE = 0;
    Command command;
    EXPECT_FALSE(command.IsRunning());
    EXPECT_FALSE(command.IsShield());
    EXPECT_TRUE(command.CanExecute());
    EXPECT_EQ(command.GetInstance(), nullptr);
    EXPECT_EQ(command.GetCommandType(), 0);
    Command::COMMAND_TYPE = 7;
    Command later;
    Command::COMMAND_TYPE = 0;
    EXPECT_EQ(later.GetCommandType(), 7);
    EXPECT_EQ(command.GetCommandType(), 0);

    Watcher a, b;
    command.Attach(&a);
    command.Attach(&b);
    command.AddParam(L"v", 0, L"");
    command.SetParam(0, 1);  // values notify nobody
    command.SetRunFlag(true);
    EXPECT_TRUE(command.IsRunning());
    EXPECT_TRUE(a.seen.empty());
    command.SetRunFlag(false);
    command.SetRunFlag(false);  // notifies again, though not running
    command.Cancel();
    EXPECT_EQ(a.seen, (std::vector<Subject*>{&command, &command, &command}));
    EXPECT_EQ(b.seen.size(), 3u);
    command.EnableShield(true);
    command.EnableExecute(false);
    EXPECT_TRUE(command.IsShield());
    EXPECT_FALSE(command.CanExecute());
    EXPECT_EQ(a.seen.size(), 3u);
    EXPECT_EQ(command.GetCommandDesc(), command.GetCommandDesc());
    EXPECT_EQ(command.GetCommandDesc()->GetParamCount(), command.GetParamCount());

    struct Overriding : Command {
        void SetRunFlag(bool run) override { calls.push_back(run); }
        std::vector<bool> calls;
    } overriding;
    overriding.Cancel();
    EXPECT_EQ(overriding.calls, std::vector<bool>{false});
}

TEST(Command, CopiesShareStoreObserversAndDescriptor) {
    app::AllTypesCommand source;
    source.EnableShield(true);
    Watcher watcher;
    source.Attach(&watcher);
    {
        app::AllTypesCommand copy(source);
        EXPECT_TRUE(copy.IsShield());
        copy.SetParam(0, 42);
        int value = 0;
        source.GetParam(0, value);
        EXPECT_EQ(value, 42);
        copy.SetRunFlag(false);
        EXPECT_EQ(watcher.seen.size(), 1u);
        copy.AddParam(L"extra", 0, L"");
        EXPECT_EQ(source.GetParamCount(), 7);
        Command assigned;
        assigned = copy;
        EXPECT_EQ(assigned.GetCommandDesc()->GetCommandNameW(), L"app::AllTypesCommand");
    }
    EXPECT_EQ(source.GetCommandDesc()->GetParamNameW(6), L"extra");
    EXPECT_EQ(source.GetObserverCount(), 1);
}

TEST(Command, ValidationFailuresCrossTheLibraryBoundary) {
    Command command;
    try {
        command.SetParam(3, 1);
        FAIL();
    } catch (CommandDescException byValue) {
        EXPECT_EQ(byValue.getMessage(), "Property::GetParam(key,value) Exception, idx= 3");
    }
    try {
        command.SetEvent(0, std::wstring());
        FAIL();
    } catch (const CommandDescException& byReference) {
        EXPECT_EQ(byReference.getMessageW(), L"Property::GetEvent(key,value) Exception, idx= 0");
    }
}
