#include "platform/linux/remote_access/DialParamsStore.h"

#include "platform/linux/remote_access/DialParamsImage.h"
#include "platform/linux/remote_access/DialSettings.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

namespace quendra::platform::linux_ {

std::uint32_t ReadDialParams(ConnectionBook& book, const Line& line, std::span<std::uint8_t> full) {
  NetworkSettings settings;
  if (const std::uint32_t error = book.ReadSettings(line, settings)) return error;
  PutLittle32(full, 0, RasDialParams::kBytes);
  ShowDialParams(settings, line.kind, full);
  PutPasswordField(full, PasswordIn(book.ReadSecrets(line), line.kind));
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

  const NetworkSettings secrets = book.ReadSecrets(line);
  const std::string kept = PasswordIn(secrets, line.kind);
  const std::string shown = removePassword ? std::string() : std::string(PasswordField(full));
  const std::string password = Kept(kept, shown, RasDialParams::kPasswordBytes);
  if (password.empty()) {
    if (const std::uint32_t error = kept.empty() ? 0 : book.ClearSecrets(line)) return error;
  } else if (password != kept) {
    PutPassword(settings, line.kind, secrets, password);
  }
  return settings == before ? kRasSuccess : book.Update(line, settings);
}

std::uint32_t SaveUserAndPassword(ConnectionBook& book, const Line& line,
                                  std::span<const std::uint8_t> params) {
  std::vector<std::uint8_t> given(RasDialParams::kBytes), full(RasDialParams::kBytes);
  TakeDialParams(params, given);
  if (!HasUserOrPassword(given)) return kRasSuccess;
  if (const std::uint32_t error = ReadDialParams(book, line, full)) return error;
  PutUserAndPassword(full, given);
  return SaveDialParams(book, line, full, false);
}

} // namespace quendra::platform::linux_
