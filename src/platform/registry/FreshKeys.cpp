#include "platform/registry/FreshKeys.h"

namespace quendra::platform {

namespace {

constexpr FreshKey kFreshKeys[] = {
    {kLocalMachine, "HARDWARE"},
    {kLocalMachine, "SAM"},
    {kLocalMachine, "SECURITY"},
    {kLocalMachine, "SOFTWARE\\Classes"},
    {kLocalMachine, "SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\SharedDLLs"},
    {kLocalMachine, "SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\Uninstall"},
    {kLocalMachine, "SYSTEM\\ControlSet001\\Services"},
    {kLocalMachine, "SYSTEM\\CurrentControlSet\\Services"},
    {kUsers, ".DEFAULT"},
    {kCurrentUser, "Software\\Microsoft\\Windows\\CurrentVersion\\Internet Settings\\5.0\\Cache\\Content"},
    {kCurrentUser, "Software\\Microsoft\\Windows\\CurrentVersion\\Internet Settings\\5.0\\Cache\\Cookies"},
    {kCurrentUser, "Software\\Microsoft\\Windows\\CurrentVersion\\Internet Settings\\5.0\\Cache\\History"},
};

} // namespace

std::span<const FreshKey> FreshKeys() { return kFreshKeys; }

} // namespace quendra::platform
