#pragma once

#include <linux/netlink.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <optional>
#include <span>

/// The kernel's answers over netlink, read no further than they go.
namespace quendra::platform::linux_ {

using NetlinkBytes = std::span<const std::uint8_t>;

/// Nothing when the record doesn't lie within the bytes.
template <typename Record> std::optional<Record> ReadAt(NetlinkBytes bytes, std::size_t offset) {
  if (offset > bytes.size() || bytes.size() - offset < sizeof(Record)) return {};
  Record record;
  std::memcpy(&record, bytes.data() + offset, sizeof record);
  return record;
}

/// What follows a part of this length, which is rounded up.
inline NetlinkBytes After(NetlinkBytes bytes, std::size_t length) {
  return bytes.subspan(std::min<std::size_t>(NLA_ALIGN(length), bytes.size()));
}

/// Calls `visit(type, content)` for each attribute, up to the first that is longer than what is left.
template <typename Visit> void ForEachAttribute(NetlinkBytes attributes, Visit visit) {
  while (const auto attribute = ReadAt<nlattr>(attributes, 0)) {
    if (attribute->nla_len < sizeof(nlattr) || attribute->nla_len > attributes.size()) return;
    visit(attribute->nla_type & NLA_TYPE_MASK,
          attributes.subspan(sizeof(nlattr), attribute->nla_len - sizeof(nlattr)));
    attributes = After(attributes, attribute->nla_len);
  }
}

} // namespace quendra::platform::linux_
