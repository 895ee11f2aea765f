#pragma once

#include "forms/controls/ListView.h"

#include <vector>

namespace quendra::capture {

/// Finds the row that a packet is charged to: the first one whose ports cell holds "." + port + ".". Kept
/// beside the table and made anew when the table's revision has moved on, so every answer is that of a search
/// through the rows.
class PortIndex {
 public:
  explicit PortIndex(forms::ListView& table) : table_(table), firstRow_(kPorts) {}

  /// The port as decoded, a signed word; nullptr when no row holds it. The row lives until the table changes.
  forms::ListRow* RowOf(std::int16_t port) {
    if (revision_ != table_.Revision()) Rebuild();
    return firstRow_[static_cast<std::uint16_t>(port)];
  }

 private:
  static constexpr std::size_t kPorts = 65536;

  void Rebuild();
  void AddPortsOf(forms::ListRow& row);
  void AddToken(TextView token, forms::ListRow& row);

  forms::ListView& table_;
  std::uint64_t revision_ = 0; ///< a table of revision 0 has no rows, as this index has none
  std::vector<forms::ListRow*> firstRow_;
  std::vector<std::uint16_t> filled_;
};

} // namespace quendra::capture
