#pragma once

#include "winapi/Winapi.h"

#include <array>
#include <functional>
#include <map>

namespace quendra::forms::win32 {

/// What a key gives alone in a layout; 0 for a key without a character, and for one that waits for the next.
char16_t CharacterAlone(UINT key, HKL layout);

/// What the keys give alone. The system is asked about a layout once, before the first of its keys does
/// anything: asking forgets an accent that was typed and waits for its letter.
class LayoutCharacters {
 public:
  using Asked = std::function<char16_t(UINT key, HKL layout)>;
  explicit LayoutCharacters(Asked ask = CharacterAlone) : ask_(std::move(ask)) {}

  char16_t Of(UINT key, HKL layout);

 private:
  using Characters = std::array<char16_t, 256>;

  Asked ask_;
  std::map<HKL, Characters> known_;
};

} // namespace quendra::forms::win32
