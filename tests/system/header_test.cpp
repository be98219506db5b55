// Compiled as a caller that has not asked for NOMINMAX: the public headers
// must neither define the min and max macros nor leave NOMINMAX behind. The
// header with Win32 types comes first, before any standard header (the
// MinGW C++ library defines NOMINMAX by itself).
#undef NOMINMAX
#include "vantorbase/timer.h"

#if defined(min) || defined(max)
#error "vantorbase/timer.h defines min or max"
#endif
#if defined(NOMINMAX)
#error "vantorbase/timer.h leaves NOMINMAX defined"
#endif

#include "vantorbase/vantorbase.h"

#if defined(min) || defined(max)
#error "the VantorBase headers define min or max"
#endif

#include <gtest/gtest.h>

#include <algorithm>

TEST(PublicHeaders, LeaveStdMinAndMaxUsable) {
    EXPECT_EQ(std::min(3, 4), 3);
    EXPECT_EQ(std::max(3, 4), 4);
    EXPECT_EQ(sizeof(UINT_PTR), sizeof(void*));
}
