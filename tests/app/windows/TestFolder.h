#pragma once

#include "winapi/Winapi.h"

namespace quendra::app::windows {

/// A folder of its own that goes with the object, with the files in it.
class TestFolder {
 public:
  TestFolder();
  ~TestFolder();
  TestFolder(const TestFolder&) = delete;

  const Text& Path() const { return path_; }
  /// Copies a file into the folder, under its own name or another one, and gives its new path.
  Text Take(const Text& file, const Text& name = {}) const;
  bool Has(const Text& name) const;
  void Remove(const Text& name) const;

 private:
  Text path_;
};

} // namespace quendra::app::windows
