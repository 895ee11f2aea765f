#include "platform/linux/net/DefaultRoute.h"

#include "platform/linux/system/Files.h"

#include <algorithm>
#include <charconv>
#include <optional>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint32_t kRouteUp = 0x0001;
constexpr std::uint32_t kRouteHasGateway = 0x0002;
constexpr std::uint32_t kRouteRejects = 0x0200;

std::optional<std::uint32_t> Number(std::string_view text, int base) {
  std::uint32_t value = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, base);
  if (error != std::errc() || end != text.data() + text.size()) return {};
  return value;
}

/// Columns: interface, destination, gateway, flags, references, uses, metric, mask.
std::optional<DefaultRoute> ParseRoute(const std::string& line) {
  std::vector<std::string> columns;
  for (const auto& part : Split(line, '\t')) columns.push_back(part.substr(0, part.find(' ')));
  if (columns.size() < 8) return {};
  const auto destination = Number(columns[1], 16), gateway = Number(columns[2], 16),
             flags = Number(columns[3], 16);
  const auto metric = Number(columns[6], 10), mask = Number(columns[7], 16);
  if (destination != 0u || mask != 0u || !gateway || !flags || !metric) return {};
  if ((*flags & kRouteUp) == 0 || (*flags & kRouteRejects) != 0) return {};
  return DefaultRoute{columns[0], Ipv4Address::FromMemory((*flags & kRouteHasGateway) != 0 ? *gateway : 0),
                      *metric};
}

} // namespace

std::vector<DefaultRoute> ParseDefaultRoutes(std::string_view text) {
  std::vector<DefaultRoute> routes;
  for (const auto& line : Split(text, '\n'))
    if (auto route = ParseRoute(line)) routes.push_back(std::move(*route));
  std::stable_sort(routes.begin(), routes.end(), [](const DefaultRoute& left, const DefaultRoute& right) {
    return left.metric < right.metric;
  });
  return routes;
}

std::vector<DefaultRoute> ReadDefaultRoutes(const ProcFolder& folder) {
  return ParseDefaultRoutes(folder.File("thread-self/net/route").value_or(""));
}

} // namespace quendra::platform::linux_
