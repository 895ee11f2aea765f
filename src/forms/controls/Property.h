#pragma once

#include <utility>

namespace quendra::forms {

class Control;

/// What of a control has changed. `All` is told when a view is attached.
enum class Aspect {
  All,
  Caption,
  Visible,
  Enabled,
  Geometry,
  Colours,
  Font,
  Picture,
  Tag,
  Items,
  Selection,
  Order,
  Timer,
  Look,
  Entry, ///< the text of a control that is typed into
  Caret,
};

void TellChanged(Control& owner, Aspect aspect);

/// A property of a control: reads as its value, and a write that changes nothing tells nobody.
template <typename Value, Aspect aspect> class Property {
 public:
  explicit Property(Control& owner, Value initial = {}) : owner_(owner), value_(std::move(initial)) {}
  Property(const Property&) = delete;

  Property& operator=(const Property& other) { return *this = other.value_; }
  Property& operator=(Value value) {
    if (value == value_) return *this;
    value_ = std::move(value);
    TellChanged(owner_, aspect);
    return *this;
  }

  operator const Value&() const { return value_; }
  const Value& operator()() const { return value_; }

 private:
  Control& owner_;
  Value value_;
};

} // namespace quendra::forms
