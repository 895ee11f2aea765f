#pragma once

// What GoogleTest lacks in a thread model without std::mutex: there is one thread, so it needs no locks, but
// its tests of deaths hold handles by this class, which it has only with threads.

namespace testing::internal {

class AutoHandle {
 public:
  using Handle = void*;

  AutoHandle() = default;
  explicit AutoHandle(Handle handle) : handle_(handle) {}
  ~AutoHandle() { Reset(); }
  AutoHandle(const AutoHandle&) = delete;
  AutoHandle& operator=(const AutoHandle&) = delete;

  Handle Get() const { return handle_; }
  void Reset() { Reset(Invalid()); }
  void Reset(Handle handle);

 private:
  static Handle Invalid() { return reinterpret_cast<Handle>(-1); }

  Handle handle_ = Invalid();
};

} // namespace testing::internal
