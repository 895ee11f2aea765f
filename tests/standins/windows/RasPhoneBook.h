#pragma once

#include "winapi/Winapi.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace quendra::standins {

/// A phone book in a file that the environment names (QUENDRA_PHONE_BOOK), else "quendra-phone-book.ini" in
/// the folder of Windows. Each entry is a section with its images as the program gave them; the file alone
/// holds it, so that another process finds the entry, too.
class RasPhoneBook {
 public:
  RasPhoneBook();

  using Image = std::vector<std::uint8_t>;

  std::vector<std::string> Names() const;
  /// Whatever the case of its letters.
  bool Has(const std::string& name) const;
  bool Remove(const std::string& name) const;

  /// A RASENTRY of this system's own size, and the alternate numbers with their two NULs at the end.
  Image Properties(const std::string& name) const;
  Image AlternateNumbers(const std::string& name) const;
  bool Write(const std::string& name, const Image& properties, const Image& alternateNumbers) const;

  /// A RASDIALPARAMS of the longest size; blank where nothing is saved.
  Image DialParams(const std::string& name) const;
  bool WriteDialParams(const std::string& name, const Image& params) const;

 private:
  Image Read(const std::string& name, const char* key) const;
  bool Write(const std::string& name, const char* key, const Image& image) const;

  std::string file_;
};

} // namespace quendra::standins
