#pragma once

#include "platform/linux/net/LinkRow.h"
#include "platform/linux/system/Descriptor.h"

#include <map>
#include <vector>

namespace quendra::platform::linux_ {

/// The links of this network namespace as rows of the interface table, by ascending index. Counters count
/// from the table's making, so that what the machine did before does not run them over.
class InterfaceTable {
 public:
  InterfaceTable();

  /// False when the kernel doesn't tell them.
  bool Read(std::vector<InterfaceRow>& rows);

  static constexpr std::uint32_t kUnknownSpeed = 10'000'000;
  static constexpr std::uint64_t kMostSpeed = 0x7FFFFFFF;
  /// More than any machine has.
  static constexpr std::size_t kMostLinks = 4096;
  /// A machine of many links, such as one of many containers, shows the first of them: whoever reads the
  /// table counts its bytes in 16 bits, and would end the program at the next row.
  static constexpr std::size_t kMostRows = 39;

 private:
  static bool ReadLinks(std::vector<Link>& links);
  void PutCounters(const Link& link, InterfaceRow& row);

  std::map<std::uint32_t, Link::Counters> atStart_;
};

} // namespace quendra::platform::linux_
