#pragma once

#include "runtime/Text.h"

namespace quendra::mail {

/// What differs from one profile to the next.
struct ProfileValues {
  Text mailHost;
  Text mailDomain;
  Text userName;
  Text fullName;
};

/// The text of a profile file, from which Outlook makes a profile with a POP3 account. It holds no password:
/// the mail program asks for it.
Text ProfileText(const ProfileValues& values);

} // namespace quendra::mail
