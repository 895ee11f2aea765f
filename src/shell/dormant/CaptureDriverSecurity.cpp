#include "shell/dormant/CaptureDriverSecurity.h"

namespace quendra::shell {

namespace {

/// Header, audit list and the access list up to its first trustee.
constexpr TextView kStart = u"01,00,14,80,a0,00,00,00,ac,00,00,00,14,00,00,00,30,00,00,00,"
                            u"02,00,1c,00,01,00,00,00,"
                            u"02,80,14,00,ff,01,0f,00,01,01,00,00,00,00,00,01,00,00,00,00,"
                            u"02,00,70,00,04,00,00,00,"
                            u"00,00,18,00,fd,01,02,00,01,01,00,00,00,00,00,05,12,00,00,00,";
/// The other entries of the access list, owner and group.
constexpr TextView kEnd =
    u",00,00,"
    u"00,00,1c,00,ff,01,0f,00,01,02,00,00,00,00,00,05,20,00,00,00,20,02,00,00,00,00,00,00,"
    u"00,00,18,00,8d,01,02,00,01,01,00,00,00,00,00,05,0b,00,00,00,00,00,00,00,"
    u"00,00,1c,00,fd,01,02,00,01,02,00,00,00,00,00,05,20,00,00,00,23,02,00,00,00,00,00,00,"
    u"01,01,00,00,00,00,00,05,12,00,00,00,"
    u"01,01,00,00,00,00,00,05,12,00,00,00";

Text WithBytes(TextView between) { return Text(kStart).append(between).append(kEnd); }

unsigned DigitOf(char16_t digit) { return digit <= u'9' ? digit - u'0' : (digit | 0x20U) - u'a' + 10U; }

} // namespace

Text NpfSecurity() { return WithBytes(u"00,00"); }
Text RpcapdSecurity() { return WithBytes(u"20,02"); }

Text FromHexBytes(const Text& hexBytes) {
  std::string bytes;
  for (std::size_t at = 0; at + 1 < hexBytes.size(); at += 3)
    bytes.push_back(static_cast<char>(DigitOf(hexBytes[at]) << 4 | DigitOf(hexBytes[at + 1])));
  return FromCodePage(bytes);
}

} // namespace quendra::shell
