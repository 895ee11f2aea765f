#include "platform/linux/net/SocketErrorNumbers.h"

#include <gtest/gtest.h>
#include <netdb.h>

#include <cerrno>
#include <utility>

namespace quendra::platform::linux_ {

TEST(SocketErrorNumbers, The_systems_numbers_have_their_names_in_the_library) {
  const std::pair<int, std::int32_t> rows[] = {
      {0, 0},
      {EINTR, 10004},
      {EACCES, 10013},
      {EFAULT, 10014},
      {EINVAL, 10022},
      {EMFILE, 10024},
      {EAGAIN, 10035},
      {EINPROGRESS, 10035},
      {EALREADY, 10037},
      {ENOTSOCK, 10038},
      {EDESTADDRREQ, 10039},
      {EMSGSIZE, 10040},
      {EADDRINUSE, 10048},
      {EADDRNOTAVAIL, 10049},
      {ENETDOWN, 10050},
      {ENETUNREACH, 10051},
      {ECONNABORTED, 10053},
      {ECONNRESET, 10054},
      {EPIPE, 10054},
      {ENOBUFS, 10055},
      {ENOSPC, 10055},
      {EISCONN, 10056},
      {ENOTCONN, 10057},
      {ETIMEDOUT, 10060},
      {ECONNREFUSED, 10061},
      {EHOSTUNREACH, 10065},
      {ENOSYS, 10091},
  };
  for (const auto& [system, library] : rows) EXPECT_EQ(SocketErrorOf(system), library) << system;
}

TEST(SocketErrorNumbers, The_ends_of_look_ups_are_11001_to_11004) {
  EXPECT_EQ(LookUpErrorOf(0), 0);
  EXPECT_EQ(LookUpErrorOf(EAI_NONAME), 11001);
  EXPECT_EQ(LookUpErrorOf(EAI_AGAIN), 11002);
  EXPECT_EQ(LookUpErrorOf(EAI_FAIL), 11003);
  EXPECT_EQ(LookUpErrorOf(EAI_NODATA), 11004);
}

} // namespace quendra::platform::linux_
