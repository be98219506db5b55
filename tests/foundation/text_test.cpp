#include <gtest/gtest.h>

#include <string>

#include "vantorbase/text.h"

namespace {

std::wstring Widen(const std::string& in) {
    std::wstring out = L"previous";
    string2wstring(out, in);
    return out;
}

std::string Narrow(const std::wstring& in) {
    std::string out = "previous";
    wstring2string(out, in);
    return out;
}

}  // namespace

// The test programs run with the ANSI code page 1252 (see tools/wine-env.sh).
TEST(TextConversion, ConvertsThroughTheAnsiCodePage) {
    EXPECT_EQ(Widen("Volume"), L"Volume");
    EXPECT_EQ(Widen("caf\xE9 \x80"), L"caf\u00E9 \u20AC");
    EXPECT_EQ(Narrow(L"caf\u00E9 \u20AC"), "caf\xE9 \x80");
    // A character code page 1252 lacks becomes its default character.
    EXPECT_EQ(Narrow(L"a\u4E2Db"), "a?b");
}

TEST(TextConversion, ReplacesTheOutputAndStopsAtTheFirstNul) {
    EXPECT_EQ(Widen(""), L"");
    EXPECT_EQ(Narrow(L""), "");
    EXPECT_EQ(Widen(std::string("ab\0cd", 5)), L"ab");
    EXPECT_EQ(Narrow(std::wstring(L"ab\0cd", 5)), "ab");
}

TEST(TextConversion, RoundTripsLongTextsOfEveryRepresentableByte) {
    std::string all;
    for (int round = 0; round < 8; ++round)
        for (int byte = 1; byte < 256; ++byte) all += static_cast<char>(byte);
    std::wstring wide;
    string2wstring(wide, all);
    EXPECT_EQ(wide.size(), all.size());
    std::string back;
    wstring2string(back, wide);
    // Code page 1252 leaves five bytes undefined; they map to themselves.
    EXPECT_EQ(back, all);
}
