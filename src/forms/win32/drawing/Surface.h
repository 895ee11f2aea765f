#pragma once

#include "forms/view/Area.h"
#include "winapi/Winapi.h"

#include <cstdint>
#include <span>

namespace quendra::forms::win32 {

/// A picture in memory of 32 bits a pixel, rows from the top, on which a window's content is put together
/// before it is shown at once. It has a device context for what the system draws: that leaves the alpha byte
/// 0, and nobody reads it.
class Surface {
 public:
  explicit Surface(Extent extent);
  ~Surface();
  Surface(const Surface&) = delete;
  Surface& operator=(const Surface&) = delete;

  HDC Dc() const { return dc_; }
  Extent Size() const { return extent_; }
  /// As 0xAARRGGBB, row by row. What the system has drawn before is there.
  std::span<std::uint32_t> Pixels();
  /// Copies a part to the same place of another device.
  void ShowOn(HDC device, Area part) const;

 private:
  Extent extent_;
  HDC dc_ = nullptr;
  HBITMAP bitmap_ = nullptr;
  HGDIOBJ before_ = nullptr;
  std::uint32_t* pixels_ = nullptr;
};

} // namespace quendra::forms::win32
