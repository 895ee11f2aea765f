#pragma once

#include "platform/windows/capture/WpcapLibrary.h"
#include "standins/windows/wpcap/WpcapScript.h"

#include <array>

namespace quendra::platform::windows {

/// The capture library of the tests, which lies in a folder of its own below the test's.
class StandInWpcap {
 public:
  StandInWpcap() : loaded_(winapi::SystemLibrary::At(Path())), script(*Script()) { script = {}; }
  ~StandInWpcap() { script = {}; }

  static Text Path() {
    std::array<wchar_t, MAX_PATH> own{};
    const Text file = winapi::TextOf(own.data(), ::GetModuleFileNameW(nullptr, own.data(), MAX_PATH));
    return file.substr(0, file.rfind(u'\\')) + u"\\standins\\standin_wpcap.dll";
  }
  /// As the program loads it.
  static WpcapLibrary Library() { return WpcapLibrary(std::vector{Path()}); }

 private:
  standins::WpcapScript* Script() {
    const auto of = loaded_.Find<standins::WpcapScriptOf>(standins::kWpcapScriptOf);
    return of ? of() : &none_;
  }

  winapi::SystemLibrary loaded_;
  standins::WpcapScript none_;

 public:
  standins::WpcapScript& script;
};

} // namespace quendra::platform::windows
