#include "forms/Desktop.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/Dialling.h"
#include "platform/system/System.h"
#include "provisioning/remote_access/mdlDun.h"

#include <array>

namespace quendra::provisioning {

namespace {

/// Numbers above it are remote access's own.
constexpr std::int32_t kLastSystemError = 600;
constexpr std::size_t kTextBytes = 512;

Text TextIn(std::span<const char> buffer) {
  return FromCodePage(CutAtNul(std::string_view(buffer.data(), buffer.size())));
}

} // namespace

Text mdlDun::SystemErrorText(std::uint32_t number) {
  std::array<char, kTextBytes> buffer{};
  if (system_.FormatMessageA(platform::System::kFromSystem, number, 0, buffer) == 0)
    return u"Unknown Error  (FormatMessage API Failed To Retrieve Error Information)";
  return TextIn(buffer);
}

Text mdlDun::RasErrorText(std::uint32_t result, std::span<const char> told) const {
  if (result != platform::kRasSuccess)
    return u"Unknown Error  (RasGetErrorString API Failed To Retrieve Error Information)";
  return TextIn(told);
}

// Numbers are signed, as the program has always shown them: those of the system that are negative come from
// its other parts, and it has texts for them.
Boolean16 mdlDun::ReportRasError(std::uint32_t number, const Text& call, Boolean16 show) {
  const auto shown = static_cast<std::int32_t>(number);
  if (shown == 0) return kFalse16;
  Text text;
  if (shown > kLastSystemError) {
    std::array<char, kTextBytes> buffer{};
    const std::uint32_t result = dialling_.RasGetErrorStringA(number, buffer);
    if (result == platform::kInvalidParameter) return kFalse16;
    text = RasErrorText(result, buffer);
  } else {
    text = SystemErrorText(number);
  }
  if (show == kTrue16)
    ShowExclamation(u"  RAS API Error", u"The following error occured while calling the " + call +
                                            u" RAS API:\r\rError Number = " + DecimalText(shown) +
                                            u"\rError Description = " + text);
  return kTrue16;
}

} // namespace quendra::provisioning
