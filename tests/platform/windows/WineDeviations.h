#pragma once

#include "winapi/SystemLibrary.h"

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

namespace quendra::platform::windows {

/// What Wine answers otherwise than Windows XP does: each test that can't be passed for it, and why.
/// Consulted under Wine alone. What tests go round without being skipped:
///
/// - The calls that count a process's drawing objects, windows and handles answer 0:
///   tests/app/windows/Resources counts them in the tables of the system.
/// - Its own libraries come before others of their names, wherever those lie: for planted ones it is told
///   not to.
/// - A list of processes takes it as long as reading several files of each from the system below, and a
///   request for each step: the time of a pass is that beyond the list.
/// - It has no phone book and dials nowhere, and no capture library: libraries of ours stand in for these.
/// - Its management of network cards tells of cards without an address too, and sets none (the call answers
///   65): the tour says so, and the modem behind a VPN gets its card without these addresses.
/// - It turns no text field by Ctrl and Shift, and has no fixed pitch font of XP's.
struct WineDeviation {
  std::string_view test;
  std::string_view why;
};

inline constexpr std::array kWineDeviations{
    WineDeviation{"FilesBehaviourTest.The_Windows_directory_has_ten_characters_and_a_NUL_behind_them",
                  "Wine writes its directory \"C:\\windows\", in small letters"},
    WineDeviation{"RegistryBehaviourTest.No_hive_is_made_or_deleted",
                  "Wine lets a program make keys beside the hives, and has no hive SAM"},
    WineDeviation{"SocketsBehaviour.Data_of_a_connection_reset_before_it_is_told_of_is_read_before_its_end",
                  "Wine drops what came before a reset; whether XP does, only XP shows"},
    WineDeviation{"RealSocketsTest.A_reset_is_told_as_FD_CLOSE_with_10054_behind_the_last_data",
                  "Wine drops what came before a reset; whether XP does, only XP shows"},
    WineDeviation{"SendAndCloseSuite.A_reset_right_behind_data_loses_none_of_it",
                  "Wine drops what came before a reset; whether XP does, only XP shows"},
    WineDeviation{
        "ListenSuite.A_peer_that_resets_before_it_is_looked_at_is_offered_with_its_address_and_then_an_Error",
        "Wine drops what came before a reset; whether XP does, only XP shows"},
    WineDeviation{"ListenSuite.A_reset_that_only_the_pending_list_saw_is_told_by_the_next_send",
                  "Wine drops what came before a reset; whether XP does, only XP shows"},
};

/// Why a test, "Suite.Name", can't be passed here; empty for most, and for all where this isn't Wine.
inline std::string WineDeviationIn(std::string_view test) {
  static const bool isWine = winapi::SystemLibrary(L"ntdll.dll").Find<void()>("wine_get_version") != nullptr;
  const auto found = std::ranges::find(kWineDeviations, test, &WineDeviation::test);
  return isWine && found != kWineDeviations.end() ? std::string(found->why) : std::string();
}

} // namespace quendra::platform::windows
