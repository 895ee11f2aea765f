#include "app/windows/LoopbackRecording.h"

#include "app/windows/StartedProgram.h"
#include "runtime/ByteFields.h"

#include <fstream>
#include <iterator>
#include <span>

namespace quendra::app::windows {

namespace {

constexpr std::size_t kFileHeader = 24;
constexpr std::size_t kRecordHeader = 16;
constexpr std::size_t kEthernet = 14;

bool IsThere(const Text& file) { return ::GetFileAttributesW(winapi::Wide(file)) != INVALID_FILE_ATTRIBUTES; }

/// A program of the system below, for which the system of ours has no handles.
bool StartBelow(const Text& path, const Text& arguments, const Text& folder) {
  STARTUPINFOW how{};
  how.cb = sizeof how;
  PROCESS_INFORMATION started{};
  Text line = u"\"" + path + u"\" " + arguments;
  return ::CreateProcessW(winapi::Wide(path), reinterpret_cast<wchar_t*>(line.data()), nullptr, nullptr,
                          FALSE, 0, nullptr, winapi::Wide(folder), &how, &started);
}

LoopbackFrame Decoded(std::span<const std::uint8_t> packet) {
  const std::size_t tcp = 4U * (packet[0] & 15U);
  const std::size_t headers = tcp + 4U * (packet[tcp + 12] >> 4);
  LoopbackFrame frame;
  frame.source = platform::Ipv4Address::FromMemory(Little32(packet, 12));
  frame.sourcePort = Big16(packet, tcp);
  frame.targetPort = Big16(packet, tcp + 2);
  frame.sequence = Big32(packet, tcp + 4);
  frame.bytes = Big16(packet, 2);
  frame.payload = frame.bytes - static_cast<std::uint32_t>(headers);
  return frame;
}

} // namespace

bool LoopbackRecording::Begin(const std::vector<std::string>& ends) {
  Text words = u"loopback.pcap";
  for (const std::string& end : ends) words += u" " + FromUtf8(end);
  runs_ = StartBelow(FolderOfBuild() + u"\\loopback_recorder", words, folder_.Path());
  return runs_ && Until([&] { return IsThere(file_); });
}

bool LoopbackRecording::End() {
  if (!runs_) return false;
  runs_ = false;
  const Text end = file_ + u".end";
  const HANDLE file = ::CreateFileW(winapi::Wide(end), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr);
  if (file == INVALID_HANDLE_VALUE) return false;
  ::CloseHandle(file);
  return Until([&] { return !IsThere(end); });
}

std::vector<LoopbackFrame> LoopbackRecording::Frames() const {
  std::ifstream file(ToCodePage(file_), std::ios::binary);
  const std::vector<std::uint8_t> bytes{std::istreambuf_iterator<char>(file), {}};
  std::vector<LoopbackFrame> frames;
  for (std::size_t at = kFileHeader; at + kRecordHeader < bytes.size();) {
    const std::size_t length = Little32(bytes, at + 8);
    at += kRecordHeader;
    if (length > bytes.size() - at) break;
    frames.push_back(Decoded(std::span(bytes).subspan(at, length).subspan(kEthernet)));
    at += length;
  }
  return frames;
}

} // namespace quendra::app::windows
