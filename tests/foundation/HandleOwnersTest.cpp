#include "foundation/HandleOwners.h"

#include <gtest/gtest.h>

namespace quendra::foundation {
namespace {

// Owners are never followed here: any address will do.
CSocketPlus* const kFirst = reinterpret_cast<CSocketPlus*>(0x10);
CSocketPlus* const kSecond = reinterpret_cast<CSocketPlus*>(0x20);

TEST(HandleOwnersTest, Freed_entries_are_taken_again_before_the_arrays_grow) {
  HandleOwners<std::uint32_t> owners;
  for (const std::uint32_t handle : {4u, 8u, 12u}) owners.Add(handle, kFirst);
  owners.Remove(8);
  EXPECT_EQ(owners.Count(), 3);
  owners.Add(16, kSecond);
  EXPECT_EQ(owners.Count(), 3);
  EXPECT_EQ(owners.OwnerOf(16), kSecond);
  EXPECT_EQ(owners.OwnerOf(8), nullptr);
}

TEST(HandleOwnersTest, A_handle_that_is_there_keeps_its_owner) {
  HandleOwners<std::uint32_t> owners;
  owners.Add(4, kFirst);
  owners.Add(4, kSecond);
  EXPECT_EQ(owners.OwnerOf(4), kFirst);
  EXPECT_EQ(owners.Count(), 1);
}

TEST(HandleOwnersTest, A_free_entry_before_a_handle_takes_it_a_second_time) {
  HandleOwners<std::uint32_t> owners;
  owners.Add(4, kFirst);
  owners.Add(8, kFirst);
  owners.Remove(4);
  owners.Add(8, kSecond);
  // The walk ended at the free entry; the search finds that one first.
  EXPECT_EQ(owners.OwnerOf(8), kSecond);
}

TEST(HandleOwnersTest, Removing_an_unknown_handle_changes_nothing) {
  HandleOwners<std::uint32_t> owners;
  owners.Add(4, kFirst);
  owners.Remove(8);
  EXPECT_EQ(owners.OwnerOf(4), kFirst);
  EXPECT_EQ(owners.Count(), 1);
}

TEST(HandleOwnersTest, An_owner_can_be_changed_in_place) {
  HandleOwners<std::uint32_t> owners;
  owners.Add(4, kFirst);
  owners.ChangeOwner(4, kSecond);
  EXPECT_EQ(owners.OwnerOf(4), kSecond);
  EXPECT_EQ(owners.HandlesOf(kSecond), std::vector<std::uint32_t>{4});
  EXPECT_TRUE(owners.HandlesOf(kFirst).empty());
}

TEST(HandleOwnersTest, Minus_1_is_nobodys_handle) {
  HandleOwners<std::uint32_t> owners;
  owners.Add(4, kFirst);
  owners.Remove(4);
  EXPECT_EQ(owners.OwnerOf(0xFFFFFFFF), nullptr);
}

} // namespace
} // namespace quendra::foundation
