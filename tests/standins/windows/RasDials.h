#pragma once

#include "winapi/Winapi.h"

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace quendra::standins {

/// Dials, each by the script of its entry, and the connections that they make.
///
/// A script is text: of the environment (QUENDRA_DIALS), else of the file that it names (QUENDRA_DIALS_FILE).
/// A line, or what stands between two ";", is of one entry, "*" of every other:
///
///     097: 0 5 691
///     Test: 0 100ms 5 14 8192
///
/// A number below 600 and those from 4096 on are states, others errors, which end the dial in the state that
/// it has come to. "100ms" waits. Without a script a dial connects.
class RasDials {
 public:
  RasDials();
  ~RasDials();
  RasDials(const RasDials&) = delete;
  RasDials& operator=(const RasDials&) = delete;

  struct Connection {
    std::string entryName{};
    std::string deviceType{};
    std::string deviceName{};
    HANDLE hungUp = nullptr;

    ~Connection();
  };
  using Shared = std::shared_ptr<Connection>;

  /// A dial that returns with its outcome, or that tells a window. Either leaves a handle.
  std::uint32_t Start(const Shared& connection, HWND window, std::uint32_t& handle);
  bool HangUp(std::uint32_t handle);
  /// Also one that was hung up, for the first questions.
  bool HasHandle(std::uint32_t handle);
  std::map<std::uint32_t, Shared> All();

  struct Step {
    std::uint32_t milliseconds = 0; ///< to wait; then neither of the others counts
    std::uint32_t state = 0;
    std::uint32_t error = 0;
  };
  static std::vector<Step> ScriptOf(const std::string& entryName);

 private:
  CRITICAL_SECTION lock_;
  std::map<std::uint32_t, Shared> connections_;
  std::map<std::uint32_t, int> ending_; ///< how many questions about it find it still there
  std::uint32_t lastHandle_ = 0x00A70000;
};

} // namespace quendra::standins
