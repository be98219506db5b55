// Every public operation fed its bad inputs: each gives its documented clear
// error, or its documented result, and changes nothing else.
#include <gtest/gtest.h>

#include <climits>
#include <stdexcept>
#include <string>

#include "vantorbase/vantorbase.h"

namespace {

// A snapshot of a store's keys and types, to show that nothing changed.
std::string Snapshot(Property& store) {
    std::string all, key, type;
    for (int i = 0; i < store.getCount(); ++i) {
        store.getKey(i, key);
        if (!store.getType(i, type)) type = "-";
        all += key + ":" + type + ";";
    }
    return all;
}

}  // namespace

TEST(Misuse, PropertyRejectsNullTextsAndTakesExtremeIndexes) {
    Property store;
    store.SetValue("a", 1);
    const std::string before = Snapshot(store);
    const char* null = nullptr;
    const wchar_t* nullWide = nullptr;
    EXPECT_THROW(store.SetValue(null, 0, 1), std::invalid_argument);
    EXPECT_THROW(store.SetString("a", null), std::invalid_argument);
    EXPECT_THROW(store.SetString(null, "v"), std::invalid_argument);
    EXPECT_THROW(store.SetStringW(std::string("a"), 0, nullWide), std::invalid_argument);
    EXPECT_THROW(store.SetHandle(null, nullptr), std::invalid_argument);
    EXPECT_THROW(store.GetString(null), std::invalid_argument);
    EXPECT_THROW(store.GetPointer(null, 1), std::invalid_argument);
    EXPECT_THROW(store.GetHandle(null), std::invalid_argument);
    EXPECT_THROW(PropertyException(null, "k", 1), std::invalid_argument);
    EXPECT_EQ(Snapshot(store), before);
    EXPECT_EQ(store.GetValue("a"), 1);

    std::string out = "kept";
    EXPECT_FALSE(store.getKey(INT_MIN, out));
    EXPECT_FALSE(store.getType(INT_MAX, out));
    EXPECT_EQ(out, "kept");
    store.Erase("a", INT_MAX, INT_MIN);
    store.Erase("never", INT_MIN, INT_MAX);
    store.Erase("never", INT_MIN);
    EXPECT_EQ(Snapshot(store), before);

    store.SetValue("x", INT_MIN, 5);
    EXPECT_EQ(store.GetValue("x[-2147483648]"), 5);
    store.SetValue("", 7);  // an empty key is a key like any other
    EXPECT_EQ(store.GetValue(""), 7);
    EXPECT_THROW(store.GetValue("", 0), PropertyException);  // "[0]" was never written
}

TEST(Misuse, TextsWithEmbeddedNulsAndLoneSurrogates) {
    Property store;
    // Texts given as pointers end at their first NUL.
    const std::string embedded("ab\0cd", 5);
    store.SetString("k", embedded.c_str());
    EXPECT_EQ(store.GetString("k"), "ab");
    // Through the lower layer a std::string is stored whole.
    store.setValue("whole", embedded);
    EXPECT_EQ(store.GetString("whole"), embedded);

    // Invalid UTF-16 is stored and returned unchanged; only narrowing it
    // replaces what the code page cannot represent.
    const std::wstring lone = L"x\xD800y\xDC00";
    store.SetStringW("w", lone.c_str());
    EXPECT_EQ(store.GetStringW("w"), lone);
    std::string narrow;
    wstring2string(narrow, lone);
    EXPECT_EQ(narrow.size(), 4u);
    EXPECT_EQ(narrow[0], 'x');
    EXPECT_EQ(narrow[2], 'y');
    PropertyException e("op", std::string("k\xE9"));
    EXPECT_EQ(e.getMessageW(), L"op, Key= k\u00E9");
}

TEST(Misuse, ObserversIgnoreNullsAndOutOfRangePositions) {
    Model model;
    model.Attach(nullptr);
    model.Detach(nullptr);
    EXPECT_FALSE(model.IsExist(nullptr));
    EXPECT_EQ(model.GetObserverCount(), 0);
    EXPECT_EQ(model.GetObserver(INT_MIN), nullptr);
    EXPECT_EQ(model.GetObserver(INT_MAX), nullptr);
    model.Attach(&model);  // a subject observing itself ignores the call
    model.Notify();
    EXPECT_EQ(model.GetObserverCount(), 1);
    model.Detach(&model);

    struct NoView : View {
        using View::View;
        void OnUpdate(Subject*) override {}
        Controller* CreateController() override { return nullptr; }
    } view(&model);
    view.Initialize();  // a factory that makes nothing leaves no controller
    EXPECT_EQ(view.GetController(), nullptr);
    EXPECT_EQ(model.GetObserverCount(), 1);
}

TEST(Misuse, CommandsRejectEveryAccessTheirDescriptorDoesNotAllow) {
    Command command;
    command.AddParam(L"odd", 99, L"an unknown type code");
    command.AddParam(std::wstring(L"a\0b", 3), 0, L"a name with a NUL");
    command.AddParam(L"", 1, L"an empty name");
    const std::string before = std::to_string(command.getCount());
    int value = 0;
    std::string text;
    void* pointer = nullptr;
    for (int index : {0, INT_MIN, INT_MAX, -1, 3}) {
        EXPECT_THROW(command.SetParam(index, 1), CommandDescException);
        EXPECT_THROW(command.GetParam(index, text), CommandDescException);
        EXPECT_THROW(command.SetParam(index, pointer), CommandDescException);
        EXPECT_THROW(command.SetParam(index, INT_MIN, 1), CommandDescException);
        EXPECT_THROW(command.GetResult(index, value), CommandDescException);
        EXPECT_THROW(command.SetEventArraySize(index, 1), CommandDescException);
    }
    EXPECT_EQ(std::to_string(command.getCount()), before);
    CommandDesc* desc = command.GetCommandDesc();
    EXPECT_EQ(desc->GetParamTypeNameW(0), L"UNKNOWN");
    EXPECT_EQ(desc->GetParamNameW(INT_MIN), L"");
    EXPECT_EQ(desc->GetParamType(INT_MAX), -1);
    EXPECT_EQ(desc->GetParamAt(INT_MAX), nullptr);

    // A wide name is kept whole; its key is its narrow form, which ends at
    // the NUL. The empty name is the empty key.
    EXPECT_EQ(desc->GetParamNameW(1).size(), 3u);
    command.SetParam(1, 4);
    EXPECT_EQ(command.GetValue("a"), 4);
    command.SetParam(2, std::string("empty"));
    EXPECT_EQ(command.GetString(""), "empty");
}
