#include "monitor/PortsByOwner.h"

#include <gtest/gtest.h>

namespace quendra::monitor {

TEST(PortsByOwner, Each_port_stands_between_dots_in_the_order_of_adding) {
  PortsByOwner ports;
  ports.Add(7, 80);
  ports.Add(8, 443);
  ports.Add(7, 1025);
  EXPECT_EQ(ports.TextOf(7), u".80.1025.");
  EXPECT_EQ(ports.TextOf(8), u".443.");
}

TEST(PortsByOwner, A_process_without_a_port_has_an_empty_text) { EXPECT_EQ(PortsByOwner().TextOf(7), u""); }

TEST(PortsByOwner, A_port_over_32767_stays_positive) {
  PortsByOwner ports;
  ports.Add(7, 65535);
  EXPECT_EQ(ports.TextOf(7), u".65535.");
}

TEST(PortsByOwner, A_process_id_over_32767_is_kept) {
  PortsByOwner ports;
  ports.Add(0x80000001, 80);
  EXPECT_EQ(ports.TextOf(0x80000001), u".80.");
  EXPECT_EQ(ports.TextOf(1), u"");
}

} // namespace quendra::monitor
