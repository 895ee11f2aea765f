#include "platform/windows/process/WindowsHandles.h"

#include "platform/windows/process/SystemHandle.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform::windows {

/// What the native interface says of an operation's end.
struct StatusBlock {
  std::uint32_t status;
  std::uint32_t information;
};

namespace {

constexpr std::uint32_t kStatusPending = 0x103;

// Under names of ours, as is the block: the system's headers tell them apart by version.
using QuerySystem = LONG NTAPI(ULONG informationClass, void* buffer, ULONG length, ULONG* returned);
using QueryObject = LONG NTAPI(HANDLE handle, ULONG informationClass, void* buffer, ULONG length,
                               ULONG* returned);
using DeviceControl = LONG NTAPI(HANDLE handle, HANDLE event, void* routine, void* context,
                                 volatile StatusBlock* status, ULONG code, const void* input,
                                 ULONG inputLength, void* output, ULONG outputLength);

ULONG LengthOf(std::span<const std::uint8_t> bytes) { return static_cast<ULONG>(bytes.size()); }

} // namespace

/// What the system writes to when it answers, which may be after the call.
struct WindowsHandles::Request {
  volatile StatusBlock status{kStatusPending, 0};
  std::vector<std::uint8_t> input;
  std::vector<std::uint8_t> output;
};

WindowsHandles::WindowsHandles(LastError& lastError) : lastError_(lastError) {}

WindowsHandles::~WindowsHandles() {
  DropAnswered();
  // The system may write to the others as long as this process runs.
  for (auto& request : waiting_) static_cast<void>(request.release());
}

void WindowsHandles::DropAnswered() {
  std::erase_if(waiting_, [](const auto& request) { return request->status.status != kStatusPending; });
}

std::uint32_t WindowsHandles::NtQuerySystemInformation(std::uint32_t informationClass,
                                                       std::span<std::uint8_t> buffer,
                                                       std::uint32_t& returnedLength) {
  ULONG returned = 0;
  const auto query = ntdll_.Find<QuerySystem>("NtQuerySystemInformation");
  const std::uint32_t status =
      query ? static_cast<std::uint32_t>(query(informationClass, buffer.data(), LengthOf(buffer), &returned))
            : kStatusNotImplemented;
  returnedLength = returned;
  // Some systems tell the length alone.
  const bool lacksCount = status == kStatusInfoLengthMismatch && informationClass == kHandleTable &&
                          returned > kCountBytes && buffer.size() >= kCountBytes && Little32(buffer, 0) == 0;
  if (lacksCount) PutLittle32(buffer, 0, static_cast<std::uint32_t>((returned - kCountBytes) / kRecordBytes));
  return status;
}

bool WindowsHandles::DuplicateHandle(Handle sourceProcess, Handle handle, Handle targetProcess,
                                     Handle& duplicate, std::uint32_t access, bool inherit,
                                     std::uint32_t options) {
  HANDLE made = nullptr;
  if (!lastError_.Succeeded(::DuplicateHandle(ToSystem(sourceProcess), ToSystem(handle),
                                              ToSystem(targetProcess), &made, access, inherit,
                                              options) != FALSE))
    return false;
  duplicate = FromSystem(made);
  return true;
}

std::uint32_t WindowsHandles::NtQueryObject(Handle handle, std::uint32_t informationClass,
                                            std::span<std::uint8_t> buffer, std::uint32_t& returnedLength) {
  ULONG returned = 0;
  const auto query = ntdll_.Find<QueryObject>("NtQueryObject");
  const std::uint32_t status =
      query ? static_cast<std::uint32_t>(
                  query(ToSystem(handle), informationClass, buffer.data(), LengthOf(buffer), &returned))
            : kStatusNotImplemented;
  returnedLength = returned;
  return status;
}

Handle WindowsHandles::CreateEventW(bool manualReset, bool initialState, const std::u16string& name) {
  const HANDLE event =
      ::CreateEventW(nullptr, manualReset, initialState, name.empty() ? nullptr : winapi::Wide(name));
  lastError_.Succeeded(event != nullptr);
  return FromSystem(event);
}

std::uint32_t WindowsHandles::NtDeviceIoControlFile(Handle handle, Handle event, std::uint32_t controlCode,
                                                    std::span<const std::uint8_t> input,
                                                    std::span<std::uint8_t> output) {
  const auto control = ntdll_.Find<DeviceControl>("NtDeviceIoControlFile");
  if (!control) return kStatusNotImplemented;
  DropAnswered();
  auto request = std::make_unique<Request>();
  request->input.assign(input.begin(), input.end());
  request->output.assign(output.begin(), output.end());
  const auto status = static_cast<std::uint32_t>(control(
      ToSystem(handle), ToSystem(event), nullptr, nullptr, &request->status, controlCode,
      request->input.data(), LengthOf(request->input), request->output.data(), LengthOf(request->output)));
  if (status == kStatusPending) // nobody waits for it
    waiting_.push_back(std::move(request));
  else
    std::ranges::copy(request->output, output.begin());
  return status;
}

} // namespace quendra::platform::windows
