#include "platform/PassedOnSystem.h"
#include "provisioning/remote_access/MdlDunFixture.h"

#include <array>

namespace quendra::provisioning {
namespace {

struct MdlDunErrors : MdlDunFixture {
  MdlDunErrors() {
    ras.ErrorTexts[601] = "The port handle is invalid.";
    machine.system.MessageTexts[600] = "An operation is pending.";
  }
};

TEST_F(MdlDunErrors, No_error_is_not_told) {
  EXPECT_EQ(dun.ReportRasError(0, u"RasDial", kTrue16), kFalse16);

  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunErrors, Six_hundred_is_an_error_of_the_system) {
  EXPECT_EQ(dun.ReportRasError(600, u"RasDial", kTrue16), kTrue16);

  ExpectOneBox(RasErrorBox(u"RasDial", u"600", u"An operation is pending."));
  EXPECT_EQ(ras.Count("RasGetErrorStringA"), 0);
}

TEST_F(MdlDunErrors, Six_hundred_and_one_is_an_error_of_remote_access) {
  EXPECT_EQ(dun.ReportRasError(601, u"RasDial", kTrue16), kTrue16);

  ExpectOneBox(RasErrorBox(u"RasDial", u"601", u"The port handle is invalid."));
}

TEST_F(MdlDunErrors, The_box_is_told_to_the_letter) {
  dun.ReportRasError(691, u"RasDial", kTrue16);

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"The following error occured while calling the RasDial RAS API:\r\r"
                                   u"Error Number = 691\rError Description = "
                                   u"The user name or the password was refused.",
                                   0x30, u"  RAS API Error"}}));
}

TEST_F(MdlDunErrors, A_number_that_remote_access_does_not_know_is_not_told_and_counts_as_none) {
  EXPECT_EQ(dun.ReportRasError(9999, u"RasDial", kTrue16), kFalse16);

  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunErrors, A_text_that_remote_access_cannot_get_is_told_as_unknown) {
  ras.Refuse("RasGetErrorStringA", 8);

  EXPECT_EQ(dun.ReportRasError(691, u"RasDial", kTrue16), kTrue16);

  ExpectOneBox(RasErrorBox(u"RasDial", u"691",
                           u"Unknown Error  (RasGetErrorString API Failed To Retrieve Error Information)"));
}

TEST_F(MdlDunErrors, A_text_that_the_system_cannot_get_is_told_as_unknown) {
  EXPECT_EQ(dun.ReportRasError(599, u"RasDial", kTrue16), kTrue16);

  ExpectOneBox(RasErrorBox(u"RasDial", u"599",
                           u"Unknown Error  (FormatMessage API Failed To Retrieve Error Information)"));
}

TEST_F(MdlDunErrors, An_error_that_is_not_to_be_shown_counts_all_the_same) {
  EXPECT_EQ(dun.ReportRasError(691, u"RasDial", kFalse16), kTrue16);
  EXPECT_EQ(dun.ReportRasError(5, u"RasDial", 1), kTrue16) << "only -1 shows";

  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunErrors, A_number_beyond_31_bits_is_negative_and_the_systems) {
  machine.system.MessageTexts[0x80004005] = "Unspecified error";

  EXPECT_EQ(dun.ReportRasError(0x80004005, u"RasDial", kTrue16), kTrue16);

  ExpectOneBox(RasErrorBox(u"RasDial", u"-2147467259", u"Unspecified error"));
}

TEST_F(MdlDunErrors, A_Hebrew_text_is_read_by_the_code_page) {
  ras.ErrorTexts[691] = "\xF9\xE2\xE9\xE0\xE4";

  dun.ReportRasError(691, u"RasDial", kTrue16);

  ExpectOneBox(RasErrorBox(u"RasDial", u"691", u"\u05e9\u05d2\u05d9\u05d0\u05d4"));
}

// The version of the system.

TEST_F(MdlDunErrors, The_version_is_told_as_code_version_and_build) {
  std::int32_t code = 77;
  Text version;
  Text build;

  EXPECT_EQ(dun.GetOsVersion(code, version, build), kTrue16);

  EXPECT_EQ(code, 2002);
  EXPECT_EQ(version, u"5.1");
  EXPECT_EQ(build, u"2600");
}

TEST_F(MdlDunErrors, A_version_of_a_known_kind_that_is_not_listed_leaves_the_code) {
  machine.system.Version = {2, 6, 0, 6000};
  std::int32_t code = 77;
  Text version;
  Text build;

  EXPECT_EQ(dun.GetOsVersion(code, version, build), kTrue16);

  EXPECT_EQ(code, 77);
  EXPECT_EQ(version, u"6.0");
  EXPECT_EQ(build, u"6000");
}

TEST_F(MdlDunErrors, A_version_that_cannot_be_read_is_told_and_fails) {
  machine.system.FailVersion = true;
  std::int32_t code = 77;
  Text version = u"before";
  Text build = u"before";

  EXPECT_EQ(dun.GetOsVersion(code, version, build), kFalse16);

  ExpectOneBox(ExclamationBox(u"  Error Getting OS Information",
                              u"An error occured while trying to get the OS version and information.\r"
                              u"Click OK to continue."));
  EXPECT_EQ(version, u"before");
}

struct FaultySystem : MdlDunErrors {
  /// Nothing that this module asks raises a fault of its own: a system that does stands for whatever may.
  struct Faulty : platform::PassedOnSystem {
    using PassedOnSystem::PassedOnSystem;
    bool GetVersionExA(platform::OsVersion&) override { throw Fault(Fault::kOverflow); }
  };
  Faulty faulty{machine.system};
  mdlDun dunOfIt{{ras, ras}, faulty, desktop};
};

struct SystemWithTexts : MdlDunErrors {
  /// Keeps how it was asked for a text.
  struct Asked : platform::PassedOnSystem {
    using PassedOnSystem::PassedOnSystem;
    std::uint32_t FormatMessageA(std::uint32_t flags, std::uint32_t number, std::uint32_t language,
                                 std::span<char> buffer) override {
      calls.push_back({flags, number, language, static_cast<std::uint32_t>(buffer.size())});
      return PassedOnSystem::FormatMessageA(flags, number, language, buffer);
    }
    std::vector<std::array<std::uint32_t, 4>> calls;
  };
  Asked asked{machine.system};
  mdlDun dunOfIt{{ras, ras}, asked, desktop};
};

TEST_F(SystemWithTexts, A_text_of_the_system_is_asked_for_in_no_language_with_room_for_512) {
  EXPECT_EQ(dunOfIt.ReportRasError(600, u"RasDial", kTrue16), kTrue16);

  EXPECT_EQ(asked.calls, (std::vector<std::array<std::uint32_t, 4>>{{0x1000, 600, 0, 512}}));
}

TEST_F(FaultySystem, A_fault_while_the_version_is_read_is_told_in_words_of_its_own) {
  std::int32_t code = 77;
  Text version;
  Text build;

  EXPECT_EQ(dunOfIt.GetOsVersion(code, version, build), kFalse16);

  ExpectOneBox(ExclamationBox(u"  Error  -  Overflow",
                              u"GetOsVersion caused the following error while getting the OS version:\r\r"
                              u"Error Number = 6\rError Description = Overflow"));
}

TEST_F(FaultySystem, A_version_that_faults_takes_the_phone_book_away) {
  dunOfIt.DeleteEntry(home, book, kFalse16);

  EXPECT_EQ(book, u"");
  EXPECT_EQ(desktop.Boxes.size(), 1U);
}

} // namespace
} // namespace quendra::provisioning
