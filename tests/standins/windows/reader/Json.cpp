#include "standins/windows/reader/Json.h"

#include <array>
#include <cstdio>

namespace quendra::standins {

std::string Quoted(TextView text) {
  std::string quoted = "\"";
  for (const char16_t unit : text) {
    if (unit >= u' ' && unit < 0x7F && unit != u'"' && unit != u'\\') {
      quoted += static_cast<char>(unit);
      continue;
    }
    std::array<char, 8> escaped{};
    std::snprintf(escaped.data(), escaped.size(), "\\u%04x", static_cast<unsigned>(unit));
    quoted += escaped.data();
  }
  return quoted + '"';
}

std::string Listed(const std::vector<std::string>& values) {
  std::string listed = "[";
  for (const std::string& value : values) listed += (listed.size() > 1 ? "," : "") + value;
  return listed + "]";
}

} // namespace quendra::standins
