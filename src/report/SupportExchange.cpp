#include "report/SupportExchange.h"

#include "foundation/Wording.h"
#include "report/SupportRequests.h"
#include "runtime/Settings.h"

namespace quendra::report {

namespace {

constexpr std::int16_t kNumber = 2;
constexpr std::int16_t kReport = 3;
constexpr std::int16_t kLoad = 4;
constexpr std::int16_t kWebPort = 80;
/// Boxes that stand on one another: each holds about 1.5 KB of the stack for as long as it stands.
constexpr int kMostNumberBoxes = 250;

constexpr const char16_t* kDefaultTitle = u"Quendra";

/// 0, which no socket has, for an index that is no number.
std::int32_t NumberOfIndex(const Variant& index) {
  if (const auto* number = index.Find<std::int16_t>()) return *number;
  const auto* number = index.Find<std::int32_t>();
  return number ? *number : 0;
}

} // namespace

SupportExchange::SupportExchange(foundation::modSocketPlus& module, forms::MessageLoop& loop,
                                 ReportControls& controls, monitor::ProcessTable& table,
                                 forms::Timer& main_Timer1)
    : module_(module), loop_(loop), controls_(controls), table_(table), main_Timer1_(main_Timer1) {
  controls_.main_cmdRpt.Click = [this] { main_cmdRpt_Click(); };
  controls_.main_Label2.DoubleClick = [this] { main_Label2_DblClick(); };
  controls_.main_Label3.DoubleClick = [this] { main_Label3_DblClick(); };
}

void SupportExchange::PrepareSockets() {
  main_spSockets_ = std::make_shared<foundation::CSocketPlus>(module_);
  for (std::int16_t index = kProcsPage; index <= kLoad; ++index) main_spSockets_->ArrayAdd(index);
  auto& events = main_spSockets_->Events;
  events.Connect = [this](Index index) { main_spSockets_Connect(index); };
  events.DataArrival = [this](Index index, std::int32_t) { main_spSockets_DataArrival(index); };
  events.CloseSck = [this](Index index) { main_spSockets_CloseSck(index); };
  events.Error = [this](Index index, std::int16_t number, const Text& description, std::int32_t, const Text&,
                        const Text&, std::int32_t,
                        bool&) { main_spSockets_Error(index, number, description); };
  OfferReport();
}

void SupportExchange::ReleaseSockets() {
  if (!main_spSockets_) return;
  const std::int32_t count = main_spSockets_->ArrayCount();
  for (std::int32_t index = 0; index <= count; ++index)
    if (main_spSockets_->ArrayIndexInUse(index)) main_spSockets_->ArrayRemove(index);
  main_spSockets_->Release();
  main_spSockets_.reset();
}

void SupportExchange::main_cmdRpt_Click() { Connect(kNumber, settings::SupportServerHost); }

void SupportExchange::main_Label3_DblClick() { Connect(kLoad, settings::SupportServerAddress); }

void SupportExchange::main_Label2_DblClick() { Close(kLoad); }

void SupportExchange::main_spSockets_Connect(Index index) {
  switch (NumberOfIndex(index)) {
  case kProcsPage:
    return OpenSockets().SendData(index, GetRequest(settings::SupportServerHost, u"/procs.htm"));
  case kNumber: return OpenSockets().SendData(index, GetRequest(settings::SupportServerHost, u"/getid.asp"));
  case kReport:
    ReportReply.clear();
    return OpenSockets().SendData(index, PostRequest(ReportBody(ReportNumber, table_.List())));
  case kLoad:
    return OpenSockets().SendData(index, GetRequest(settings::SupportServerAddress, u"/files/big.zip"));
  default: return;
  }
}

void SupportExchange::main_spSockets_DataArrival(Index index) {
  switch (NumberOfIndex(index)) {
  case kProcsPage: ProcsPageText += TakeText(index); return;
  case kNumber: return NumberArrived();
  case kReport: ReportReply += TakeText(index); return;
  default: return; // the load is left in the socket's buffer: only its traffic counts
  }
}

void SupportExchange::main_spSockets_CloseSck(Index index) {
  switch (NumberOfIndex(index)) {
  case kProcsPage: return ProcsPageClosed();
  case kNumber: return Close(kNumber);
  case kReport: return ReportClosed();
  case kLoad: return Close(kLoad);
  default: return;
  }
}

void SupportExchange::main_spSockets_Error(Index index, std::int16_t number, const Text& description) {
  const std::int32_t socket = NumberOfIndex(index);
  if (socket < kProcsPage || socket > kLoad) return;
  OfferReport(); // a connection that fails at once shows its box before Connect returns
  loop_.MessageBox(u"winsock error: " + DecimalText(number) + u" - " + description, 0,
                   socket == kProcsPage ? foundation::kTitle : kDefaultTitle);
}

foundation::CSocketPlus& SupportExchange::OpenSockets() {
  if (!main_spSockets_) throw Fault(Fault::kObjectNotSet);
  return *main_spSockets_;
}

void SupportExchange::Connect(std::int16_t index, TextView host) {
  OpenSockets().Connect(index, Text(host), kWebPort);
  OfferReport();
}

void SupportExchange::Close(std::int16_t index) {
  OpenSockets().CloseSck(index);
  OfferReport();
}

void SupportExchange::OfferReport() {
  if (!main_spSockets_) return; // the page was left while the box of an error stood
  const auto isClosed = [this](std::int16_t index) {
    return main_spSockets_->State(index) == foundation::sckClosed;
  };
  controls_.main_cmdRpt.Enabled = standingNumberBoxes_ == 0 && isClosed(kNumber) && isClosed(kReport);
}

Text SupportExchange::TakeText(Index index) {
  Variant data = Text();
  OpenSockets().GetData(index, data);
  return std::move(*data.Find<Text>());
}

void SupportExchange::NumberArrived() {
  const Text number = ReportNumberIn(TakeText(kNumber));
  if (!ShowNumber(number)) return OfferReport(); // the page may be open again
  ReportNumber = number;
  Connect(kReport, settings::SupportServerHost);
}

/// While the box stands, the next piece of a reply may arrive and open its own box on top. A server that
/// sends piece after piece must not use up the stack.
bool SupportExchange::ShowNumber(const Text& number) {
  if (standingNumberBoxes_ == kMostNumberBoxes) throw Fault(Fault::kOutOfStackSpace);
  struct Standing {
    int& count;
    explicit Standing(int& boxes) : count(boxes) { ++count; }
    ~Standing() { --count; }
  } const standing(standingNumberBoxes_);
  return ShowHebrewBox(u"מספר הדו\"ח שלך הוא: " + number, forms::kInformation);
}

void SupportExchange::ReportClosed() {
  const bool accepted = ReportReply.find(u"~OK") != Text::npos;
  const bool goesOn = accepted ? ShowHebrewBox(u"הדו\"ח נשלח בהצלחה.", forms::kInformation)
                               : ShowHebrewBox(u"בעיה בשליחת הדו\"ח!", forms::kCritical);
  if (goesOn) Close(kReport);
}

bool SupportExchange::ShowHebrewBox(const Text& text, int icon) {
  const std::weak_ptr<foundation::CSocketPlus> page = main_spSockets_;
  loop_.MessageBox(text, icon | forms::kHebrewBox, foundation::kTitle);
  return !page.expired();
}

} // namespace quendra::report
