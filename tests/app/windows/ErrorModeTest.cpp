#include "app/windows/StartedProgram.h"

#include <gtest/gtest.h>

namespace quendra::app::windows {
namespace {

/// That of another process: a thread there replaces it by the same one, and ends with the one before.
UINT ErrorModeOf(HANDLE process, UINT expected) {
  // The system's first library lies at one place in all processes, and the call takes and gives what a thread
  // does.
  const auto call = reinterpret_cast<LPTHREAD_START_ROUTINE>(reinterpret_cast<void*>(&::SetErrorMode));
  const HANDLE thread = ::CreateRemoteThread(process, nullptr, 0, call,
                                             reinterpret_cast<void*>(UINT_PTR{expected}), 0, nullptr);
  DWORD before = 0xFFFFFFFF;
  if (::WaitForSingleObject(thread, 10'000) == WAIT_OBJECT_0) ::GetExitCodeThread(thread, &before);
  ::CloseHandle(thread);
  return before;
}

TEST(ErrorMode, The_program_is_not_held_up_by_questions_of_the_system_for_a_disk) {
  constexpr UINT kWithoutQuestions = SEM_FAILCRITICALERRORS | SEM_NOOPENFILEERRORBOX;
  const StartedProgram program(ProgramFile());
  ASSERT_TRUE(program.Shows(u"המשך"));

  EXPECT_EQ(ErrorModeOf(program.Process(), kWithoutQuestions), kWithoutQuestions);
}

} // namespace
} // namespace quendra::app::windows
