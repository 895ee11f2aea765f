#include "platform/simulated/remote_access/DialParameters.h"

namespace quendra::platform::simulated {

namespace {

using Params = RasDialParams;

struct TextField {
  std::string SimulatedEntry::*text;
  std::size_t bytes;
};

constexpr TextField kTexts[] = {
    {&SimulatedEntry::phoneNumber, Params::kPhoneNumberBytes},
    {&SimulatedEntry::callbackNumber, Params::kCallbackNumberBytes},
    {&SimulatedEntry::userName, Params::kUserNameBytes},
    {&SimulatedEntry::password, Params::kPasswordBytes},
    {&SimulatedEntry::domain, Params::kDomainBytes},
};

std::size_t NameBytes(std::span<const std::uint8_t> params) {
  return Little32(params, 0) == Params::kBytesOfShortNames ? Params::kShortEntryNameBytes
                                                           : Params::kEntryNameBytes;
}

bool HasNumbers(std::span<const std::uint8_t> params) { return Little32(params, 0) >= Params::kBytes; }

} // namespace

std::string EntryNameIn(std::span<const std::uint8_t> params) {
  return TextAt(params, Params::kEntryName, NameBytes(params));
}

void PutDialParameters(const SimulatedEntry& entry, std::span<std::uint8_t> params) {
  std::size_t at = Params::kEntryName + NameBytes(params);
  for (const TextField& field : kTexts) {
    PutTextAt(params, at, field.bytes, entry.*field.text);
    at += field.bytes;
  }
  if (!HasNumbers(params)) return;
  PutLittle32(params, Params::kSubEntry, entry.subEntry);
  PutLittle32(params, Params::kCallbackId, entry.callbackId);
}

void TakeDialParameters(SimulatedEntry& entry, std::span<const std::uint8_t> params) {
  std::size_t at = Params::kEntryName + NameBytes(params);
  for (const TextField& field : kTexts) {
    entry.*field.text = TextAt(params, at, field.bytes);
    at += field.bytes;
  }
  if (!HasNumbers(params)) return;
  entry.subEntry = Little32(params, Params::kSubEntry);
  entry.callbackId = Little32(params, Params::kCallbackId);
}

} // namespace quendra::platform::simulated
