#include "app/windows/StartedProgram.h"
#include "app/windows/TestFolder.h"

#include <gtest/gtest.h>

// The program beside another of itself, beside odd programs, and ended in the middle.

namespace quendra::app::windows {
namespace {

bool SaysThatItRuns() {
  const HANDLE mutex = ::OpenMutexW(SYNCHRONIZE, FALSE, L"Local\\QuendraRuns");
  if (mutex) ::CloseHandle(mutex);
  return mutex != nullptr;
}

TEST(SecondProgram, Works_beside_the_first) {
  const StartedProgram first(ProgramFile());
  const StartedProgram second(ProgramFile());
  for (const StartedProgram* program : {&first, &second}) {
    ASSERT_TRUE(program->Click(u"המשך"));
    ASSERT_TRUE(program->Click(u"ניטור תהליכים"));
    EXPECT_TRUE(program->Shows(u"שלח דוח"));
  }
  EXPECT_TRUE(first.Runs());
  EXPECT_TRUE(second.Runs());
}

TEST(SecondProgram, Its_sign_for_the_installer_lasts_until_the_last_one_ends) {
  ASSERT_FALSE(SaysThatItRuns());
  {
    const StartedProgram first(ProgramFile());
    ASSERT_TRUE(first.Shows(u"המשך"));
    {
      const StartedProgram second(ProgramFile());
      ASSERT_TRUE(second.Shows(u"המשך"));
      EXPECT_TRUE(SaysThatItRuns());
    }
    EXPECT_TRUE(SaysThatItRuns());
  }
  EXPECT_FALSE(SaysThatItRuns());
}

TEST(SecondProgram, Starts_after_one_that_was_killed_at_any_moment_of_its_start) {
  for (DWORD delay = 0; delay < 600; delay += 60) {
    const StartedProgram killed(ProgramFile());
    ::Sleep(delay);
    killed.Kill();
    ASSERT_TRUE(killed.Ends());
  }
  EXPECT_FALSE(SaysThatItRuns());
  const StartedProgram program(ProgramFile());
  EXPECT_TRUE(program.Shows(u"המשך"));
}

TEST(SecondProgram, Ends_by_the_button_with_status_0) {
  const StartedProgram program(ProgramFile());
  ASSERT_TRUE(program.Click(u"סגור"));
  ASSERT_TRUE(program.Ends());
  EXPECT_EQ(program.Status(), 0U);
}

} // namespace
} // namespace quendra::app::windows
