#pragma once

#include <utility>

namespace quendra::forms {

/// A property whose reading and writing are operations of its owner.
template <typename Owner, typename Value, auto read, auto write> class ComputedProperty {
 public:
  explicit ComputedProperty(Owner& owner) : owner_(owner) {}
  ComputedProperty(const ComputedProperty&) = delete;

  ComputedProperty& operator=(const ComputedProperty& other) { return *this = Value(other()); }
  ComputedProperty& operator=(Value value) {
    (owner_.*write)(std::move(value));
    return *this;
  }

  operator const Value&() const { return (owner_.*read)(); }
  const Value& operator()() const { return (owner_.*read)(); }

 private:
  Owner& owner_;
};

} // namespace quendra::forms
