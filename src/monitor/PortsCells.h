#pragma once

#include "forms/controls/ListView.h"

#include <bitset>
#include <memory>
#include <unordered_map>

namespace quendra::monitor {

/// The ports cells of a list during one walk of a connection table. A port counts as present where its
/// decimal text stands anywhere in the cell. A cell that is asked for so often that plain searches cost more
/// than reading it once is indexed beside the table, as long as the list doesn't change.
class PortsCells {
 public:
  explicit PortsCells(forms::ListView& list) : list_(list) {}

  /// `port` is the decimal text of a number from 0 to 65535.
  bool Contains(const forms::ListRow& row, TextView port);
  /// Appends the port and a dot to the cell's text; an empty cell gets a dot first.
  void Append(forms::ListRow& row, TextView port);

 private:
  using Numbers = std::bitset<65536>;
  struct Cell {
    std::size_t searched = 0;         ///< code units that plain searches went through
    std::unique_ptr<Numbers> numbers; ///< every number whose decimal text stands in the cell
  };

  static void Learn(Numbers& numbers, TextView text);

  forms::ListView& list_;
  std::uint64_t revision_ = 0;
  std::unordered_map<const forms::ListRow*, Cell> cells_;
};

} // namespace quendra::monitor
