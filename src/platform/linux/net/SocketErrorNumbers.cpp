#include "platform/linux/net/SocketErrorNumbers.h"

#include <netdb.h>

#include <algorithm>
#include <cerrno>
#include <iterator>

namespace quendra::platform::linux_ {

namespace {

struct Number {
  int system;
  std::int32_t library;
};

constexpr Number kNumbers[] = {
    {EINTR, 10004},           {EBADF, 10038},           {EACCES, 10013},        {EPERM, 10013},
    {EFAULT, 10014},          {EINVAL, 10022},          {EMFILE, 10024},        {ENFILE, 10024},
    {EAGAIN, 10035},          {EINPROGRESS, 10035},     {EALREADY, 10037},      {ENOTSOCK, 10038},
    {EDESTADDRREQ, 10039},    {EMSGSIZE, 10040},        {EPROTOTYPE, 10041},    {ENOPROTOOPT, 10042},
    {EPROTONOSUPPORT, 10043}, {ESOCKTNOSUPPORT, 10044}, {EOPNOTSUPP, 10045},    {EPFNOSUPPORT, 10046},
    {EAFNOSUPPORT, 10047},    {EADDRINUSE, 10048},      {EADDRNOTAVAIL, 10049}, {ENETDOWN, 10050},
    {ENETUNREACH, 10051},     {ENETRESET, 10052},       {ECONNABORTED, 10053},  {ECONNRESET, 10054},
    {EPIPE, 10054},           {ENOBUFS, 10055},         {ENOMEM, 10055},        {ENOSPC, 10055},
    {EISCONN, 10056},         {ENOTCONN, 10057},        {ESHUTDOWN, 10058},     {ETIMEDOUT, 10060},
    {ECONNREFUSED, 10061},    {EHOSTUNREACH, 10065},    {EHOSTDOWN, 10065},     {EUSERS, 10067},
};

constexpr std::int32_t kUnavailable = 10091;

} // namespace

std::int32_t SocketErrorOf(int systemError) {
  if (systemError == 0) return 0;
  const auto found = std::find_if(std::begin(kNumbers), std::end(kNumbers),
                                  [&](const Number& row) { return row.system == systemError; });
  return found == std::end(kNumbers) ? kUnavailable : found->library;
}

std::int32_t LookUpErrorOf(int lookUpError) {
  switch (lookUpError) {
  case 0: return 0;
  case EAI_AGAIN: return 11002;
  case EAI_FAIL:
  case EAI_MEMORY:
  case EAI_SYSTEM: return 11003;
  case EAI_NODATA: return 11004;
  default: return 11001;
  }
}

} // namespace quendra::platform::linux_
