#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

#include "debug_capture.h"
#include "vantorbase/property.h"

TEST(PropertyException, ComposesItsMessage) {
    EXPECT_EQ(PropertyException("Property::GetValue(key) Exception", "x").getMessage(),
              "Property::GetValue(key) Exception, Key= x");
    EXPECT_EQ(PropertyException("op", "x", 12).getMessage(), "op, Key= x, idx= 12");
    EXPECT_EQ(PropertyException("op", "x", -3).getMessage(), "op, Key= x, idx= -3");
    EXPECT_EQ(PropertyException("op", "caf\xE9").getMessageW(), L"op, Key= caf\u00E9");
    EXPECT_THROW(PropertyException(nullptr, "x"), std::invalid_argument);
}

TEST(PropertyException, EveryCopyKeepsItsOwnCompleteMessage) {
    PropertyException first("first", "a");
    PropertyException copy(first);
    {
        PropertyException other("other", "b");
        PropertyException assigned("assigned", "c");
        assigned = other;
        EXPECT_EQ(assigned.getMessage(), "other, Key= b");
    }
    // Making and destroying other exceptions leaves these messages alone.
    EXPECT_EQ(first.getMessage(), "first, Key= a");
    EXPECT_EQ(copy.getMessage(), "first, Key= a");
    EXPECT_EQ(copy.getMessageW(), L"first, Key= a");
}

TEST(PropertyException, CrossesTheLibraryBoundaryByValueAndByReference) {
    Property store;
    try {
        store.GetValue("Volume");
        FAIL() << "no exception";
    } catch (PropertyException caught) {
        // A further failing read inside the handler does not disturb it.
        EXPECT_THROW(store.GetString("other"), PropertyException);
        EXPECT_EQ(caught.getMessage(), "Property::GetValue(key) Exception, Key= Volume");
    }
    PropertyException kept("unset", "");
    try {
        store.GetStringW("Items", 3);
        FAIL() << "no exception";
    } catch (const PropertyException& caught) {
        kept = caught;
        EXPECT_EQ(caught.getMessageW(), L"Property::GetString(key) Exception, Key= Items[3]");
    }
    EXPECT_EQ(kept.getMessage(), "Property::GetString(key) Exception, Key= Items[3]");
}

TEST(PropertyException, WritesNothingToTheDebuggerBeforeTheLibraryIsInitialised) {
    DebugCapture capture;
    OutputDebugStringW(L"probe");  // proves that the capture sees output
    ASSERT_EQ(capture.Texts(), std::vector<std::wstring>{L"probe"});
    capture.Reset();
    Property store;
    EXPECT_THROW(store.GetValue("missing"), PropertyException);
    PropertyException direct("op", "k", 1);
    EXPECT_TRUE(capture.Texts().empty()) << "debugger output: " << capture.Texts().size();
}
