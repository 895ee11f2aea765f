#include "platform/linux/LinuxFixture.h"
#include "platform/linux/net/SocketOwners.h"

#include <gtest/gtest.h>

#include <optional>

namespace quendra::platform::linux_ {

namespace {

struct LinuxSocketOwners : testing::Test {
  FakeProc proc;
  TestClock clock;
  ProcFolder folder{proc.Path()};
  std::optional<SocketOwners> owners;
  std::vector<TcpSocket> sockets;

  LinuxSocketOwners() { UseRights({true, 0}); }
  void UseRights(SocketOwners::Rights rights) { owners.emplace(folder, rights, clock.AsClock()); }

  void Open(std::uint32_t node, std::uint32_t user = 0) {
    TcpSocket socket;
    socket.node = node;
    socket.user = user;
    sockets.push_back(socket);
  }
  void Close(std::uint32_t node) {
    std::erase_if(sockets, [node](const TcpSocket& socket) { return socket.node == node; });
  }
  void Pass(std::uint64_t milliseconds = 1000) {
    clock.now += milliseconds;
    owners->Update(sockets);
  }
};

TEST_F(LinuxSocketOwners, The_process_that_has_the_descriptor_is_the_owner) {
  proc.Add(10, {"a"});
  proc.Add(11, {"b"});
  proc.AddSocket(11, 5, 700);
  Open(700);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 11u);
}

TEST_F(LinuxSocketOwners, A_socket_without_a_number_has_no_owner_and_causes_no_search) {
  proc.Add(10, {"a"});
  Open(0);
  Pass();
  EXPECT_EQ(owners->OwnerOf(0), 0u);
  EXPECT_EQ(owners->ProcessesRead(), 0u);
}

TEST_F(LinuxSocketOwners, Known_owners_cause_no_search) {
  proc.Add(10, {"a"});
  proc.AddSocket(10, 5, 700);
  Open(700);
  Pass();
  EXPECT_GT(owners->ProcessesRead(), 0u);
  for (int pass = 0; pass < 20; ++pass) {
    Pass();
    EXPECT_EQ(owners->ProcessesRead(), 0u);
    EXPECT_EQ(owners->OwnerOf(700), 10u);
  }
}

TEST_F(LinuxSocketOwners, New_sockets_of_a_process_that_opened_some_lately_are_found_by_reading_it_alone) {
  for (std::uint32_t id = 10; id < 60; ++id) proc.Add(id, {"a"});
  proc.AddSocket(40, 5, 700);
  Open(700);
  Pass();
  for (std::uint32_t node = 701; node < 720; ++node) {
    proc.AddSocket(40, node, node);
    Open(node);
    Pass();
    EXPECT_EQ(owners->OwnerOf(node), 40u);
    EXPECT_EQ(owners->ProcessesRead(), 1u);
  }
}

TEST_F(LinuxSocketOwners, A_new_process_is_read_before_older_ones_that_opened_nothing_lately) {
  for (std::uint32_t id = 10; id < 60; ++id) proc.Add(id, {"a"});
  proc.AddSocket(10, 5, 700);
  Open(700);
  Pass();
  for (int pass = 0; pass < 10; ++pass) Pass();
  proc.Add(99, {"new"});
  proc.AddSocket(99, 3, 701);
  Open(701);
  Pass();
  EXPECT_EQ(owners->OwnerOf(701), 99u);
  EXPECT_EQ(owners->ProcessesRead(), 1u);
}

TEST_F(LinuxSocketOwners, Several_hundred_new_connections_of_one_process_cost_one_reading_of_it) {
  for (std::uint32_t id = 10; id < 60; ++id) proc.Add(id, {"a"});
  proc.AddSocket(40, 5, 700);
  Open(700);
  Pass();
  for (std::uint32_t node = 1000; node < 1500; ++node) {
    proc.AddSocket(40, node, node);
    Open(node);
  }
  Pass();
  EXPECT_EQ(owners->ProcessesRead(), 1u);
  for (std::uint32_t node = 1000; node < 1500; ++node) ASSERT_EQ(owners->OwnerOf(node), 40u);
}

TEST_F(LinuxSocketOwners, A_socket_that_nobody_has_is_searched_again_after_2_then_4_then_8_seconds) {
  proc.Add(10, {"a"});
  Open(700);
  std::vector<int> searched;
  for (int second = 0; second < 20; ++second) {
    Pass();
    if (owners->ProcessesRead() > 0) searched.push_back(second);
  }
  EXPECT_EQ(searched, (std::vector<int>{0, 2, 6, 14}));
  EXPECT_EQ(owners->OwnerOf(700), 0u);
}

TEST_F(LinuxSocketOwners, An_owner_that_can_be_seen_later_is_found_later) {
  proc.Add(10, {"a"});
  Open(700);
  Pass();
  proc.AddSocket(10, 5, 700);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 0u);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 10u);
}

TEST_F(LinuxSocketOwners, A_socket_that_a_child_inherited_belongs_to_the_parent) {
  proc.Add(20, {"daemon", 1});
  proc.Add(10, {"worker", 20});
  proc.Add(5, {"workers-worker", 10});
  for (const std::uint32_t id : {5u, 10u, 20u}) proc.AddSocket(id, 6, 700);
  Open(700);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 20u);
}

TEST_F(LinuxSocketOwners, Process_1_owns_a_socket_only_when_nobody_else_has_it) {
  proc.Add(1, {"init", 0});
  proc.Add(10, {"service", 1});
  proc.AddSocket(1, 3, 700);
  proc.AddSocket(10, 3, 700);
  proc.AddSocket(1, 4, 701);
  Open(700);
  Open(701);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 10u);
  EXPECT_EQ(owners->OwnerOf(701), 1u);
}

TEST_F(LinuxSocketOwners, A_connection_handed_to_a_child_moves_to_the_child_within_two_seconds) {
  proc.Add(10, {"daemon", 1});
  proc.AddSocket(10, 6, 700);
  Open(700);
  Pass();
  proc.Add(11, {"session", 10});
  proc.AddSocket(11, 6, 700);
  proc.RemoveDescriptor(10, 6);
  Pass();
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 11u);
}

TEST_F(LinuxSocketOwners, However_old_a_wrong_owner_does_not_stay_longer_than_8_seconds) {
  proc.Add(10, {"daemon", 1});
  proc.AddSocket(10, 6, 700);
  Open(700);
  for (int second = 0; second < 100; ++second) Pass();
  proc.Remove(10);
  proc.Add(11, {"heir", 1});
  proc.AddSocket(11, 6, 700);
  for (int second = 0; second < 8; ++second) Pass();
  EXPECT_EQ(owners->OwnerOf(700), 11u);
}

TEST_F(LinuxSocketOwners, An_owner_that_ended_without_an_heir_is_no_owner_any_more) {
  proc.Add(10, {"daemon", 1});
  proc.AddSocket(10, 6, 700);
  Open(700);
  Pass();
  proc.TakeOver(10, {"other", 1, "", 'S', false, 200});
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 0u);
}

TEST_F(LinuxSocketOwners, A_descriptor_that_got_another_socket_after_a_close_is_read_again) {
  proc.Add(10, {"client", 1});
  proc.AddSocket(10, 6, 700);
  Open(700);
  Pass();
  proc.RemoveDescriptor(10, 6);
  proc.AddSocket(10, 6, 701);
  Close(700);
  Open(701);
  Pass(10);
  EXPECT_EQ(owners->OwnerOf(700), 0u);
  EXPECT_EQ(owners->OwnerOf(701), 10u);
}

TEST_F(LinuxSocketOwners, Processes_whose_descriptors_may_not_be_read_are_passed_over) {
  proc.Add(10, {"closed"});
  ASSERT_TRUE(RunShell("rmdir " + proc.FolderOf(10) + "/fd"));
  proc.Add(11, {"open"});
  proc.AddSocket(11, 3, 700);
  Open(700);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 11u);
}

TEST_F(LinuxSocketOwners, Sockets_of_a_process_whose_first_thread_has_ended_stay_its_own) {
  proc.Add(10, {"a"});
  proc.AddThread(10, 10, {"a", 1, "", 'Z'});
  proc.AddThread(10, 11, {"a"});
  proc.AddSocketOfThread(10, 11, 5, 700);
  Open(700);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 10u);
  for (int pass = 0; pass < 20; ++pass) {
    Pass();
    EXPECT_EQ(owners->ProcessesRead(), 0u);
    EXPECT_EQ(owners->OwnerOf(700), 10u);
  }
}

TEST_F(LinuxSocketOwners, A_first_thread_that_ends_later_leaves_its_sockets_with_the_process) {
  proc.Add(10, {"a"});
  proc.AddSocket(10, 5, 700);
  Open(700);
  Pass();
  proc.RemoveDescriptor(10, 5);
  proc.AddThread(10, 10, {"a", 1, "", 'Z'});
  proc.AddThread(10, 11, {"a"});
  proc.AddSocketOfThread(10, 11, 5, 700);
  for (int pass = 0; pass < 5; ++pass) Pass();
  EXPECT_EQ(owners->OwnerOf(700), 10u);
}

TEST_F(LinuxSocketOwners, Without_rights_another_users_socket_causes_no_search) {
  UseRights({false, 1000});
  proc.Add(10, {"a"});
  Open(700, 0);
  for (int pass = 0; pass < 10; ++pass) {
    Pass();
    EXPECT_EQ(owners->ProcessesRead(), 0u);
  }
}

TEST_F(LinuxSocketOwners, Without_rights_the_users_own_sockets_are_found) {
  UseRights({false, 1000});
  proc.Add(10, {"a"});
  proc.AddSocket(10, 3, 700);
  Open(700, 1000);
  Pass();
  EXPECT_EQ(owners->OwnerOf(700), 10u);
}

TEST_F(LinuxSocketOwners, Thousands_of_sockets_are_looked_at_again_a_share_at_a_time) {
  proc.Add(10, {"a"});
  for (std::uint32_t node = 1; node <= 2000; ++node) {
    proc.AddSocket(10, node, node);
    Open(node);
  }
  Pass();
  ASSERT_TRUE(RunShell("rm -r " + proc.FolderOf(10) + "/fd"));
  Pass();
  std::size_t lost = 0;
  for (std::uint32_t node = 1; node <= 2000; ++node) lost += owners->OwnerOf(node) == 0;
  EXPECT_EQ(lost, 2000u / 8 + 64);
}

} // namespace

} // namespace quendra::platform::linux_
