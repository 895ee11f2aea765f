#include "platform/linux/remote_access/LinuxDialling.h"

#include "platform/linux/remote_access/DialParamsImage.h"
#include "platform/linux/remote_access/DialParamsStore.h"
#include "platform/linux/remote_access/RasErrorTexts.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RecordList.h"

#include <unistd.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

constexpr std::uint64_t kRound = 500'000;
constexpr int kRoundsOfSilence = 10;

bool IsConnectionSize(std::uint32_t size) {
  using Record = RasConnectionRecord;
  return size == Record::kBytes || size == Record::kBytesWithoutGuid ||
         size == Record::kBytesWithoutPhoneBook || size == Record::kBytesOfShortNames;
}

void PutConnection(RasConnection handle, const Line& line, std::span<std::uint8_t> record) {
  using Record = RasConnectionRecord;
  const bool isShort = record.size() == Record::kBytesOfShortNames;
  PutLittle32(record, Record::kHandle, handle.Value());
  PutFieldText(record, Record::kEntryName, isShort ? Record::kShortEntryNameBytes : Record::kEntryNameBytes,
               line.name);
  if (isShort) return;
  PutFieldText(record, Record::kDeviceType, Record::kDeviceTypeBytes, DeviceTypeOf(line.kind));
  PutFieldText(record, Record::kDeviceName, Record::kDeviceNameBytes, DeviceTypeOf(line.kind));
}

} // namespace

LinuxDialling::LinuxDialling(ConnectionBook& book, NetworkManagerBus& bus, EventLoop& loop,
                             std::string kernelFolder)
    : book_(book), bus_(bus), loop_(loop), kernelFolder_(std::move(kernelFolder)) {
  bus_.Listen([this](const BusSignal& signal) { Hear(signal); });
}

void LinuxDialling::Hear(const BusSignal& signal) {
  const auto calls = calls_;
  for (const Call& call : calls)
    if (call.dial) call.dial->Take(signal);
  if (signal.TellsOfAnotherManager()) std::erase_if(calls_, [](const Call& call) { return !call.dial; });
}

Dial::Change LinuxDialling::TellerOf(const Notifier& notifier) {
  if (notifier.type != kRasNotifierIsWindow || notifier.window == kNoWindow)
    return [](std::uint32_t, std::uint32_t) {};
  const std::uint32_t registered = loop_.RegisterWindowMessageA(kRasDialEventName);
  return [this, window = notifier.window, message = registered ? registered : kRasDialEvent](
             std::uint32_t state, std::uint32_t error) { loop_.PostMessage(window, message, state, error); };
}

std::uint32_t LinuxDialling::RasDialA(std::span<const std::uint8_t> extensions, const char*,
                                      std::span<const std::uint8_t> params, const Notifier& notifier,
                                      RasConnection& connection) {
  if (!book_.IsThere()) return kRasManagerCannotStart;
  if (const std::uint32_t error = ErrorOfDialParams(params)) return error;
  if (!extensions.empty() && (extensions.size() < 4 || Little32(extensions, 0) != RasDialExtensions::kBytes))
    return kRasInvalidSize;
  Line line;
  if (const std::uint32_t error = book_.Find(EntryNameOf(params), line)) return error;
  if (const std::uint32_t error = SaveUserAndPassword(book_, line, params)) return error;
  const auto kernel = [this] {
    return ::access(kernelFolder_.c_str(), F_OK) == 0 ? KernelPpp::There : KernelPpp::Missing;
  };
  const auto dial = std::make_shared<Dial>(bus_, line.kind, kernel, TellerOf(notifier));
  Call& call = Add(line);
  call.dial = dial;
  connection = call.handle;
  dial->Start(line.path);
  if (notifier.type == kRasNotifierIsWindow && notifier.window != kNoWindow) return kRasSuccess;
  const std::uint32_t error = WaitForEnd(dial);
  if (error == kRasSuccess) return error;
  Forget(connection);
  connection = kNoRasConnection;
  return error;
}

std::uint32_t LinuxDialling::WaitForEnd(const std::shared_ptr<Dial>& dial) {
  for (int round = 1; dial->CurrentStage() == Dial::Stage::Dialling; ++round) {
    bus_.Wait(kRound);
    if (round % kRoundsOfSilence == 0) dial->CheckAlive();
  }
  return dial->Error();
}

LinuxDialling::Call& LinuxDialling::Add(const Line& line) {
  return calls_.emplace_back(Call{RasConnection(++lastHandle_), line});
}

void LinuxDialling::Forget(RasConnection handle) {
  if (std::erase_if(calls_, [&](const Call& call) { return call.handle == handle; }) > 0)
    hungUp_.insert(handle);
}

std::uint32_t LinuxDialling::RasHangUpA(RasConnection connection) {
  if (hungUp_.contains(connection)) return kRasSuccess;
  const bool isThere = book_.IsThere();
  // The answer may have come after the end of the line.
  bus_.HandleArrived();
  const auto found = std::ranges::find(calls_, connection, &Call::handle);
  const bool hasEnded = found != calls_.end() && found->HasEnded();
  if (!hasEnded && !isThere) return kRasManagerCannotStart;
  if (found == calls_.end()) return kErrorInvalidHandle;
  const Call call = *found;
  std::uint32_t error = kRasSuccess;
  // What has ended is let go also where nobody can be asked about it.
  if (isThere) error = call.dial ? call.dial->HangUp() : EndActiveLine(bus_, call.activePath);
  if (error == kRasSuccess) Forget(connection);
  return error;
}

/// Also while NetworkManager hasn't told which connection the dial makes.
bool LinuxDialling::Call::Makes(const ActiveLine& active) const {
  // One that has ended and is active all the same was lost sight of.
  if (!dial || HasEnded()) return false;
  const bool isAnswered = !dial->ActivePath().empty();
  return isAnswered ? dial->ActivePath() == active.path : line.path == active.line.path;
}

std::uint32_t LinuxDialling::AddActive() {
  std::vector<ActiveLine> active;
  if (const std::uint32_t error = ReadActiveLines(bus_, book_, active)) return error;
  std::erase_if(active, [this](const ActiveLine& one) {
    return std::ranges::any_of(calls_, [&](const Call& call) { return call.Makes(one); });
  });
  std::erase_if(calls_, [&](const Call& call) {
    return !call.dial && std::ranges::find(active, call.activePath, &ActiveLine::path) == active.end();
  });
  for (const ActiveLine& one : active)
    if (std::ranges::find(calls_, one.path, &Call::activePath) == calls_.end())
      Add(one.line).activePath = one.path;
  return kRasSuccess;
}

std::uint32_t LinuxDialling::RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                                 std::uint32_t& count) {
  count = 0;
  if (const std::uint32_t error = AddActive()) return error;
  RecordList list{connections, bytes, count};
  const std::uint32_t size = list.StatedSize();
  if (!IsConnectionSize(size)) return kRasInvalidSize;
  std::vector<Call> standing;
  std::ranges::copy_if(calls_, std::back_inserter(standing),
                       [](const Call& call) { return !call.HasEnded(); });
  return list.Fill(size, standing.size(), [&](std::size_t i, auto record) {
    PutConnection(standing[i].handle, standing[i].line, record);
  });
}

std::uint32_t LinuxDialling::RasGetErrorStringA(std::uint32_t error, std::span<char> text) {
  const std::string_view found = RasErrorText(error);
  if (found.empty()) return kInvalidParameter;
  if (text.size() <= found.size()) return kRasBufferTooSmall;
  *std::ranges::copy(found, text.begin()).out = '\0';
  return kRasSuccess;
}

} // namespace quendra::platform::linux_
