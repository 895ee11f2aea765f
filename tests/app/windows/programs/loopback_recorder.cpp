// A program of the system below Wine, which alone sees the frames of its loopback: records those of TCP
// between two of the ends as capture programs do, into a file of frames with Ethernet headers.
//
//   loopback_recorder FILE ADDRESS:PORT...
//
// Once FILE is there it records. It ends when FILE.end is there, and then removes that: all that had passed
// before is in the file.

#include <algorithm>
#include <arpa/inet.h>
#include <array>
#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <linux/if_packet.h>
#include <net/ethernet.h>
#include <net/if.h>
#include <poll.h>
#include <string>
#include <sys/socket.h>
#include <sys/time.h>
#include <sys/uio.h>
#include <unistd.h>
#include <vector>

namespace {

constexpr unsigned kMostSeconds = 300;
constexpr int kPatience = 20; // milliseconds between looks for the end
constexpr int kBufferBytes = 64 << 20;
constexpr std::size_t kMostBytes = 1 << 17;

struct FileHeader {
  std::uint32_t mark = 0xA1B2C3D4;
  std::uint16_t version = 2, smallVersion = 4;
  std::uint32_t zone = 0, accuracy = 0;
  std::uint32_t mostBytes = kMostBytes;
  std::uint32_t linkType = 1;
};

struct RecordHeader {
  std::uint32_t seconds, microseconds, kept, onTheWire;
};

using Bytes = std::vector<std::uint8_t>;
using Ends = std::vector<std::array<std::uint8_t, 6>>; // as headers have them

int OpenLoopback() {
  const int line = socket(AF_PACKET, SOCK_RAW, htons(ETH_P_IP));
  setsockopt(line, SOL_SOCKET, SO_RCVBUFFORCE, &kBufferBytes, sizeof kBufferBytes);
  sockaddr_ll loopback{};
  loopback.sll_family = AF_PACKET;
  loopback.sll_protocol = htons(ETH_P_IP);
  loopback.sll_ifindex = static_cast<int>(if_nametoindex("lo"));
  const bool bound = bind(line, reinterpret_cast<const sockaddr*>(&loopback), sizeof loopback) == 0;
  return line >= 0 && loopback.sll_ifindex != 0 && bound ? line : -1;
}

/// 0.0.0.0:0 for what is none.
Ends::value_type EndOf(const std::string& word) {
  Ends::value_type end{};
  const std::size_t colon = word.find(':');
  const in_addr_t address = inet_addr(word.substr(0, colon).c_str());
  const std::uint16_t port = htons(static_cast<std::uint16_t>(std::atoi(word.c_str() + colon + 1)));
  std::memcpy(end.data(), &address, sizeof address);
  std::memcpy(end.data() + sizeof address, &port, sizeof port);
  return end;
}

bool IsOfTheTalk(const Bytes& frame, std::size_t length, const Ends& ends) {
  constexpr std::size_t kIp = ETH_HLEN, kAddresses = kIp + 12;
  const std::size_t ports = length > kIp ? kIp + 4U * (frame[kIp] & 15U) : length;
  if (ports + 4 > length || ports < kAddresses + 8 || frame[kIp] >> 4 != 4 || frame[kIp + 9] != 6)
    return false;
  const auto isOurs = [&](std::size_t side) { // 0 the source, 1 the target
    Ends::value_type end{};
    std::copy_n(&frame[kAddresses + 4 * side], 4, end.begin());
    std::copy_n(&frame[ports + 2 * side], 2, end.begin() + 4);
    return std::find(ends.begin(), ends.end(), end) != ends.end();
  };
  return isOurs(0) && isOurs(1);
}

/// False when none waits.
bool RecordNext(int line, int file, const Ends& ends) {
  static Bytes frame(kMostBytes);
  sockaddr_ll from{};
  socklen_t size = sizeof from;
  const ssize_t got =
      recvfrom(line, frame.data(), frame.size(), MSG_DONTWAIT, reinterpret_cast<sockaddr*>(&from), &size);
  if (got < 0) return errno == EINTR;
  const auto length = static_cast<std::uint32_t>(got);
  // What goes out over loopback also comes in.
  if (from.sll_pkttype == PACKET_OUTGOING || !IsOfTheTalk(frame, length, ends)) return true;
  timeval now{};
  gettimeofday(&now, nullptr);
  RecordHeader header{static_cast<std::uint32_t>(now.tv_sec), static_cast<std::uint32_t>(now.tv_usec), length,
                      length};
  const iovec parts[] = {{&header, sizeof header}, {frame.data(), length}};
  if (writev(file, parts, 2) != static_cast<ssize_t>(sizeof header + length)) std::exit(3);
  return true;
}

} // namespace

int main(int count, char** words) {
  if (count < 3) return 2;
  const std::string path = words[1];
  const std::string end = path + ".end";
  Ends ends;
  for (int i = 2; i < count; ++i) ends.push_back(EndOf(words[i]));
  alarm(kMostSeconds);
  const int line = OpenLoopback();
  if (line < 0) return 1;
  const int file = open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_APPEND, 0644);
  const FileHeader header;
  if (write(file, &header, sizeof header) != sizeof header) return 1;
  for (bool isEnding = false; !isEnding;) {
    pollfd waiting{line, POLLIN, 0};
    poll(&waiting, 1, kPatience);
    isEnding = access(end.c_str(), F_OK) == 0;
    while (RecordNext(line, file, ends)) {
    }
  }
  close(file);
  return unlink(end.c_str());
}
