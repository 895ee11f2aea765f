#include "foundation/OsVersion.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::foundation {
namespace {

using Told = platform::OsVersion;

struct KnownVersion {
  Told told;
  std::int32_t code;
  const char16_t* name;
};

/// A version before it is described.
const OsVersion kBefore{.code = 77, .name = u"before"};

struct OsVersionTable : testing::TestWithParam<KnownVersion> {};

TEST_P(OsVersionTable, Gives_the_number_and_the_name_of_the_version) {
  OsVersion version = kBefore;

  Describe(GetParam().told, version);

  EXPECT_EQ(version.code, GetParam().code);
  EXPECT_EQ(version.name, GetParam().name);
}

INSTANTIATE_TEST_SUITE_P(Listed, OsVersionTable,
                         testing::Values(KnownVersion{{0, 3, 10}, 32, u"Win 32"},
                                         KnownVersion{{0, 0, 0}, 32, u"Win 32"},
                                         KnownVersion{{1, 4, 0}, 95, u"Windows 95"},
                                         KnownVersion{{1, 4, 10}, 98, u"Windows 98"},
                                         KnownVersion{{2, 3, 51}, 351, u"Windows NT 3.51"},
                                         KnownVersion{{2, 3, 0}, 351, u"Windows NT 3.51"},
                                         KnownVersion{{2, 4, 0}, 40, u"Windows NT 4.0"},
                                         KnownVersion{{2, 4, 9}, 40, u"Windows NT 4.0"},
                                         KnownVersion{{2, 5, 0}, 2000, u"Windows 2000"},
                                         KnownVersion{{2, 5, 1}, 2002, u"Windows XP"}));

INSTANTIATE_TEST_SUITE_P(OfAnotherKind, OsVersionTable,
                         testing::Values(KnownVersion{{3, 5, 1}, 0, u"Unknown"},
                                         KnownVersion{{0xFFFFFFFF, 0, 0}, 0, u"Unknown"}));

// Of a known kind, but not listed: left alone.
INSTANTIATE_TEST_SUITE_P(
    Unlisted, OsVersionTable,
    testing::Values(KnownVersion{{1, 4, 90}, 77, u"before"}, KnownVersion{{1, 4, 1}, 77, u"before"},
                    KnownVersion{{2, 5, 2}, 77, u"before"}, KnownVersion{{2, 6, 0}, 77, u"before"},
                    KnownVersion{{2, 10, 0}, 77, u"before"}, KnownVersion{{2, 2, 0}, 77, u"before"}));

struct OsVersionTest : testing::Test {
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  OsVersion version = kBefore;
};

TEST_F(OsVersionTest, Version_and_build_are_told_without_blanks) {
  machine.system.Version = {2, 5, 1, 2600};

  EXPECT_TRUE(ReadOsVersion(machine.system, desktop, version));

  EXPECT_EQ(version.version, u"5.1");
  EXPECT_EQ(version.build, u"2600");
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(OsVersionTest, A_version_that_the_system_does_not_tell_is_told_in_a_box) {
  machine.system.FailVersion = true;

  EXPECT_FALSE(ReadOsVersion(machine.system, desktop, version));

  using Box = forms::headless::HeadlessDesktop::Box;
  EXPECT_EQ(desktop.Boxes,
            std::vector{(Box{u"An error occured while trying to get the OS version and information.\r"
                             u"Click OK to continue.",
                             0x30, u"  Error Getting OS Information"})});
  EXPECT_EQ(version.code, 77);
}

} // namespace
} // namespace quendra::foundation
