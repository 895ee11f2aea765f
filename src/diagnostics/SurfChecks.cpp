#include "diagnostics/SurfChecks.h"

#include "diagnostics/CheckTable.h"

namespace quendra::diagnostics {

namespace {

constexpr auto kLastStep = static_cast<std::int16_t>(kCheckCount);

/// The table's row of a step; nullptr for a number that leads to the end of the list.
const Check* CheckOf(std::int16_t step) {
  return step >= 1 && step <= kLastStep ? &kCheckTable[static_cast<std::size_t>(step - 1)] : nullptr;
}

const Exchange* ExchangeOf(std::int16_t step) {
  const Check* check = CheckOf(step);
  return check && check->exchange.host ? &check->exchange : nullptr;
}

} // namespace

SurfChecks::SurfChecks(foundation::modSocketPlus& module, forms::FormHost& screen, SurfPage& page,
                       LocalChecks& local)
    : module_(module), screen_(screen), page_(page), local_(local), rows_(page.surf_ListView1, screen) {
  page_.Start = [this] { surf_StartChecks(); };
  page_.Stop = [this] { surf_StopChecks(); };
  page_.surf_lblBack.Click = [this] { surf_lblBack_Click(); };
}

void SurfChecks::surf_StartChecks() {
  rows_.Clear();
  page_.window.InBackground = kFalse16;
  surfFailCount_ = 0;
  surfCheckStep_ = 1;
  PrepareSockets();
  surf_RunCheck(surfCheckStep_);
}

void SurfChecks::surf_StopChecks() {
  ReleaseSockets();
  page_.frameSurfProb.Visible = false;
  page_.window.resetButtons();
}

void SurfChecks::PrepareSockets() {
  surf_spSockets_ = std::make_shared<foundation::CSocketPlus>(module_);
  for (std::int16_t index = 1; index <= kLastStep; ++index) surf_spSockets_->ArrayAdd(index);
  auto& events = surf_spSockets_->Events;
  events.Connect = [this](Index index) { surf_spSockets_Connect(index); };
  events.DataArrival = [this](Index index, std::int32_t) { surf_spSockets_DataArrival(index); };
  events.CloseSck = [this](Index index) { surf_spSockets_CloseSck(index); };
  events.Error = [this](Index, std::int16_t number, const Text& description, std::int32_t, const Text&,
                        const Text&, std::int32_t, bool&) { surf_spSockets_Error(number, description); };
}

void SurfChecks::ReleaseSockets() {
  if (!surf_spSockets_) return;
  const std::int32_t count = surf_spSockets_->ArrayCount();
  for (std::int32_t index = 0; index <= count; ++index)
    if (surf_spSockets_->ArrayIndexInUse(index)) surf_spSockets_->ArrayRemove(index);
  surf_spSockets_->Release();
  surf_spSockets_.reset();
}

void SurfChecks::surf_RunCheck(std::int16_t& step) {
  BeginStep(step);
  const Check* check = CheckOf(step);
  if (!check) return ShowEnd();
  rows_.Add(check->caption, check->captionKey);
  rows_.Repaint();
  if (check->run) return RunLocal(step);
  surf_spSockets_->Connect(step, Text(check->exchange.host), check->exchange.port);
}

void SurfChecks::BeginStep(std::int16_t step) {
  surfRunning_ = kTrue16;
  if (step > 1 && step <= kLastStep + 1) rows_.EndBold();
  if (step <= kLastStep) ShowRule(step);
  rows_.LeaveRow();
}

void SurfChecks::ShowRule(std::int16_t step) {
  const auto number = static_cast<std::size_t>(step - 1);
  forms::PictureBox& rule = page_.surf_picLine.at(number);
  forms::Geometry place = rule.Position;
  place.top = SurfPage::RuleTop(number);
  rule.Position = place;
  rule.Visible = true;
  screen_.Repaint(page_.window);
}

void SurfChecks::RunLocal(std::int16_t& step) {
  const Outcome outcome = CheckOf(step)->run(local_, rows_);
  if (outcome == Outcome::Failed) CountFailure();
  rows_.AddIcon(outcome);
  step = ToInt16(step + 1);
  rows_.Repaint();
  surf_RunCheck(step);
}

void SurfChecks::ShowEnd() {
  rows_.AddBlank();
  rows_.Add(u"הסתיים", u"");
}

void SurfChecks::CountFailure() { surfFailCount_ = ToInt16(surfFailCount_ + 1); }

void SurfChecks::surf_spSockets_Connect(Index index) {
  if (const Exchange* exchange = ExchangeOf(ToInt16(index.AsInt32())))
    surf_spSockets_->SendData(index, exchange->request);
}

void SurfChecks::surf_spSockets_DataArrival(Index index) {
  if (index.AsInt32() == surfCheckStep_) rows_.AddIcon(Outcome::Passed);
  surf_spSockets_CloseSck(index);
}

void SurfChecks::surf_spSockets_CloseSck(Index index) {
  if (index.AsInt32() != surfCheckStep_) return;
  surfCheckStep_ = ToInt16(surfCheckStep_ + 1);
  surf_RunCheck(surfCheckStep_);
}

void SurfChecks::surf_spSockets_Error(std::int16_t number, const Text& description) {
  CountFailure();
  surfCheckStep_ = ToInt16(surfCheckStep_ + 1);
  rows_.ShowError(DecimalText(number) + u" - " + description);
  rows_.AddIcon(Outcome::Failed);
  surf_RunCheck(surfCheckStep_);
}

void SurfChecks::surf_lblBack_Click() {
  if (page_.advanced.frmSurf_frameAdvanced.Visible())
    page_.advanced.frmSurf_frameAdvanced.Visible = false;
  else
    surf_StopChecks();
}

} // namespace quendra::diagnostics
