#include "diagnostics/CheckRows.h"

namespace quendra::diagnostics {

namespace {

constexpr int kDetailCell = 1;
constexpr int kCaptionCell = 2;

} // namespace

void CheckRows::Clear() {
  list_.Clear();
  surfRowItem_ = surfCheckCell_ = surfDetailCell_ = nullptr;
}

void CheckRows::Add(const char16_t* caption, const char16_t* captionKey) {
  surfRowItem_ = &list_.Add({}, {}, 0);
  surfRowItem_->AddCell({}, {});
  surfDetailCell_ = surfRowItem_;
  surfRowItem_->AddCell(caption, {}, 0, captionKey);
  surfCheckCell_ = surfRowItem_;
  surfCheckCell_->SetCellBold(kCaptionCell, true);
}

void CheckRows::AddBlank() { list_.Add({}, {}, 0); }

void CheckRows::EndBold() {
  if (surfCheckCell_) surfCheckCell_->SetCellBold(kCaptionCell, false);
}

void CheckRows::LeaveRow() { surfRowItem_ = surfCheckCell_ = nullptr; }

void CheckRows::SetDetail(Text text) { surfDetailCell_->SetCellText(kDetailCell, std::move(text)); }

void CheckRows::AppendBar() { surfDetailCell_->AppendCellText(kDetailCell, u"|"); }

void CheckRows::ShowError(Text text) {
  SetDetail(std::move(text));
  surfDetailCell_->SetCellColour(kDetailCell, forms::kRed);
}

void CheckRows::AddIcon(Outcome outcome) { surfRowItem_->AddCell({}, {}, static_cast<int>(outcome)); }

void CheckRows::Repaint() { screen_.Repaint(list_); }

} // namespace quendra::diagnostics
