#include "platform/capture/FrameQueue.h"

#include <gtest/gtest.h>

namespace quendra::platform {

TEST(PcapFrameQueue, Frames_come_out_in_the_order_they_went_in_also_around_its_end) {
  FrameQueue queue;
  std::uint32_t expected = 0;
  for (std::uint32_t pushed = 0; pushed < 3 * queue.Capacity();) {
    for (int i = 0; i < 50000; ++i) queue.Push().wire = pushed++;
    for (int i = 0; i < 50000; ++i) ASSERT_EQ(queue.Pop()->wire, expected++);
  }
  EXPECT_EQ(queue.Pop(), nullptr);
}

TEST(PcapFrameQueue, The_frame_popped_last_stays_until_the_queue_is_full) {
  FrameQueue queue;
  queue.Push().wire = 4711;
  const FrameRecord* popped = queue.Pop();
  while (queue.Room() > 0) queue.Push().wire = 1;
  EXPECT_EQ(popped->wire, 4711u);
}

TEST(PcapFrameQueue, The_newest_record_is_the_one_pushed_last_also_when_it_has_been_popped) {
  FrameQueue queue;
  EXPECT_EQ(queue.Newest(), nullptr);
  queue.Push().wire = 1;
  queue.Push().wire = 2;
  queue.Pop();
  queue.Pop();
  EXPECT_EQ(queue.Newest()->wire, 2u);
}

TEST(PcapFrameQueue, The_oldest_frames_can_be_discarded) {
  FrameQueue queue;
  for (std::uint32_t i = 0; i < 5; ++i) queue.Push().wire = i;
  queue.DiscardOldest(3);
  EXPECT_EQ(queue.Size(), 2u);
  EXPECT_EQ(queue.Pop()->wire, 3u);
}

TEST(PcapFrameQueue, Its_capacity_is_the_next_power_of_two) {
  EXPECT_EQ(FrameQueue(1024).Capacity(), 1024u);
  EXPECT_EQ(FrameQueue(1025).Capacity(), 2048u);
}

TEST(PcapFrameQueue, A_small_one_has_room_for_one_frame_less_than_its_capacity) {
  FrameQueue queue(4);
  EXPECT_EQ(queue.Room(), 3u);
  for (std::uint32_t i = 0; i < 3; ++i) queue.Push().wire = i;
  EXPECT_EQ(queue.Room(), 0u);
  for (std::uint32_t i = 0; i < 3; ++i) EXPECT_EQ(queue.Pop()->wire, i);
}

} // namespace quendra::platform
