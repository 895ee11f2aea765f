#include "platform/linux/remote_access/LineSettings.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "runtime/Text.h"

#include <algorithm>

namespace quendra::platform::linux_ {

std::optional<LineKind> LineKindOf(const NetworkSettings& settings) {
  const std::string type = TextIn(settings, "connection", "type");
  if (type == "pppoe") return LineKind::Pppoe;
  if (type == "vpn" && TextIn(settings, "vpn", "service-type") == nm::kPptpService) return LineKind::Vpn;
  return {};
}

const char* DeviceTypeOf(LineKind kind) { return kind == LineKind::Pppoe ? "pppoe" : "vpn"; }

std::optional<LineKind> LineKindOfDevice(std::string_view deviceType) {
  for (const LineKind kind : {LineKind::Pppoe, LineKind::Vpn})
    if (deviceType == DeviceTypeOf(kind)) return kind;
  return {};
}

std::string Shown(const std::string& utf8, std::size_t fieldBytes) {
  return ToCodePage(FromUtf8(utf8)).substr(0, fieldBytes - 1);
}

std::string Kept(const std::string& before, const std::string& shown, std::size_t fieldBytes) {
  return Shown(before, fieldBytes) == shown ? before : ToUtf8(FromCodePage(shown));
}

std::string_view FieldText(std::span<const std::uint8_t> image, std::size_t at, std::size_t bytes) {
  return CutAtNul(std::string_view(reinterpret_cast<const char*>(image.data()) + at, bytes));
}

void PutFieldText(std::span<std::uint8_t> image, std::size_t at, std::size_t bytes, std::string_view text) {
  const auto field = image.subspan(at, bytes);
  std::ranges::fill(field, std::uint8_t{0});
  std::ranges::copy(text.substr(0, bytes - 1), field.begin());
}

} // namespace quendra::platform::linux_
