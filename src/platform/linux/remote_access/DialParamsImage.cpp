#include "platform/linux/remote_access/DialParamsImage.h"

#include "platform/linux/remote_access/LineSettings.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

using Params = RasDialParams;

constexpr std::size_t kTextBytes = Params::kPhoneNumberBytes + Params::kCallbackNumberBytes +
                                   Params::kUserNameBytes + Params::kPasswordBytes + Params::kDomainBytes;
constexpr std::size_t kNumberBytes = Params::kBytes - Params::kSubEntry;

std::size_t NameBytes(std::span<const std::uint8_t> params) {
  return Little32(params, 0) == Params::kBytesOfShortNames ? Params::kShortEntryNameBytes
                                                           : Params::kEntryNameBytes;
}

/// The same fields in two images: the texts behind the name, and the numbers where both have them.
void Copy(std::span<const std::uint8_t> from, std::span<std::uint8_t> to) {
  const auto texts = from.subspan(Params::kEntryName + NameBytes(from), kTextBytes);
  std::ranges::copy(texts, to.subspan(Params::kEntryName + NameBytes(to)).begin());
  if (Little32(from, 0) != Params::kBytes || Little32(to, 0) != Params::kBytes) return;
  std::ranges::copy(from.subspan(Params::kSubEntry, kNumberBytes), to.subspan(Params::kSubEntry).begin());
}

} // namespace

std::uint32_t ErrorOfDialParams(std::span<const std::uint8_t> params) {
  if (params.size() < 4) return kRasBufferInvalid;
  const std::uint32_t size = Little32(params, 0);
  if (size != Params::kBytes && size != Params::kBytesWithoutNumbers && size != Params::kBytesOfShortNames)
    return kRasInvalidSize;
  return params.size() < size ? kRasBufferInvalid : kRasSuccess;
}

std::string EntryNameOf(std::span<const std::uint8_t> params) {
  return std::string(FieldText(params, Params::kEntryName, NameBytes(params)));
}

void TakeDialParams(std::span<const std::uint8_t> params, std::span<std::uint8_t> full) {
  PutLittle32(full, 0, Params::kBytes);
  Copy(params, full);
}

void GiveDialParams(std::span<const std::uint8_t> full, std::span<std::uint8_t> params) {
  Copy(full, params);
}

} // namespace quendra::platform::linux_
