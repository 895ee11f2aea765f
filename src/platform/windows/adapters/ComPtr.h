#pragma once

#include "winapi/Winapi.h"

#include <utility>

namespace quendra::platform::windows {

/// Holds one reference to an object of the system.
template <typename Interface> class ComPtr {
 public:
  ComPtr() = default;
  /// Takes the reference over.
  explicit ComPtr(Interface* object) : object_(object) {}
  ComPtr(const ComPtr& other) : object_(other.object_) {
    if (object_) object_->AddRef();
  }
  ComPtr(ComPtr&& other) noexcept : object_(std::exchange(other.object_, nullptr)) {}
  ComPtr& operator=(ComPtr other) noexcept {
    std::swap(object_, other.object_);
    return *this;
  }
  ~ComPtr() {
    if (object_) object_->Release();
  }

  /// Where a call puts an object that it gives, in an empty one.
  Interface** Receive() { return &object_; }
  Interface* Get() const { return object_; }
  Interface* operator->() const { return object_; }
  explicit operator bool() const { return object_ != nullptr; }

 private:
  Interface* object_ = nullptr;
};

} // namespace quendra::platform::windows
