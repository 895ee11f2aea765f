#include "mail/OutlookProfile.h"

#include "mail/ProfileTemplate.h"
#include "platform/files/Files.h"
#include "platform/process/Processes.h"
#include "platform/system/ShellStart.h"
#include "runtime/Fault.h"
#include "runtime/Settings.h"

namespace quendra::mail {

namespace {

constexpr std::size_t kDirectoryRoom = 250;
/// That of "C:\WINDOWS". Machines with another directory have always been refused.
constexpr std::uint32_t kOnlyLength = 10;

} // namespace

std::int32_t OutlookProfile::CreateOutlookProfile(const Text& userName, const Text& fullName) {
  const Text profile = ProfileText({settings::IspMailHost, settings::IspMailDomain, userName, fullName});
  std::string directory(kDirectoryRoom, ' ');
  const std::uint32_t length = files_.GetWindowsDirectoryA(directory);
  if (length != kOnlyLength) return static_cast<std::int32_t>(length);

  const std::string path = std::string(CutAtNul(directory)) + "\\bi.prf";
  files_.Output(path, ToCodePage(profile));
  if (!shell_.Shell("CMD /c \"" + path + "\"", platform::ShellStart::kHiddenWindow))
    throw Fault(Fault::kFileNotFound);
  // Ends nothing: which process was started isn't known here.
  processes_.TerminateProcess(platform::kNoHandle, 0);
  return 0;
}

} // namespace quendra::mail
