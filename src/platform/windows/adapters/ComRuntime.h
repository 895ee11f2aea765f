#pragma once

#include "platform/windows/adapters/ComPtr.h"
#include "winapi/SystemLibrary.h"

#include <ole2.h>

namespace quendra::platform::windows {

/// The system's objects, for the thread that makes this: from libraries that are loaded at run time, and let
/// go of when whoever holds such an object lets go of this.
class ComRuntime {
  winapi::SystemLibrary ole_{L"ole32.dll"};
  winapi::SystemLibrary automation_{L"oleaut32.dll"};
  bool began_ = false;
  bool mustEnd_ = false;

  template <typename Function> Function* Ole(const char* name) const {
    return ole_.template Find<Function>(name);
  }
  template <typename Function> Function* Automation(const char* name) const {
    return automation_.template Find<Function>(name);
  }

 public:
  ComRuntime();
  ~ComRuntime();
  ComRuntime(const ComRuntime&) = delete;
  ComRuntime& operator=(const ComRuntime&) = delete;

  /// False on a system that lacks a call.
  bool IsThere() const { return began_; }
  template <typename Interface> ComPtr<Interface> Create(const CLSID& kind) const {
    ComPtr<Interface> made;
    CreateInstance(kind, nullptr, CLSCTX_INPROC_SERVER, __uuidof(Interface),
                   reinterpret_cast<void**>(made.Receive()));
    return made;
  }
  /// Whom it asks may act as this user. A refusal is none: an object in this process has nothing to be told.
  void LetActAsUser(IUnknown* object) const;

  // The calls, nullptr where the system lacks one.

  decltype(::CoCreateInstance)* const CreateInstance = Ole<decltype(::CoCreateInstance)>("CoCreateInstance");
  decltype(::SysAllocStringLen)* const AllocString =
      Automation<decltype(::SysAllocStringLen)>("SysAllocStringLen");
  decltype(::SysFreeString)* const FreeString = Automation<decltype(::SysFreeString)>("SysFreeString");
  decltype(::VariantClear)* const ClearVariant = Automation<decltype(::VariantClear)>("VariantClear");
  decltype(::SafeArrayCreateVector)* const CreateVector =
      Automation<decltype(::SafeArrayCreateVector)>("SafeArrayCreateVector");
  decltype(::SafeArrayPutElement)* const PutElement =
      Automation<decltype(::SafeArrayPutElement)>("SafeArrayPutElement");
};

} // namespace quendra::platform::windows
