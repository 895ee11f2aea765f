#include "platform/windows/process/WindowsHandles.h"

#include "platform/windows/process/SystemHandle.h"
#include "platform/windows/process/WindowsProcesses.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform::windows {
namespace {

struct WindowsHandlesTest : testing::Test {
  ~WindowsHandlesTest() override {
    if (event != kNoHandle) processes.CloseHandle(event);
  }

  /// The whole table, as the program asks for it: its count first.
  std::vector<std::uint8_t> Table() {
    std::vector<std::uint8_t> table(20);
    std::uint32_t returned = 0;
    for (int attempt = 0; attempt < 10; ++attempt) {
      const auto status = handles.NtQuerySystemInformation(Handles::kHandleTable, table, returned);
      if (status != Handles::kStatusInfoLengthMismatch) {
        EXPECT_EQ(status, 0U);
        return table;
      }
      const std::uint32_t count = Little32(table, 0) + 64;
      table.assign(Handles::kCountBytes + Handles::kRecordBytes * count, 0);
    }
    ADD_FAILURE() << "the table grows";
    return {};
  }

  LastError lastError;
  WindowsHandles handles{lastError};
  WindowsProcesses processes{lastError};
  Handle event = kNoHandle;
};

TEST_F(WindowsHandlesTest, A_table_with_too_little_room_tells_its_count) {
  std::array<std::uint8_t, 20> room{};
  std::uint32_t returned = 0;
  EXPECT_EQ(handles.NtQuerySystemInformation(Handles::kHandleTable, room, returned),
            Handles::kStatusInfoLengthMismatch);
  EXPECT_GT(Little32(room, 0), 10U);
}

TEST_F(WindowsHandlesTest, The_table_holds_an_event_of_this_process) {
  event = handles.CreateEventW(true, false, u"");
  const auto table = Table();
  ASSERT_GE(table.size(), 20U);
  int found = 0;
  for (std::uint32_t i = 0; i < Little32(table, 0); ++i) {
    const std::size_t at = Handles::kCountBytes + i * Handles::kRecordBytes;
    ASSERT_LE(at + Handles::kRecordBytes, table.size());
    found += Little32(table, at + Handles::kProcessIdOffset) == ::GetCurrentProcessId() &&
             Little16(table, at + Handles::kHandleOffset) == event.Value();
  }
  EXPECT_EQ(found, 1);
}

TEST_F(WindowsHandlesTest, The_name_of_an_object_stands_behind_its_lengths_where_it_has_room) {
  event = handles.CreateEventW(true, false, u"QuendraTest");
  std::array<std::uint8_t, 256> room{};
  std::uint32_t returned = 0;

  ASSERT_EQ(handles.NtQueryObject(event, Handles::kObjectName, room, returned), 0U);

  Text name;
  for (std::size_t i = 0; i < Little16(room, 0); i += 2)
    name.push_back(Little16(room, Handles::kNameOffset + i));
  EXPECT_TRUE(name.ends_with(u"\\QuendraTest")) << ToUtf8(name);
  std::array<std::uint8_t, 32> tooLittle{};
  EXPECT_NE(handles.NtQueryObject(event, Handles::kObjectName, tooLittle, returned), 0U);
}

TEST_F(WindowsHandlesTest, A_duplicate_is_another_handle_of_the_same_object) {
  event = handles.CreateEventW(true, false, u"");
  Handle duplicate;

  ASSERT_TRUE(handles.DuplicateHandle(kOwnProcess, event, kOwnProcess, duplicate, 0x101F0000, false, 2));

  EXPECT_NE(duplicate, event);
  ::SetEvent(ToSystem(event));
  EXPECT_EQ(::WaitForSingleObject(ToSystem(duplicate), 0), WAIT_OBJECT_0);
  EXPECT_TRUE(processes.CloseHandle(duplicate));
}

TEST_F(WindowsHandlesTest, An_object_that_is_no_device_takes_no_control_code_and_leaves_the_output) {
  event = handles.CreateEventW(true, false, u"");
  std::array<std::uint8_t, Handles::kQueryBytes> input{};
  std::array<std::uint8_t, Handles::kAnswerBytes> output{};

  EXPECT_NE(handles.NtDeviceIoControlFile(event, event, Handles::kQueryInformation, input, output), 0U);

  EXPECT_EQ(output, (std::array<std::uint8_t, Handles::kAnswerBytes>{}));
}

} // namespace
} // namespace quendra::platform::windows
