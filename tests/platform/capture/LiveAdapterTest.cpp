#include "platform/capture/LiveAdapter.h"

#include <gtest/gtest.h>

namespace quendra::platform {

namespace {

LiveAdapter Adapter(const char* name, unsigned number) { return {name, "", number}; }

std::vector<std::string> NamesInOrder(std::vector<LiveAdapter> adapters) {
  PutInOrder(adapters);
  std::vector<std::string> names;
  for (const auto& adapter : adapters) names.push_back(adapter.name);
  return names;
}

} // namespace

using Names = std::vector<std::string>;

TEST(LiveAdapter, Adapters_stand_by_their_numbers) {
  EXPECT_EQ(NamesInOrder({Adapter("c", 9), Adapter("a", 2), Adapter("b", 3)}), (Names{"a", "b", "c"}));
}

TEST(LiveAdapter, That_of_the_default_route_is_the_first) {
  LiveAdapter preferred = Adapter("p", 7);
  preferred.hasDefaultRoute = true;
  EXPECT_EQ(NamesInOrder({Adapter("a", 2), preferred}), (Names{"p", "a"}));
}

TEST(LiveAdapter, Loopback_is_the_last_also_with_a_default_route) {
  LiveAdapter loopback = Adapter("lo", 1);
  loopback.isLoopback = true;
  EXPECT_EQ(NamesInOrder({loopback, Adapter("a", 2)}), (Names{"a", "lo"}));
  loopback.hasDefaultRoute = true;
  EXPECT_EQ(NamesInOrder({loopback, Adapter("a", 2)}), (Names{"a", "lo"}));
}

} // namespace quendra::platform
