#include "capture/CaptureSession.h"

#include "capture/CaptureState.h"
#include "capture/mod_functions.h"
#include "platform/system/System.h"

namespace quendra::capture {

namespace {

constexpr char16_t kSchedulerWords[] = u"(Microsoft's Packet Scheduler)";
constexpr std::int32_t kSessionValue = 1000;
constexpr std::int32_t kChannelSize = 15000;
constexpr std::uint32_t kPauseAfterEnd = 300;

std::string TextOf(const std::array<char, 255>& field) { return std::string(field.begin(), field.end()); }

/// Counts an event as under way for as long as it is.
class EventUnderWay {
 public:
  explicit EventUnderWay(int& count) : count_(count) { ++count_; }
  ~EventUnderWay() { --count_; }
  EventUnderWay(const EventUnderWay&) = delete;
  EventUnderWay& operator=(const EventUnderWay&) = delete;

 private:
  int& count_;
};

} // namespace

CaptureSession::CaptureSession(const platform::Machine& machine, forms::Desktop& desktop,
                               monitor::MonitorPage page, CaptureFields& fields,
                               PacketAttribution& attribution)
    : machine_(machine), desktop_(desktop), page_(page), fields_(fields), attribution_(attribution) {
  UnloadMainWindow = [this] { desktop_.Unload(page_.frameMain.OwnerForm()); };
}

CaptureSession::~CaptureSession() {
  machine_.captureLibrary.AdapterChanged = nullptr;
  fields_.vpacket.reset();
}

void CaptureSession::InitLibrary() {
  machine_.captureLibrary.AdapterChanged = [this] { OnAdapterChanged(); };
  fields_.CaptureInitResult = machine_.captureLibrary.VBPcapInit();
}

void CaptureSession::CreateControl() {
  RetireControl();
  fields_.vpacket = machine_.captureControls.Create();
  fields_.vpacket->PacketReceived = [this, sender = ++controlsMade_] { OnPacketReceived(sender); };
}

void CaptureSession::ReadLocalAddresses() {
  const HostAddresses host(machine_);
  fields_.LocalAddressLast = host.LocalHostAddress(true);
  fields_.GatewayAddress = host.GatewayAddress();
  fields_.LocalAddressPrevious = host.LocalHostAddress(false);
}

void CaptureSession::StartCapture() {
  if (fields_.CaptureInitResult == -1) {
    machine_.captureLibrary.VBPcapTerminate();
    ShowCaptureState();
    return;
  }
  FillAdapterList();
  if (fields_.CurrentAdapter == -1) fields_.CurrentAdapter = 0;
  page_.main_cmbAdapters.SelectItem(fields_.CurrentAdapter);
  machine_.captureLibrary.vpSetCurrentAdapter(fields_.CurrentAdapter);
  machine_.captureLibrary.vpBegin(kSessionValue);
  StartControl();
  page_.frameMain.Visible = true;
}

void CaptureSession::FillAdapterList() {
  page_.main_cmbAdapters.Clear();
  fields_.CurrentAdapter = -1;
  for (std::int32_t adapter = 0; adapter <= fields_.CaptureInitResult; ++adapter)
    ListAdapter(ToInt16(adapter));
}

void CaptureSession::ListAdapter(std::int16_t adapter) {
  platform::AdapterInfo info;
  machine_.captureLibrary.vpGetAdapterInfo(adapter, info);
  const bool known = CarriesKnownAddress(info);
  AddDescription(info);
  if (known && fields_.CurrentAdapter == -1) fields_.CurrentAdapter = adapter;
}

/// An adapter that is listed a second time through the packet scheduler gets no item of its own. Its index
/// counts all the same, so from there on the positions in the list are lower than the indexes.
void CaptureSession::AddDescription(const platform::AdapterInfo& info) {
  const Text all = Replaced(FromCodePage(TextOf(info.AdapterDescription)), kSchedulerWords, {});
  const Text description(CutAtNul(TextView(all)));
  forms::ComboBox& list = page_.main_cmbAdapters;
  for (int i = 0; i < list.ListCount(); ++i)
    if (list.List(i) == description) return;
  list.AddItem(description);
}

bool CaptureSession::CarriesKnownAddress(const platform::AdapterInfo& info) {
  platform::Ipv4Address address;
  std::uint32_t unread = 0;
  Control().AdapterAddress(TextOf(info.AdapterName), address, unread);
  if (address.IsAny()) return false;
  const Text text = address.AsText();
  return text == fields_.LocalAddressLast || text == fields_.GatewayAddress ||
         text == fields_.LocalAddressPrevious;
}

void CaptureSession::StartControl() {
  platform::AdapterInfo info;
  machine_.captureLibrary.vpGetAdapterInfo(fields_.CurrentAdapter, info);
  std::int32_t ignored = 0;
  Control().BindAdapter(TextOf(info.AdapterName), ignored);
  Control().SetValueA(32);
  Control().SetValueB(kSessionValue);
  Control().OpenChannel(ignored);
  Control().SetChannelSize(kChannelSize, ignored);
  Control().SetValueC(kChannelSize);
  Control().StartEvents(ignored);
  fields_.CaptureRunning = true;
  goneSince_.reset();
  ShowCaptureState();
}

void CaptureSession::StopCapture() {
  fields_.CaptureRunning = false;
  machine_.captureLibrary.vpEnd();
  machine_.system.Sleep(kPauseAfterEnd);
  std::int32_t ignored = 0;
  Control().StopEvents(ignored);
  Control().ReleaseChannel(ignored);
  Control().CloseChannel(ignored);
}

void CaptureSession::main_cmbAdapters_Click() {
  const int selected = page_.main_cmbAdapters.ListIndex();
  if (selected == fields_.CurrentAdapter) return;
  std::int32_t ignored = 0;
  Control().StopEvents(ignored);
  Control().CloseChannel(ignored);
  CreateControl();
  fields_.CaptureRunning = false;
  machine_.captureLibrary.vpSetCurrentAdapter(ToInt16(selected));
  fields_.CurrentAdapter = ToInt16(selected);
  StartControl();
}

void CaptureSession::main_DoCapture() {
  if (!page_.frameMain.Visible()) return;
  platform::CaptureLibrary& library = machine_.captureLibrary;
  library.vpSetParam(0, 65536);
  library.vpSetParam(6, 1024);
  library.vpBegin(kSessionValue);
  FrameDecoders decoders;
  platform::CaptureHeader header{};
  while (page_.frameMain.Visible() && fields_.CaptureRunning) {
    platform::FrameBytes frame;
    const std::int32_t result = library.vpCapture(frame, header);
    if (result < 0)
      UnloadMainWindow();
    else if (result == 0)
      desktop_.DoEvents();
    else
      attribution_.AttributePolledFrame(frame, decoders);
    attribution_.RefreshWhenDue();
  }
  library.vpEnd();
}

/// A device that is dialled again or found by the network again may have another address, by which its own
/// packets are known.
void CaptureSession::OnAdapterChanged() {
  using Availability = platform::CaptureLibrary::Availability;
  goneSince_.reset();
  if (machine_.captureLibrary.availability() == Availability::AdapterGone)
    goneSince_ = machine_.system.SecondOfDay();
  else
    ReadLocalAddresses();
  ShowCaptureState();
}

void CaptureSession::ShowCaptureState() {
  using Availability = platform::CaptureLibrary::Availability;
  Availability availability = machine_.captureLibrary.availability();
  if (availability == Availability::Available && fields_.CaptureInitResult == -1)
    availability = Availability::NoLibrary;
  page_.main_lblCaptureState.Caption = CaptureStateText(availability, goneSince_);
}

platform::CaptureControl& CaptureSession::Control() {
  if (!fields_.vpacket) throw Fault(Fault::kObjectNotSet);
  return *fields_.vpacket;
}

/// A control that may be raising its event right now lives on until that is over.
void CaptureSession::RetireControl() {
  if (!fields_.vpacket) return;
  if (eventsUnderWay_ == 0)
    fields_.vpacket.reset();
  else
    retired_.push_back(std::move(fields_.vpacket));
}

void CaptureSession::OnPacketReceived(int sender) {
  if (sender != controlsMade_) return;
  if (eventsUnderWay_ == 0) retired_.clear();
  const EventUnderWay event(eventsUnderWay_);
  attribution_.vpacket_PacketReceived();
}

} // namespace quendra::capture
