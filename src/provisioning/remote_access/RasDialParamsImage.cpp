#include "provisioning/remote_access/RasDialParamsImage.h"

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "provisioning/remote_access/RecordFields.h"

namespace quendra::provisioning {

const std::array<std::uint32_t, 3> kRasDialParamsSizes{platform::RasDialParams::kBytes,
                                                       platform::RasDialParams::kBytesWithoutNumbers,
                                                       platform::RasDialParams::kBytesOfShortNames};

namespace {

using platform::RasDialParams;
using Params = RasDialParamsRecord;
using DialParamsField = RecordField<Params>;

constexpr std::size_t kPhoneNumber = RasDialParams::kEntryName + RasDialParams::kEntryNameBytes;
constexpr std::size_t kCallbackNumber = kPhoneNumber + RasDialParams::kPhoneNumberBytes;
constexpr std::size_t kUserName = kCallbackNumber + RasDialParams::kCallbackNumberBytes;
constexpr std::size_t kPassword = kUserName + RasDialParams::kUserNameBytes;
constexpr std::size_t kDomain = kPassword + RasDialParams::kPasswordBytes;

constexpr DialParamsField kDialParamsFields[] = {
    {&Params::size, 0},
    {&Params::entryName, RasDialParams::kEntryName, RasDialParams::kEntryNameBytes},
    {&Params::phoneNumber, kPhoneNumber, RasDialParams::kPhoneNumberBytes},
    {&Params::callbackNumber, kCallbackNumber, RasDialParams::kCallbackNumberBytes},
    {&Params::userName, kUserName, RasDialParams::kUserNameBytes},
    {&Params::password, kPassword, RasDialParams::kPasswordBytes},
    {&Params::domain, kDomain, RasDialParams::kDomainBytes},
    {&Params::subEntry, RasDialParams::kSubEntry},
    {&Params::callbackId, RasDialParams::kCallbackId},
};

/// The oldest record has a shorter entry name, and all behind it comes so much earlier.
DialParamsField DialParamsFieldIn(std::uint32_t bytes, DialParamsField field) {
  constexpr std::size_t kShorter = RasDialParams::kEntryNameBytes - RasDialParams::kShortEntryNameBytes;
  if (bytes != RasDialParams::kBytesOfShortNames) return field;
  if (field.at == RasDialParams::kEntryName) field.width -= kShorter;
  if (field.at > RasDialParams::kEntryName) field.at -= kShorter;
  return field;
}

} // namespace

std::vector<std::uint8_t> EmptyRasDialParams(std::uint32_t bytes, const Text& entryName) {
  std::vector<std::uint8_t> image(bytes);
  PutRasDialParams({.size = bytes, .entryName = entryName}, image);
  return image;
}

void PutRasDialParams(const RasDialParamsRecord& record, std::span<std::uint8_t> image) {
  const auto bytes = static_cast<std::uint32_t>(image.size());
  for (const DialParamsField& listed : kDialParamsFields)
    if (const DialParamsField field = DialParamsFieldIn(bytes, listed); field.IsIn(bytes))
      PutField(record, field, image);
  PutLittle32(image, 0, bytes);
}

bool TakeRasDialParams(RasDialParamsRecord& record, std::span<const std::uint8_t> image) {
  if (image.size() < 4) throw Fault(Fault::kSubscript);
  const std::uint32_t bytes = Little32(image, 0);
  if (std::ranges::find(kRasDialParamsSizes, bytes) == kRasDialParamsSizes.end()) return false;
  if (image.size() < bytes) throw Fault(Fault::kSubscript);
  for (const DialParamsField& listed : kDialParamsFields)
    if (const DialParamsField field = DialParamsFieldIn(bytes, listed); field.IsIn(bytes))
      TakeField(record, field, image);
  return true;
}

} // namespace quendra::provisioning
