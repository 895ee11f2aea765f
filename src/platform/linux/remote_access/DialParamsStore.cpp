#include "platform/linux/remote_access/DialParamsStore.h"

#include "platform/linux/remote_access/DialParamsImage.h"
#include "platform/linux/remote_access/DialSettings.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

namespace quendra::platform::linux_ {

std::uint32_t ReadDialParams(ConnectionBook& book, const Line& line, std::span<std::uint8_t> full) {
  NetworkSettings settings;
  if (const std::uint32_t error = book.ReadSettings(line, settings)) return error;
  PutLittle32(full, 0, RasDialParams::kBytes);
  ShowDialParams(settings, line.kind, full);
  NetworkSettings secrets;
  const std::uint32_t error = book.ReadSecrets(line, secrets);
  // One that this user mustn't know is none.
  if (error != kRasSuccess && error != kAccessDenied) return error;
  PutPasswordField(full, PasswordIn(secrets, line.kind));
  return kRasSuccess;
}

std::uint32_t SaveDialParams(ConnectionBook& book, const Line& line, std::span<const std::uint8_t> params,
                             bool removePassword) {
  NetworkSettings settings;
  if (const std::uint32_t error = book.ReadSettings(line, settings)) return error;
  std::vector<std::uint8_t> full(RasDialParams::kBytes);
  ShowDialParams(settings, line.kind, full);
  TakeDialParams(params, full);
  const NetworkSettings before = settings;
  PutDialParams(settings, line.kind, full);

  NetworkSettings secrets;
  if (const std::uint32_t error = book.ReadSecrets(line, secrets)) return error;
  const std::string kept = PasswordIn(secrets, line.kind);
  const std::string shown = removePassword ? std::string() : std::string(PasswordField(full));
  const std::string password = Kept(kept, shown, RasDialParams::kPasswordBytes);
  if (password == kept) return settings == before ? kRasSuccess : book.Update(line, settings);
  if (!password.empty()) {
    PutPassword(settings, line.kind, secrets, password);
  } else if (!PutOtherSecrets(settings, line.kind, secrets)) {
    // An update without any would keep those that there are.
    if (const std::uint32_t error = book.ClearSecrets(line)) return error;
  }
  return settings == before ? kRasSuccess : book.Update(line, settings);
}

std::uint32_t SaveUserAndPassword(ConnectionBook& book, const Line& line,
                                  std::span<const std::uint8_t> params) {
  std::vector<std::uint8_t> given(RasDialParams::kBytes), full(RasDialParams::kBytes);
  TakeDialParams(params, given);
  if (!HasUserOrPassword(given)) return kRasSuccess;
  if (const std::uint32_t error = ReadDialParams(book, line, full)) return error;
  const auto before = full;
  PutUserAndPassword(full, given);
  return full == before ? kRasSuccess : SaveDialParams(book, line, full, false);
}

} // namespace quendra::platform::linux_
