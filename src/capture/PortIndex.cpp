#include "capture/PortIndex.h"

#include "monitor/ProcessRow.h"

#include <limits>
#include <optional>

namespace quendra::capture {

namespace {

/// The signed word whose decimal text this is, to the letter: no blank, no "+", no leading zero, no "-0".
std::optional<std::int16_t> WordOfDecimalText(TextView text) {
  constexpr std::size_t kLongest = 6;
  const bool negative = text.starts_with(u'-');
  const TextView digits = text.substr(negative ? 1 : 0);
  if (digits.empty() || text.size() > kLongest) return {};
  if (digits.front() == u'0' && text.size() > 1) return {};
  std::int32_t value = 0;
  for (const char16_t unit : digits) {
    if (unit < u'0' || unit > u'9') return {};
    value = value * 10 + (unit - u'0');
  }
  if (negative) value = -value;
  using Word = std::numeric_limits<std::int16_t>;
  if (value < Word::min() || value > Word::max()) return {};
  return static_cast<std::int16_t>(value);
}

} // namespace

void PortIndex::Rebuild() {
  for (const std::uint16_t port : filled_) firstRow_[port] = nullptr;
  filled_.clear();
  for (int i = 1; i <= table_.Count(); ++i) AddPortsOf(table_.Row(i));
  revision_ = table_.Revision();
}

/// A token is what stands between two dots, as a port's text holds none.
void PortIndex::AddPortsOf(forms::ListRow& row) {
  const TextView ports = row.CellText(monitor::kPortsCell);
  std::size_t dot = ports.find(u'.');
  while (dot != TextView::npos) {
    const std::size_t next = ports.find(u'.', dot + 1);
    if (next == TextView::npos) return;
    AddToken(ports.substr(dot + 1, next - dot - 1), row);
    dot = next;
  }
}

void PortIndex::AddToken(TextView token, forms::ListRow& row) {
  const auto port = WordOfDecimalText(token);
  if (!port) return;
  const auto slot = static_cast<std::uint16_t>(*port);
  if (firstRow_[slot]) return;
  firstRow_[slot] = &row;
  filled_.push_back(slot);
}

} // namespace quendra::capture
