#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "debug_capture.h"
#include "vantorbase/library.h"
#include "vantorbase/property.h"
#include "vantorbase/timer.h"

namespace {

const std::wstring kBanner = L"\n=====================\n";

std::vector<std::wstring> Announced(const std::wstring& message) {
    return {kBanner, message, kBanner};
}

class NoTicks : public Timer {
protected:
    void OnTimer(UINT, UINT_PTR, DWORD) override {}
};

}  // namespace

TEST(LibraryBanner, FollowsVantorInitAndVantorExit) {
    VANTOR_Exit();
    DebugCapture capture;
    OutputDebugStringW(L"probe");  // proves that the capture sees output
    ASSERT_EQ(capture.Texts(), std::vector<std::wstring>{L"probe"});
    capture.Reset();

    PropertyException("op", "before");
    EXPECT_TRUE(capture.Texts().empty());

    VANTOR_Init();
    PropertyException("Property::GetValue(key) Exception", "Volume");
    EXPECT_EQ(capture.Texts(), Announced(L"Property::GetValue(key) Exception, Key= Volume"));
    capture.Reset();
    Property store;
    EXPECT_THROW(store.GetString("Items", 3), PropertyException);
    EXPECT_EQ(capture.Texts(), Announced(L"Property::GetString(key) Exception, Key= Items[3]"));

    VANTOR_Exit();
    capture.Reset();
    PropertyException("op", "after");
    EXPECT_THROW(store.GetValue("missing"), PropertyException);
    EXPECT_TRUE(capture.Texts().empty());
}

TEST(LibraryBanner, TheFirstStartedTimerSwitchesItOn) {
    VANTOR_Exit();
    DebugCapture capture;
    NoTicks timer;
    PropertyException("op", "idle");
    EXPECT_TRUE(capture.Texts().empty()) << "constructing a timer initialised the library";
    timer.StartTimer(60000);
    PropertyException("op", "k", -3);
    EXPECT_EQ(capture.Texts(), Announced(L"op, Key= k, idx= -3"));
    timer.StopTimer();
    VANTOR_Exit();
}
