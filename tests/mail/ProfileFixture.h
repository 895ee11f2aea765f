#pragma once

#include <fstream>
#include <iterator>
#include <string>

namespace quendra::mail {

/// The profile file of "dana", דנה כהן, with the provider's mail.example.net and example.net, as it was
/// written by hand.
inline std::string ProfileByHand() {
  std::ifstream file(QUENDRA_SOURCE_DIR "/tests/mail/bi.prf", std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

} // namespace quendra::mail
