#pragma once

#include "platform/linux/network_manager/NetworkManagerBus.h"
#include "platform/linux/remote_access/LineSettings.h"

#include <map>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A connection that is an entry of the phone book.
struct Line {
  std::string path;
  std::string name; ///< as the phone book shows it
  LineKind kind;
};

/// NetworkManager's connections of the kinds that are entries. What was read of one is kept until it changes:
/// a machine may have a thousand.
///
/// Each call gives an error number, 0 for success: kRasManagerCannotStart where NetworkManager doesn't
/// answer, kAccessDenied for what this user mustn't do.
class ConnectionBook {
 public:
  explicit ConnectionBook(NetworkManagerBus& bus);

  bool IsThere();
  /// By name. One that others have given the name of another is left out: a name stands for one entry.
  std::uint32_t ReadLines(std::vector<Line>& lines);
  /// With those that are left out there.
  std::uint32_t ReadAllLines(std::vector<Line>& lines);
  /// kRasCannotFindPhonebookEntry where there is none of that name; case makes no difference.
  std::uint32_t Find(std::string_view name, Line& line);
  std::uint32_t ReadSettings(const Line& line, NetworkSettings& settings);
  /// Success with nothing where nobody keeps any.
  std::uint32_t ReadSecrets(const Line& line, NetworkSettings& secrets);
  std::uint32_t Add(const NetworkSettings& settings);
  /// Keeps the secrets where `settings` has none, and none but those where it has any.
  std::uint32_t Update(const Line& line, const NetworkSettings& settings);
  std::uint32_t ClearSecrets(const Line& line);
  std::uint32_t Delete(const Line& line);

 private:
  struct Known {
    bool isRead = false;
    std::optional<LineKind> kind{}; ///< nothing for a connection of no interest
    std::string name{};
  };

  std::uint32_t Refresh();
  std::uint32_t ReadUnknown();

  NetworkManagerBus& bus_;
  std::map<std::string, Known> known_; ///< by path
};

/// The error number of an answer.
std::uint32_t ErrorOf(const BusAnswer& answer);

} // namespace quendra::platform::linux_
