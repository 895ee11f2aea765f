#pragma once

#include "platform/process/VersionInfo.h"

#include <map>
#include <set>

namespace quendra::platform::simulated {

class SimulatedVersionInfo : public VersionInfo {
 public:
  /// A version block: the bytes of its translation value (language, then code page, low bytes first) and its
  /// texts under the table that the translation names; bytes that the value lacks count as 0. A block without
  /// a translation value takes no bytes.
  void Add(const std::string& path, std::vector<std::uint8_t> translation,
           std::map<std::string, std::string> texts);
  /// GetFileVersionInfoA fails for this path, though it has a size.
  void FailReading(const std::string& path) { unreadable_.insert(path); }
  /// The sub-blocks that were asked for, in order.
  std::vector<std::string> Queries;

  std::uint32_t GetFileVersionInfoSizeA(const std::string& path) override;
  bool GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) override;
  std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t> block,
                                                          const std::string& subBlock) override;

 private:
  struct Block {
    std::vector<std::uint8_t> translation;
    std::string table;
    std::map<std::string, std::string> texts;
  };
  std::vector<Block> blocks_;
  std::map<std::string, std::uint32_t> indexOf_;
  std::set<std::string> unreadable_;
};

} // namespace quendra::platform::simulated
