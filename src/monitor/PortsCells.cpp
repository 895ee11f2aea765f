#include "monitor/PortsCells.h"

#include "monitor/ProcessRow.h"

#include <algorithm>

namespace quendra::monitor {

namespace {

constexpr std::size_t kLongestPort = 5;
/// What it costs to clear and fill an index: about as much as searching so many code units.
constexpr std::size_t kIndexCost = 8192;

bool IsDigit(char16_t unit) { return unit >= u'0' && unit <= u'9'; }

std::size_t NumberIn(TextView digits) {
  std::size_t number = 0;
  for (const char16_t digit : digits) number = number * 10 + (digit - u'0');
  return number;
}

} // namespace

void PortsCells::Learn(Numbers& numbers, TextView text) {
  for (std::size_t start = 0; start < text.size(); ++start) {
    std::size_t number = 0;
    const std::size_t end = std::min(text.size(), start + kLongestPort);
    for (std::size_t i = start; i < end && IsDigit(text[i]); ++i) {
      number = number * 10 + (text[i] - u'0');
      if (number < numbers.size()) numbers.set(number);
    }
  }
}

bool PortsCells::Contains(const forms::ListRow& row, TextView port) {
  if (revision_ != list_.Revision()) {
    cells_.clear();
    revision_ = list_.Revision();
  }
  const Text& text = row.CellText(kPortsCell);
  Cell& cell = cells_[&row];
  if (!cell.numbers) {
    cell.searched += text.size();
    if (cell.searched <= kIndexCost) return text.find(port) != Text::npos;
    cell.numbers = std::make_unique<Numbers>();
    Learn(*cell.numbers, text);
  }
  return cell.numbers->test(NumberIn(port));
}

void PortsCells::Append(forms::ListRow& row, TextView port) {
  const Text& text = row.CellText(kPortsCell);
  const std::size_t before = text.size();
  const Text tail = Text(text.empty() ? u"." : u"").append(port).append(u".");
  const auto known = revision_ == list_.Revision() ? cells_.find(&row) : cells_.end();
  row.AppendCellText(kPortsCell, tail);
  // This change counts one step. If a listener changed the list further, the index no longer holds.
  if (known == cells_.end() || list_.Revision() != revision_ + 1) return;
  revision_ = list_.Revision();
  const std::size_t joined = std::min(before, kLongestPort - 1);
  if (known->second.numbers) Learn(*known->second.numbers, TextView(text).substr(before - joined));
}

} // namespace quendra::monitor
