#include "standins/windows/wpcap/RecordedFrames.h"

#include "winapi/Winapi.h"

#include <iphlpapi.h>

#include <array>
#include <cstdio>
#include <memory>

namespace quendra::standins {

namespace {

constexpr long kFileHeaderBytes = 24;
constexpr std::uint32_t kMostBytes = 262144;

/// What stands before each frame.
struct RecordHeader {
  std::uint32_t seconds;
  std::uint32_t microseconds;
  std::uint32_t kept;
  std::uint32_t onTheWire;
};

struct Closer {
  void operator()(std::FILE* file) const { std::fclose(file); }
};
using File = std::unique_ptr<std::FILE, Closer>;

std::string FolderOfFrames() {
  std::array<char, MAX_PATH> folder{};
  const DWORD length =
      ::GetEnvironmentVariableA("QUENDRA_FRAMES", folder.data(), static_cast<DWORD>(folder.size()));
  return length < folder.size() ? std::string(folder.data(), length) : std::string();
}

/// Where the next record of the device begins; nullptr while there is no file.
File OpenAtNext(WpcapScript::Device& device) {
  if (device.file.empty()) return nullptr;
  File file(std::fopen(device.file.c_str(), "rb"));
  if (device.taken == 0) device.taken = kFileHeaderBytes;
  if (file && std::fseek(file.get(), device.taken, SEEK_SET) != 0) return nullptr;
  return file;
}

/// False while the record isn't whole: its other part is to come.
bool ReadFrame(std::FILE* file, std::vector<std::uint8_t>& frame) {
  RecordHeader header{};
  if (std::fread(&header, sizeof header, 1, file) != 1 || header.kept > kMostBytes) return false;
  frame.resize(header.kept);
  return std::fread(frame.data(), 1, frame.size(), file) == frame.size();
}

} // namespace

std::vector<WpcapScript::Device> RecordedDevices() {
  std::vector<WpcapScript::Device> devices;
  const std::string folder = FolderOfFrames();
  if (folder.empty()) return devices;
  ULONG bytes = 0;
  ::GetAdaptersInfo(nullptr, &bytes);
  std::vector<IP_ADAPTER_INFO> room(bytes / sizeof(IP_ADAPTER_INFO) + 1);
  bytes = static_cast<ULONG>(room.size() * sizeof(IP_ADAPTER_INFO));
  if (::GetAdaptersInfo(room.data(), &bytes) != ERROR_SUCCESS) return devices;
  for (const IP_ADAPTER_INFO* card = room.data(); card != nullptr; card = card->Next) {
    WpcapScript::Device device;
    device.name = std::string("\\Device\\NPF_") + card->AdapterName;
    device.description = card->Description;
    device.file = folder + "/" + card->Description + ".pcap";
    devices.push_back(std::move(device));
  }
  return devices;
}

void PassOverRecordedFrames(WpcapScript::Device& device) {
  const File file = OpenAtNext(device);
  std::vector<std::uint8_t> frame;
  while (file && ReadFrame(file.get(), frame)) device.taken = std::ftell(file.get());
}

void TakeRecordedFrames(WpcapScript::Device& device, int most) {
  const File file = OpenAtNext(device);
  std::vector<std::uint8_t> frame;
  for (int count = 0; file && count < most && ReadFrame(file.get(), frame); ++count) {
    device.taken = std::ftell(file.get());
    device.waiting.push_back(frame);
  }
}

} // namespace quendra::standins
