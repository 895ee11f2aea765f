#include "diagnostics/interfaces/CInterfaces.h"

#include "runtime/Fault.h"

namespace quendra::diagnostics {

CInterfaces::Item CInterfaces::add(Item item) { return items_.emplace_back(std::move(item)); }

void CInterfaces::Remove(std::int32_t index) {
  items_.erase(items_.begin() + static_cast<std::ptrdiff_t>(PlaceOf(index)));
}

std::size_t CInterfaces::PlaceOf(std::int32_t index) const {
  if (index < 1 || index > Count()) throw Fault(Fault::kSubscript);
  return static_cast<std::size_t>(index - 1);
}

} // namespace quendra::diagnostics
