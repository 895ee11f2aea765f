#pragma once

#include "standins/windows/wpcap/WpcapScript.h"

namespace quendra::standins {

/// The network cards of this machine, each with the file in which another program records what passes it: in
/// the folder that the environment names (QUENDRA_FRAMES), by the card's name, with ".pcap" behind it. None
/// without such a folder.
std::vector<WpcapScript::Device> RecordedDevices();

/// What is recorded so far isn't delivered, as a capture that begins gets nothing of what was before.
void PassOverRecordedFrames(WpcapScript::Device& device);

/// Has some more of the frames that were recorded meanwhile wait, as many as `most`.
void TakeRecordedFrames(WpcapScript::Device& device, int most);

} // namespace quendra::standins
