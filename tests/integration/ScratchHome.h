#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <stdexcept>
#include <string>

namespace quendra::integration {

/// The folders of caches and of data of a user who has nothing, for machines that are made while it stands:
/// those of whoever runs the tests are left alone. Gone with the object.
class ScratchHome {
 public:
  ScratchHome() {
    if (!mkdtemp(path_.data())) throw std::runtime_error("no temporary folder");
    setenv("XDG_CACHE_HOME", (path_ + "/caches").c_str(), 1);
    setenv("XDG_DATA_HOME", (path_ + "/data").c_str(), 1);
  }
  ~ScratchHome() {
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
  }
  ScratchHome(const ScratchHome&) = delete;
  ScratchHome& operator=(const ScratchHome&) = delete;

  const std::string& Path() const { return path_; }

 private:
  std::string path_ = testing::TempDir() + "quendra-home-XXXXXX";
};

} // namespace quendra::integration
