#include "platform/capture/LinkForm.h"

namespace quendra::platform {

std::optional<LinkForm> LinkFormOf(int linkType) {
  switch (linkType) {
  case link_type::kEthernet: return LinkForm::Ethernet;
  case link_type::kRawIp:
  case link_type::kRawIpv4:
  case link_type::kRawIpv6: return LinkForm::RawIp;
  case link_type::kFamily:
  case link_type::kBigFamily: return LinkForm::Family;
  case link_type::kLinuxCooked: return LinkForm::LinuxCooked;
  case link_type::kLinuxCooked2: return LinkForm::LinuxCooked2;
  case link_type::kPpp:
  case link_type::kSerialPpp: return LinkForm::Ppp;
  default: return std::nullopt;
  }
}

const char* CaptureFilterOf(LinkForm form) {
  switch (form) {
  // The test of the protocol sees what stands inside the tag of a virtual network too; the capture loop gets
  // the frame with its tag and would take it for another type.
  case LinkForm::Ethernet: return "(ip proto 6 or ip proto 47) and not vlan";
  // Its headers are of more kinds than filters know.
  case LinkForm::Ppp: return "";
  default: return "ip proto 6 or ip proto 47";
  }
}

} // namespace quendra::platform
