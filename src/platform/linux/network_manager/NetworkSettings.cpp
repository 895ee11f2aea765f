#include "platform/linux/network_manager/NetworkSettings.h"

namespace quendra::platform::linux_ {

namespace {

const BusValue* Find(const NetworkSettings& settings, const std::string& setting, const std::string& key) {
  const auto values = settings.find(setting);
  if (values == settings.end()) return nullptr;
  const auto value = values->second.find(key);
  return value == values->second.end() ? nullptr : &value->second;
}

} // namespace

NetworkSettings NetworkSettingsOf(const BusValue& value) {
  NetworkSettings settings;
  for (const BusValue& pair : value.items)
    if (pair.items.size() == 2 && pair.items[0].IsText())
      settings[pair.items[0].text] = ValueMapOf(pair.items[1]);
  return settings;
}

BusValue ValueOf(const NetworkSettings& settings) {
  BusValue value = BusValue::Array("{sa{sv}}", {});
  for (const auto& [name, values] : settings)
    value.items.push_back({'e', "sa{sv}", 0, {}, {BusValue::Text(name), ValueOf(values)}});
  return value;
}

std::string TextIn(const NetworkSettings& settings, const std::string& setting, const std::string& key) {
  const BusValue* value = Find(settings, setting, key);
  return value && value->IsText() ? value->text : std::string();
}

void PutText(NetworkSettings& settings, const std::string& setting, const std::string& key,
             const std::string& text) {
  if (text.empty())
    settings[setting].erase(key);
  else
    settings[setting][key] = BusValue::Text(text);
}

TextMap TextsIn(const NetworkSettings& settings, const std::string& setting, const std::string& key) {
  const BusValue* value = Find(settings, setting, key);
  return value ? TextMapOf(*value) : TextMap();
}

void PutTexts(NetworkSettings& settings, const std::string& setting, const std::string& key,
              const TextMap& texts) {
  if (texts.empty())
    settings[setting].erase(key);
  else
    settings[setting][key] = ValueOf(texts);
}

void PutTextIn(TextMap& texts, const std::string& name, const std::string& text) {
  if (text.empty())
    texts.erase(name);
  else
    texts[name] = text;
}

} // namespace quendra::platform::linux_
