// Any bytes as a frame, through the three decoders and then once more cut in half, as fields outlive their
// frame.

#include "capture/clsEthernet.h"
#include "capture/clsIP.h"
#include "capture/clsTCP.h"

#include <algorithm>
#include <cstdlib>
#include <vector>

namespace {

using namespace quendra;
using namespace quendra::capture;

void Require(bool holds) {
  if (!holds) std::abort();
}

/// Runs a decoder; the one fault that a frame may raise is that of a missing byte.
template <typename Work> bool Finishes(const Work& work) {
  try {
    work();
    return true;
  } catch (const Fault& fault) {
    Require(fault.number == Fault::kSubscript);
    return false;
  }
}

struct Decoders {
  clsEthernet ethernet;
  clsIP ip;
  clsTCP tcp;

  void Decode(const std::uint8_t* bytes, std::size_t size, bool tunnelled) {
    // A copy that goes before the fields are read, so that a field that points into the frame is found.
    const std::vector<std::uint8_t> copy(bytes, bytes + size);
    const platform::FrameBytes frame(copy.data(), static_cast<int>(size));
    Require(Finishes([&] { ethernet.Decode(frame); }));
    const bool ipDone = Finishes([&] { ip.Decode(frame); });
    const bool tcpDone = Finishes([&] { tcp.Decode(frame, 4 * ip.TotalLength(), tunnelled); });
    Require(ipDone || size < 74);
    Require(tcpDone || size < 54);
  }

  void ReadEveryField() const {
    const Text link =
        ethernet.DestinationMAC() + ethernet.SourceMAC() + ethernet.TypeCode() + ethernet.TypeCodeString();
    Require(ethernet.LastByte() == 0 || ethernet.LastByte() == 13 || ethernet.LastByte() == 21);
    Require(link.size() >= 1);
    const Text internet = ip.SrcIP() + ip.DestIP() + ip.HD_Cheksum() + ip.sProtocol();
    Require(internet.size() <= 15 + 15 + 4 + 7);
    Require(ip.Ver() <= 15 && ip.IHL() <= 15 && ip.Options() == 0);
    Require(ip.FragmentOffset() >= 0 && ip.FragmentOffset() <= 0x1FFF);
    Require(ip.TTL() >= 0 && ip.TTL() <= 255 && ip.Protocol() >= 0 && ip.Protocol() <= 255);
    Require(ip.Identification() == 0 || ip.Identification() == 4627 || ip.Identification() == 14907);
    Require(tcp.srcPort() == DecimalText(tcp.SourcePort()) &&
            tcp.dstPort() == DecimalText(tcp.DestinationPort()));
    Require(tcp.SourcePort() >= -32768 && tcp.SourcePort() <= 32767 && tcp.HLEN() <= 15);
    const Text flags = tcp.flagString();
    Require(std::count(flags.begin(), flags.end(), u';') <= 6);
    const std::int64_t sum = static_cast<std::int64_t>(tcp.seqNumber()) + tcp.ackNumber() + tcp.window() +
                             tcp.UrgentPointer() + tcp.flags();
    Require(sum < INT64_MAX);
    Require(tcp.HD_Checksum() == 0 && tcp.dataoffset() == 0 && tcp.Reserved() == 0 && tcp.OptPad() == 0);
    Require(tcp.Protocol() == 6);
  }
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  for (const bool tunnelled : {false, true}) {
    Decoders decoders;
    // The first byte moves the addresses, too: within the frame, beyond it, before it.
    if (size > 0) decoders.ethernet.start(static_cast<std::int16_t>(static_cast<std::int8_t>(data[0])));
    decoders.Decode(data, size, tunnelled);
    decoders.ReadEveryField();
    decoders.Decode(data, size / 2, tunnelled);
    decoders.ReadEveryField();
  }
  return 0;
}
