#include "platform/capture/LiveAdapter.h"

#include <algorithm>
#include <tuple>

namespace quendra::platform {

void PutInOrder(std::vector<LiveAdapter>& adapters) {
  const auto place = [](const LiveAdapter& adapter) {
    const int rank = adapter.isLoopback ? 2 : adapter.hasDefaultRoute ? 0 : 1;
    return std::tuple(rank, adapter.number);
  };
  std::stable_sort(adapters.begin(), adapters.end(), [&](const LiveAdapter& left, const LiveAdapter& right) {
    return place(left) < place(right);
  });
}

} // namespace quendra::platform
