#pragma once

#include "winapi/Winapi.h"

#include <vector>

namespace quendra::forms::win32 {

/// Keeps the user from all windows of the program but one, as long as this lives.
class ModalBlock {
 public:
  explicit ModalBlock(HWND but);
  ~ModalBlock() { Lift(); }
  ModalBlock(const ModalBlock&) = delete;
  ModalBlock& operator=(const ModalBlock&) = delete;

  /// Before the one window goes: the system looks for the next to be the active one, and a blocked one can't.
  void Lift();

 private:
  std::vector<HWND> blocked_;
};

} // namespace quendra::forms::win32
