#include "capture/CaptureSession.h"

#include "capture/CaptureState.h"
#include "runtime/Integers.h"

namespace quendra::capture {

namespace {

constexpr char16_t kSchedulerWords[] = u"(Microsoft's Packet Scheduler)";
constexpr std::int32_t kChannelSize = 15000;
constexpr std::uint32_t kPauseAfterEnd = 300;

std::string TextOf(const std::array<char, 255>& field) { return std::string(field.begin(), field.end()); }

} // namespace

CaptureSession::CaptureSession(platform::CaptureLibrary& library, platform::System& system,
                               AdapterControls& controls, PacketControl& control, OwnAddresses& addresses)
    : library_(library), system_(system), controls_(controls), control_(control), addresses_(addresses) {
  controls_.main_cmbAdapters.Click = [this] { main_cmbAdapters_Click(); };
}

CaptureSession::~CaptureSession() {
  controls_.main_cmbAdapters.Click = nullptr;
  library_.AdapterChanged = nullptr;
  control_.vpacket.reset();
}

void CaptureSession::InitLibrary() {
  library_.AdapterChanged = [this] { OnAdapterChanged(); };
  CaptureInitResult = library_.VBPcapInit();
}

void CaptureSession::StartCapture() {
  if (CaptureInitResult == -1) {
    library_.VBPcapTerminate();
    ShowCaptureState();
    return;
  }
  FillAdapterList();
  if (CurrentAdapter == -1) CurrentAdapter = 0;
  controls_.main_cmbAdapters.SelectItem(CurrentAdapter);
  library_.vpSetCurrentAdapter(CurrentAdapter);
  library_.vpBegin(kSessionValue);
  StartControl();
  controls_.frameMain.Visible = true;
}

void CaptureSession::FillAdapterList() {
  controls_.main_cmbAdapters.Clear();
  CurrentAdapter = -1;
  for (std::int32_t adapter = 0; adapter <= CaptureInitResult; ++adapter) ListAdapter(ToInt16(adapter));
}

void CaptureSession::ListAdapter(std::int16_t adapter) {
  platform::AdapterInfo info;
  library_.vpGetAdapterInfo(adapter, info);
  const bool known = CarriesKnownAddress(info);
  AddDescription(info);
  if (known && CurrentAdapter == -1) CurrentAdapter = adapter;
}

/// An adapter that is listed a second time through the packet scheduler gets no item of its own. Its index
/// counts all the same, so from there on the positions in the list are lower than the indexes.
void CaptureSession::AddDescription(const platform::AdapterInfo& info) {
  const Text all = Replaced(FromCodePage(TextOf(info.AdapterDescription)), kSchedulerWords, {});
  const Text description(CutAtNul(TextView(all)));
  forms::ComboBox& list = controls_.main_cmbAdapters;
  for (int i = 0; i < list.ListCount(); ++i)
    if (list.List(i) == description) return;
  list.AddItem(description);
}

bool CaptureSession::CarriesKnownAddress(const platform::AdapterInfo& info) {
  platform::Ipv4Address address;
  std::uint32_t unread = 0;
  control_.Get().AdapterAddress(TextOf(info.AdapterName), address, unread);
  if (address.IsAny()) return false;
  const Text text = address.AsText();
  return text == addresses_.LocalAddressLast || text == addresses_.GatewayAddress ||
         text == addresses_.LocalAddressPrevious;
}

void CaptureSession::StartControl() {
  platform::AdapterInfo info;
  library_.vpGetAdapterInfo(CurrentAdapter, info);
  std::int32_t ignored = 0;
  control_.Get().BindAdapter(TextOf(info.AdapterName), ignored);
  control_.Get().SetValueA(32);
  control_.Get().SetValueB(kSessionValue);
  control_.Get().OpenChannel(ignored);
  control_.Get().SetChannelSize(kChannelSize, ignored);
  control_.Get().SetValueC(kChannelSize);
  control_.Get().StartEvents(ignored);
  CaptureRunning = true;
  goneSince_.reset();
  ShowCaptureState();
}

void CaptureSession::StopCapture() {
  CaptureRunning = false;
  library_.vpEnd();
  system_.Sleep(kPauseAfterEnd);
  std::int32_t ignored = 0;
  control_.Get().StopEvents(ignored);
  control_.Get().ReleaseChannel(ignored);
  control_.Get().CloseChannel(ignored);
}

void CaptureSession::main_cmbAdapters_Click() {
  const int selected = controls_.main_cmbAdapters.ListIndex();
  if (selected == CurrentAdapter) return;
  std::int32_t ignored = 0;
  control_.Get().StopEvents(ignored);
  control_.Get().CloseChannel(ignored);
  control_.Create();
  CaptureRunning = false;
  library_.vpSetCurrentAdapter(ToInt16(selected));
  CurrentAdapter = ToInt16(selected);
  StartControl();
}

/// A device that is dialled again or found by the network again may have another address, by which its own
/// packets are known.
void CaptureSession::OnAdapterChanged() {
  using Availability = platform::CaptureLibrary::Availability;
  goneSince_.reset();
  if (library_.availability() == Availability::AdapterGone)
    goneSince_ = system_.SecondOfDay();
  else
    addresses_.Read();
  ShowCaptureState();
}

void CaptureSession::ShowCaptureState() {
  using Availability = platform::CaptureLibrary::Availability;
  Availability availability = library_.availability();
  if (availability == Availability::Available && CaptureInitResult == -1)
    availability = Availability::NoLibrary;
  controls_.main_lblCaptureState.Caption = CaptureStateText(availability, goneSince_);
}

} // namespace quendra::capture
