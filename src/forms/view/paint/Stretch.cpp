#include "forms/view/paint/Stretch.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace quendra::forms {

namespace {

/// The pixels of a row or column that have their part in one of the result, and how large it is.
struct Share {
  int first = 0;
  std::vector<float> weights{};
};

/// A tent over each pixel of the result, as wide as the distance of its neighbours, a pixel of the picture at
/// least.
Share ShareOf(int place, double step, int length) {
  const double middle = (place + 0.5) * step;
  const double reach = std::max(step, 1.0);
  Share share;
  share.first = std::clamp(static_cast<int>(std::floor(middle - reach + 0.5)), 0, length - 1);
  const int end = std::clamp(static_cast<int>(std::ceil(middle + reach - 0.5)), share.first + 1, length);
  double sum = 0;
  for (int at = share.first; at < end; ++at) {
    const double weight = std::max(1e-6, 1 - std::abs(at + 0.5 - middle) / reach);
    share.weights.push_back(static_cast<float>(weight));
    sum += weight;
  }
  for (float& weight : share.weights) weight = static_cast<float>(weight / sum);
  return share;
}

std::vector<Share> SharesOf(int before, int after) {
  std::vector<Share> shares;
  shares.reserve(static_cast<std::size_t>(after));
  for (int place = 0; place < after; ++place)
    shares.push_back(ShareOf(place, static_cast<double>(before) / after, before));
  return shares;
}

/// Alpha, then the colours multiplied by it: what is seen through has no colour of its own to give.
using Parts = std::array<float, 4>;

void Add(Parts& sum, const Parts& parts, float weight) {
  for (std::size_t i = 0; i < sum.size(); ++i) sum[i] += parts[i] * weight;
}

Parts PartsOf(std::uint32_t argb) {
  const auto alpha = static_cast<float>(argb >> 24);
  const auto part = [&](int shift) { return static_cast<float>(argb >> shift & 0xFF) * alpha; };
  return {alpha, part(16), part(8), part(0)};
}

std::uint32_t ArgbOf(const Parts& parts) {
  if (parts[0] < 0.5F) return 0;
  const auto rounded = [](float part) {
    return static_cast<std::uint32_t>(std::clamp(part + 0.5F, 0.0F, 255.0F));
  };
  return rounded(parts[0]) << 24 | rounded(parts[1] / parts[0]) << 16 | rounded(parts[2] / parts[0]) << 8 |
         rounded(parts[3] / parts[0]);
}

void StretchRow(const std::uint32_t* row, const std::vector<Share>& shares, std::vector<Parts>& result) {
  for (std::size_t x = 0; x < shares.size(); ++x) {
    Parts sum{};
    const std::uint32_t* pixel = row + shares[x].first;
    for (const float weight : shares[x].weights) Add(sum, PartsOf(*pixel++), weight);
    result[x] = sum;
  }
}

/// Rows of the picture in the width of the result. A few are kept: neighbours of the result share them.
class StretchedRows {
 public:
  StretchedRows(const Picture::Pixels& picture, int width)
      : picture_(picture), shares_(SharesOf(picture.width, width)) {}

  const std::vector<Parts>& Row(int y, std::size_t kept) {
    if (rows_.size() < kept) rows_.resize(kept);
    Kept& place = rows_[static_cast<std::size_t>(y) % rows_.size()];
    if (place.y != y) {
      place.y = y;
      place.row.resize(shares_.size());
      StretchRow(picture_.argb.data() + static_cast<std::ptrdiff_t>(y) * picture_.width, shares_, place.row);
    }
    return place.row;
  }

 private:
  struct Kept {
    int y = -1;
    std::vector<Parts> row{};
  };
  const Picture::Pixels& picture_;
  std::vector<Share> shares_;
  std::vector<Kept> rows_;
};

} // namespace

bool IsWhole(const Picture::Pixels& picture) {
  if (picture.width <= 0 || picture.height <= 0) return false;
  return picture.argb.size() / static_cast<std::size_t>(picture.width) >=
         static_cast<std::size_t>(picture.height);
}

Picture::Pixels Stretched(const Picture::Pixels& picture, Extent extent) {
  if (!IsWhole(picture) || extent.width <= 0 || extent.height <= 0) return {};
  Picture::Pixels result{extent.width, extent.height, {}};
  result.argb.reserve(static_cast<std::size_t>(extent.width) * static_cast<std::size_t>(extent.height));
  StretchedRows rows(picture, extent.width);
  const std::vector<Share> shares = SharesOf(picture.height, extent.height);
  std::size_t most = 0;
  for (const Share& share : shares) most = std::max(most, share.weights.size());
  std::vector<Parts> sums;
  for (const Share& share : shares) {
    sums.assign(static_cast<std::size_t>(extent.width), Parts{});
    for (std::size_t i = 0; i < share.weights.size(); ++i) {
      const std::vector<Parts>& row = rows.Row(share.first + static_cast<int>(i), most);
      for (std::size_t x = 0; x < sums.size(); ++x) Add(sums[x], row[x], share.weights[i]);
    }
    for (const Parts& sum : sums) result.argb.push_back(ArgbOf(sum));
  }
  return result;
}

Extent FittedInto(Extent picture, Extent bounds) {
  const double scale = std::min(static_cast<double>(bounds.width) / picture.width,
                                static_cast<double>(bounds.height) / picture.height);
  return {std::clamp(static_cast<int>(std::lround(picture.width * scale)), 1, std::max(1, bounds.width)),
          std::clamp(static_cast<int>(std::lround(picture.height * scale)), 1, std::max(1, bounds.height))};
}

} // namespace quendra::forms
