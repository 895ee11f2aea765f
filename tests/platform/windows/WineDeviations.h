#pragma once

#include <array>
#include <string_view>

namespace quendra::platform::windows {

/// What Wine answers otherwise than Windows XP does: each test that can't be passed for it, and why.
/// Consulted under Wine alone.
struct WineDeviation {
  std::string_view test;
  std::string_view why;
};

inline constexpr std::array kWineDeviations{
    WineDeviation{"FilesBehaviourTest.The_Windows_directory_has_ten_characters_and_a_NUL_behind_them",
                  "Wine writes its directory \"C:\\windows\", in small letters"},
    WineDeviation{"RegistryBehaviourTest.No_hive_is_made_or_deleted",
                  "Wine lets a program make keys beside the hives, and has no hive SAM"},
};

/// What the names of tests begin with whose families the backend doesn't have yet.
inline constexpr std::array<std::string_view, 13> kToCome{
    "SocketsBehaviour.",
    "IcmpBehaviourTest.",
    "BehaviourTest.A_listening_socket_stands_in_the_owner_table_as_it_lies_in_memory",
    "BehaviourTest.Both_ends_of_a_connection_stand_in_the_owner_table",
    "BehaviourTest.Every_state_in_the_owner_table_has_a_number_from_1_to_12",
    "BehaviourTest.A_table_once_given_stays_as_it_was",
    "BehaviourTest.The_interface_table_is_a_count_and_as_many_rows_by_ascending_index",
    "BehaviourTest.A_loopback_stands_in_the_interface_table",
    "BehaviourTest.A_buffer_with_too_little_room_for_the_interface_table_stays_as_it_was",
    "BehaviourTest.A_stated_size_is_believed_where_the_buffer_has_more",
    "BehaviourTest.The_own_name_has_addresses_and_the_first_is_the_loopback",
    "BehaviourTest.A_question_for_a_name_that_fails_has_its_own_number_which_socket_calls_leave_alone",
    "BehaviourTest.Adapters_are_asked_for_in_two_phases",
};

} // namespace quendra::platform::windows
