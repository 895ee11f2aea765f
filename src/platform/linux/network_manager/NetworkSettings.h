#pragma once

#include "platform/linux/network_manager/BusValue.h"

namespace quendra::platform::linux_ {

/// A connection as NetworkManager keeps it: settings by name, each of values by name.
using NetworkSettings = std::map<std::string, ValueMap>;

NetworkSettings NetworkSettingsOf(const BusValue& value);
BusValue ValueOf(const NetworkSettings& settings);

/// Empty where there is no such text.
std::string TextIn(const NetworkSettings& settings, const std::string& setting, const std::string& key);
/// An empty text takes the value away.
void PutText(NetworkSettings& settings, const std::string& setting, const std::string& key,
             const std::string& text);
/// The texts by name that a value holds.
TextMap TextsIn(const NetworkSettings& settings, const std::string& setting, const std::string& key);
void PutTexts(NetworkSettings& settings, const std::string& setting, const std::string& key,
              const TextMap& texts);
/// An empty text takes the entry away.
void PutTextIn(TextMap& texts, const std::string& name, const std::string& text);

} // namespace quendra::platform::linux_
