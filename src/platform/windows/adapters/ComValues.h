#pragma once

#include "platform/windows/adapters/ComRuntime.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quendra::platform::windows {

/// A text as the system's objects take it.
class ComText {
 public:
  ComText(const ComRuntime& com, TextView text);
  ~ComText();
  ComText(const ComText&) = delete;
  ComText& operator=(const ComText&) = delete;

  BSTR Get() const { return text_; }

 private:
  const ComRuntime& com_;
  const BSTR text_;
};

/// A value of whatever kind, as properties of the system's objects have them.
class ComValue {
 public:
  explicit ComValue(const ComRuntime& com) : com_(com) {}
  /// Lists of texts of the code page, and of numbers of 16 bits, which such a list holds in 32.
  ComValue(const ComRuntime& com, const std::vector<std::string>& texts);
  ComValue(const ComRuntime& com, const std::vector<std::uint16_t>& numbers);
  ~ComValue();
  ComValue(const ComValue&) = delete;
  ComValue& operator=(const ComValue&) = delete;

  VARIANT* Get() { return &value_; }
  /// Empty where it is none.
  Text AsText() const;
  std::uint32_t AsNumber(std::uint32_t otherwise) const;

 private:
  void BecomeList(VARTYPE kind, std::size_t count);
  void PutElement(std::size_t index, void* element);

  const ComRuntime& com_;
  VARIANT value_{};
};

} // namespace quendra::platform::windows
