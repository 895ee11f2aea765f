#pragma once

#include "diagnostics/interfaces/CInterface.h"

#include <memory>
#include <vector>

namespace quendra::diagnostics {

/// The network interfaces of one read, numbered from 1.
class CInterfaces {
 public:
  using Item = std::shared_ptr<CInterface>;

  /// Appends; gives the item back.
  Item add(Item item);
  /// Fault 9 for an index that the collection lacks, here and below.
  Item item(std::int32_t index) const { return items_[PlaceOf(index)]; }
  std::int32_t Count() const { return static_cast<std::int32_t>(items_.size()); }
  void Remove(std::int32_t index);
  /// The items in their order.
  const std::vector<Item>& NewEnum() const { return items_; }

 private:
  std::size_t PlaceOf(std::int32_t index) const;

  std::vector<Item> items_;
};

} // namespace quendra::diagnostics
