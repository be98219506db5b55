#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "vantorbase/property.h"

namespace {

std::vector<std::string> Keys(Property& store) {
    std::vector<std::string> keys;
    std::string key;
    for (int i = 0; i < store.getCount(); ++i) {
        EXPECT_TRUE(store.getKey(i, key));
        keys.push_back(key);
    }
    return keys;
}

std::string TypeOf(Property& store, const std::string& key) {
    std::string type = "none";
    store.getType(key, type);
    return type;
}

template <typename Read>
std::string FailureOf(Read read) {
    try {
        read();
    } catch (const PropertyException& e) {
        return e.getMessage();
    }
    return "no exception";
}

}  // namespace

TEST(Property, EnumeratesKeysInByteOrderWithEmptySlots) {
    Property store;
    std::string out = "untouched";
    EXPECT_EQ(store.getCount(), 0);
    EXPECT_FALSE(store.getKey(0, out));
    EXPECT_FALSE(store.getType(0, out));
    EXPECT_FALSE(store.getType("a", out));
    EXPECT_EQ(out, "untouched");

    store.SetValue("b", 1);
    store.SetValue("a", 2);
    store.SetValue("c", 3);
    store.SetValue("B", 4);
    store.SetValue("ab", 5);
    store.SetValue("Items", 10, 6);
    store.SetValue("Items", 2, 7);
    store.SetValue("\xE9t\xE9", 8);  // bytes from 0x80 up sort after ASCII
    EXPECT_EQ(Keys(store), (std::vector<std::string>{"B", "Items[10]", "Items[2]", "a", "ab", "b",
                                                     "c", "\xE9t\xE9"}));

    store.Erase("a");
    EXPECT_EQ(store.getCount(), 8);
    EXPECT_TRUE(store.getKey(3, out));
    EXPECT_EQ(out, "a");
    out = "untouched";
    EXPECT_FALSE(store.getType(3, out));
    EXPECT_FALSE(store.getType("a", out));
    EXPECT_FALSE(store.getKey(-1, out));
    EXPECT_FALSE(store.getKey(8, out));
    EXPECT_FALSE(store.getType(INT_MAX, out));
    EXPECT_EQ(out, "untouched");
    EXPECT_TRUE(store.getType(4, out));
    EXPECT_EQ(out, "int");

    store.Erase("never written");
    EXPECT_EQ(store.getCount(), 8);
}

TEST(Property, EnumerationStaysRightWhileKeysAreInsertedAroundTheCursor) {
    Property store;
    for (char c = 'b'; c <= 'y'; c += 2) store.SetValue(std::string(1, c), c);
    std::string key;
    ASSERT_TRUE(store.getKey(5, key));
    EXPECT_EQ(key, "l");
    store.SetValue("a", 0);  // before the cursor
    store.SetValue("z", 0);  // after it
    ASSERT_TRUE(store.getKey(5, key));
    EXPECT_EQ(key, "j");
    ASSERT_TRUE(store.getKey(6, key));
    EXPECT_EQ(key, "l");
    ASSERT_TRUE(store.getKey(0, key));
    EXPECT_EQ(key, "a");
    ASSERT_TRUE(store.getKey(store.getCount() - 1, key));
    EXPECT_EQ(key, "z");
    ASSERT_TRUE(store.getKey(2, key));
    EXPECT_EQ(key, "d");
}

TEST(Property, StoresEachKindAndReadsOnlyItsOwnType) {
    Property store;
    store.SetValue("n", 5);
    EXPECT_EQ(store.GetValue("n"), 5);
    std::string text = "kept";
    EXPECT_FALSE(store.getValue("n", text));
    EXPECT_EQ(text, "kept");
    EXPECT_EQ(FailureOf([&] { store.GetString("n"); }), "Property::GetString(key) Exception, Key= n");

    store.SetString("n", "five");
    EXPECT_EQ(TypeOf(store, "n"), "string");
    EXPECT_EQ(store.GetString(std::string("n")), "five");
    EXPECT_EQ(FailureOf([&] { store.GetValue("n"); }), "Property::GetValue(key) Exception, Key= n");
    EXPECT_EQ(FailureOf([&] { store.GetStringW("n"); }),
              "Property::GetString(key) Exception, Key= n");

    store.SetStringW("w", L"wide\u20AC");
    std::wstring wide;
    EXPECT_TRUE(store.getValue("w", wide));
    EXPECT_EQ(wide, L"wide\u20AC");
    EXPECT_EQ(store.GetStringW("w"), L"wide\u20AC");
    EXPECT_EQ(FailureOf([&] { store.GetString("w"); }), "Property::GetString(key) Exception, Key= w");
    EXPECT_EQ(TypeOf(store, "w"), "wstring");

    // Pointers and handles are one kind; the value is never dereferenced.
    void* const bogus = reinterpret_cast<void*>(static_cast<uintptr_t>(0x1234));
    store.SetHandle("h", bogus);
    EXPECT_EQ(store.GetPointer("h"), bogus);
    store.SetPointer("h", nullptr);
    EXPECT_EQ(store.GetHandle("h"), nullptr);
    EXPECT_EQ(TypeOf(store, "h"), "IntPtr");
    int* raw = reinterpret_cast<int*>(bogus);
    EXPECT_TRUE(store.getValue("h", raw));
    EXPECT_EQ(raw, nullptr);
    EXPECT_EQ(FailureOf([&] { store.GetPointer("n"); }),
              "Property::GetPointer(key) Exception, Key= n");
    EXPECT_EQ(FailureOf([&] { store.GetHandle("missing"); }),
              "Property::GetHandle(key) Exception, Key= missing");

    // A caller's buffer may change after the write; the store keeps its copy.
    char buffer[] = "original";
    store.SetString("copy", buffer);
    buffer[0] = 'X';
    EXPECT_EQ(store.GetString("copy"), "original");

    // Writing the same kind again replaces the value.
    store.SetValue("n", 1);
    store.SetValue("n", 2);
    EXPECT_EQ(store.GetValue("n"), 2);
    store.SetString("copy", "second, longer than any short-string buffer");
    EXPECT_EQ(store.GetString("copy"), "second, longer than any short-string buffer");
}

TEST(Property, ElementKeysAreOrdinaryEntries) {
    EXPECT_EQ(Property::GetArrayKey("Items", -1), "Items[-1]");
    EXPECT_EQ(Property::GetArrayKey("", 0), "[0]");
    EXPECT_EQ(Property::GetArrayKey("Items", INT_MAX), "Items[2147483647]");
    EXPECT_EQ(Property::GetArrayKey("Items", INT_MIN), "Items[-2147483648]");

    Property store;
    store.SetValue("Items", 3, 7);
    EXPECT_EQ(store.GetValue("Items[3]"), 7);
    EXPECT_EQ(store.GetValue("Items", 3), 7);
    EXPECT_EQ(store.GetValue(std::string("Items"), 3), 7);
    EXPECT_EQ(store.getCount(), 1);  // no entry for the bare name
    EXPECT_EQ(FailureOf([&] { store.GetValue("Items"); }),
              "Property::GetValue(key) Exception, Key= Items");
    EXPECT_EQ(FailureOf([&] { store.GetValue("Items", 4); }),
              "Property::GetValue(key) Exception, Key= Items[4]");

    store.SetString(std::string("Names"), 0, "zero");
    store.SetStringW("Names", 1, L"one");
    store.SetPointer(std::string("Ptrs"), -2, &store);
    EXPECT_EQ(store.GetString("Names", 0), "zero");
    EXPECT_EQ(store.GetStringW(std::string("Names"), 1), L"one");
    EXPECT_EQ(store.GetHandle("Ptrs", -2), &store);
    EXPECT_EQ(store.GetPointer("Ptrs[-2]"), &store);
}

TEST(Property, EraseReleasesValuesAndKeepsTheirKeys) {
    Property store;
    for (int i = 0; i < 5; ++i) store.SetValue("Items", i, i);
    store.Erase("Items", 0, 2);
    for (int i = 0; i < 3; ++i) EXPECT_EQ(TypeOf(store, Property::GetArrayKey("Items", i)), "none");
    EXPECT_EQ(store.GetValue("Items", 3), 3);
    EXPECT_EQ(store.getCount(), 5);

    store.Erase("Items", 4, 3);  // first > last: nothing
    EXPECT_EQ(store.GetValue("Items", 4), 4);
    store.Erase("Items", 4);
    EXPECT_EQ(TypeOf(store, "Items[4]"), "none");

    // Ranges that end at the largest int, narrow and wide.
    store.SetValue("Items", INT_MAX, 1);
    store.SetValue("Items", INT_MAX - 1, 1);
    store.Erase("Items", INT_MAX - 1, INT_MAX);
    EXPECT_EQ(TypeOf(store, Property::GetArrayKey("Items", INT_MAX)), "none");
    EXPECT_EQ(TypeOf(store, Property::GetArrayKey("Items", INT_MAX - 1)), "none");
    store.SetValue("Items", INT_MAX, 1);
    store.Erase("Items", INT_MIN, INT_MAX);
    EXPECT_EQ(TypeOf(store, Property::GetArrayKey("Items", INT_MAX)), "none");
    EXPECT_EQ(store.getCount(), 7);

    store.Clear();
    EXPECT_EQ(store.getCount(), 7);
    store.SetValue("Items", 1, 9);
    EXPECT_EQ(store.GetValue("Items", 1), 9);
}

TEST(Property, ElementRangesEraseOnlyCanonicalElementKeys) {
    // The same erasures through a narrow range (looked up one by one) and a
    // wide one (a scan of the name's keys) must touch the same keys.
    for (const bool wide : {false, true}) {
        SCOPED_TRACE(wide ? "wide range" : "narrow range");
        Property store;
        const std::vector<std::string> decoys = {
            "Items[07]", "Items[-0]", "Items[+7]", "Items[ 7]", "Items[7]x", "Items[7][1]",
            "Items[]",   "Items[-]",  "Items",     "Items7",    "Itemz[7]", "Items[99999999999]"};
        for (const auto& key : decoys) store.SetValue(key, 1);
        for (int i = -3; i <= 9; ++i) store.SetValue("Items", i, i);
        // Padding keys make the store larger than the narrow range, so the
        // narrow case really takes the lookup path.
        for (int i = 0; i < 40; ++i) store.SetValue("pad" + std::to_string(i), i);
        if (wide)
            store.Erase("Items", -2, INT_MAX);
        else
            store.Erase("Items", -2, 20);
        for (const auto& key : decoys) EXPECT_EQ(TypeOf(store, key), "int") << key;
        EXPECT_EQ(store.GetValue("Items", -3), -3);
        for (int i = -2; i <= 9; ++i) EXPECT_EQ(TypeOf(store, Property::GetArrayKey("Items", i)), "none");
    }
}

TEST(Property, CopiesShareOneStoreAndDestructionEmptiesIt) {
    Property original;
    original.SetValue("a", 1);
    {
        Property copy(original);
        copy.SetString("b", "two");
        EXPECT_EQ(original.GetString("b"), "two");
        Property assigned;
        assigned.SetValue("own", 3);
        Property keeper(assigned);
        assigned = copy;
        assigned.SetValue("c", 3);
        EXPECT_EQ(original.GetValue("c"), 3);
        // The store `assigned` left is untouched for its other sharer.
        EXPECT_EQ(keeper.GetValue("own"), 3);
        Property& alias = assigned;
        assigned = alias;
        EXPECT_EQ(assigned.GetValue("a"), 1);
    }
    // The sharers are gone: every key remains, every slot is empty.
    EXPECT_EQ(original.getCount(), 3);
    std::string type;
    for (int i = 0; i < 3; ++i) EXPECT_FALSE(original.getType(i, type));
    original.SetValue("a", 4);
    EXPECT_EQ(original.GetValue("a"), 4);
}

