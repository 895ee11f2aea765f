#include "monitor/OsVersionCode.h"

#include <gtest/gtest.h>

namespace quendra::monitor {
namespace {

struct Case {
  platform::OsVersion version;
  std::int32_t code;
};

class OsVersionCode : public testing::TestWithParam<Case> {};

TEST_P(OsVersionCode, Is_the_number_of_the_version) {
  EXPECT_EQ(OsVersionCodeOf(GetParam().version), GetParam().code);
}

INSTANTIATE_TEST_SUITE_P(Known, OsVersionCode,
                         testing::Values(Case{{0, 3, 10}, 32}, Case{{0, 0, 0}, 32}, Case{{1, 4, 0}, 95},
                                         Case{{1, 4, 10}, 98}, Case{{2, 3, 51}, 351}, Case{{2, 3, 0}, 351},
                                         Case{{2, 4, 0}, 40}, Case{{2, 4, 9}, 40}, Case{{2, 5, 0}, 2000},
                                         Case{{2, 5, 1}, 2002}));

// A combination that is not listed and a platform of any other number stay 0.
INSTANTIATE_TEST_SUITE_P(Unlisted, OsVersionCode,
                         testing::Values(Case{{1, 4, 90}, 0}, Case{{1, 4, 1}, 0}, Case{{2, 5, 2}, 0},
                                         Case{{2, 6, 0}, 0}, Case{{2, 10, 0}, 0}, Case{{2, 2, 0}, 0},
                                         Case{{3, 5, 1}, 0}, Case{{0xFFFFFFFF, 0, 0}, 0}));

} // namespace
} // namespace quendra::monitor
