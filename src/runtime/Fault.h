#pragma once

#include "runtime/Text.h"

#include <exception>

namespace quendra {

/// A run-time fault: number, description and source, as the classes of the program raise them. The one
/// exception type of the program's logic; one that nobody traps reaches the desktop's dispatcher and ends the
/// program.
class Fault : public std::exception {
 public:
  enum Number : int {
    kInvalidCall = 5,
    kOverflow = 6,
    kOutOfMemory = 7,
    kSubscript = 9,
    kDivision = 11,
    kTypeMismatch = 13,
    kOutOfStackSpace = 28,
    kFileNotFound = 53,
    kDiskFull = 61,
    kPermissionDenied = 70,
    kPathFileAccess = 75,
    kPathNotFound = 76,
    kObjectNotSet = 91,
    kInvalidPropertyValue = 380,
    kCannotCreateObject = 429,
    kDuplicateKey = 457,
    kNoSuchElement = 35601,
  };

  /// With the run-time's own description of the number.
  explicit Fault(int number);
  Fault(int number, Text description, Text source);

  const char* what() const noexcept override { return what_.c_str(); }

  const int number;
  const Text description;
  const Text source;

 private:
  std::string what_;
};

} // namespace quendra
