#include "platform/simulated/process/SimulatedTokens.h"

#include "platform/process/SystemErrors.h"

namespace quendra::platform::simulated {

bool SimulatedTokens::Answer(std::uint32_t error) {
  core_.lastError = error;
  return error == 0;
}

bool SimulatedTokens::OpenProcessToken(Handle process, std::uint32_t, Handle& token) {
  if (OpenProcessTokenError != 0) return Answer(OpenProcessTokenError);
  if (process != kOwnProcess && !core_.Find(process, Core::Kind::Process)) return Answer(kErrorInvalidHandle);
  token = core_.Open(Core::Kind::Token);
  return Answer(0);
}

bool SimulatedTokens::LookupPrivilegeValueA(const std::string&, const std::string& name,
                                            std::uint64_t& luid) {
  if (LookupPrivilegeValueError != 0) return Answer(LookupPrivilegeValueError);
  privileges_.push_back(CutText(name));
  luid = privileges_.size();
  return Answer(0);
}

bool SimulatedTokens::AdjustTokenPrivileges(Handle token, bool, std::uint64_t luid, std::uint32_t attributes,
                                            std::span<std::uint8_t, 16>) {
  if (!core_.Find(token, Core::Kind::Token)) return Answer(kErrorInvalidHandle);
  if (AdjustTokenPrivilegesError != 0)
    return Answer(AdjustTokenPrivilegesError) || AdjustTokenPrivilegesError == kNotAllAssigned;
  const std::string name = luid >= 1 && luid <= privileges_.size() ? privileges_[luid - 1] : "?";
  Adjusted.push_back(name + " " + std::to_string(attributes));
  return Answer(0);
}

} // namespace quendra::platform::simulated
