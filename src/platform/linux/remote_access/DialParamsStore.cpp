#include "platform/linux/remote_access/DialParamsStore.h"

#include "platform/linux/remote_access/DialParamsImage.h"
#include "platform/linux/remote_access/DialSettings.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

#include <functional>
#include <optional>

namespace quendra::platform::linux_ {

namespace {

using Image = std::span<std::uint8_t>;

/// What becomes of an entry's secrets.
struct SecretsChange {
  std::optional<std::string> password; ///< nothing where it stays what it is, empty where it goes
  NetworkSettings kept{};              ///< the secrets that there are
};

/// Finds out what the password that a field shows now changes. Clears the secrets where none is left: an
/// update without any would keep those that there are.
std::uint32_t Prepare(ConnectionBook& book, const Line& line, SecretsChange& change) {
  if (!change.password) return kRasSuccess;
  if (const std::uint32_t error = book.ReadSecrets(line, change.kept)) return error;
  const std::string before = PasswordIn(change.kept, line.kind);
  change.password = Kept(before, *change.password, RasDialParams::kPasswordBytes);
  if (change.password == before) {
    change.password.reset();
  } else if (NetworkSettings others;
             change.password->empty() && !PutOtherSecrets(others, line.kind, change.kept)) {
    return book.ClearSecrets(line);
  }
  return kRasSuccess;
}

/// `fill` changes the image that shows what is kept. The user may be asked about the secrets, so the settings
/// are read after them: what another program changes meanwhile stays.
std::uint32_t Save(ConnectionBook& book, const Line& line, std::optional<std::string> password,
                   const std::function<void(Image full)>& fill) {
  SecretsChange secrets{std::move(password)};
  if (const std::uint32_t error = Prepare(book, line, secrets)) return error;
  NetworkSettings settings;
  if (const std::uint32_t error = book.ReadSettings(line, settings)) return error;
  std::vector<std::uint8_t> full(RasDialParams::kBytes);
  PutLittle32(full, 0, RasDialParams::kBytes);
  ShowDialParams(settings, line.kind, full);
  const auto shown = full;
  fill(full);
  PutPasswordField(full, {}); // which goes its own way
  if (full == shown && !secrets.password) return kRasSuccess;
  PutDialParams(settings, line.kind, full);
  if (secrets.password) PutPassword(settings, line.kind, secrets.kept, *secrets.password);
  return book.Update(line, settings);
}

} // namespace

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
  std::vector<std::uint8_t> given(RasDialParams::kBytes);
  TakeDialParams(params, given);
  return Save(book, line, removePassword ? std::string() : std::string(PasswordField(given)),
              [&](Image full) { TakeDialParams(params, full); });
}

std::uint32_t SaveUserAndPassword(ConnectionBook& book, const Line& line,
                                  std::span<const std::uint8_t> params) {
  std::vector<std::uint8_t> given(RasDialParams::kBytes);
  TakeDialParams(params, given);
  if (!HasUserOrPassword(given)) return kRasSuccess;
  const std::string password(PasswordField(given));
  return Save(book, line, password.empty() ? std::nullopt : std::optional(password),
              [&](Image full) { PutUserAndPassword(full, given); });
}

} // namespace quendra::platform::linux_
