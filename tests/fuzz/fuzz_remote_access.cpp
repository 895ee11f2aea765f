// Any sizes, counts and bytes as what a machine tells of its entries, dial parameters, connections and
// devices.

#include "forms/headless/HeadlessDesktop.h"
#include "platform/unavailable/UnavailableDialling.h"
#include "platform/unavailable/UnavailablePhoneBook.h"
#include "platform/unavailable/UnavailableSystem.h"
#include "provisioning/remote_access/RasDialParamsImage.h"
#include "provisioning/remote_access/RasEntryImage.h"
#include "provisioning/remote_access/mdlDun.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

namespace {

using namespace quendra;
using provisioning::RasDialParamsRecord;
using provisioning::RasEntryRecord;

constexpr std::size_t kHead = 14;

/// A size up to some records, or one without measure: what lies between would fill the time with fetching
/// memory.
std::uint32_t Size(std::span<const std::uint8_t> told, std::size_t at) {
  const std::uint32_t size = Little32(told, at);
  return size <= 8192 ? size : 0xFFFFFFFF;
}

/// What the machine says: how long its record is, how many bytes it needs, how many records there are, which
/// call fails, and what it fills buffers with.
class Lying : public platform::unavailable::UnavailablePhoneBook,
              public platform::unavailable::UnavailableDialling {
 public:
  explicit Lying(std::span<const std::uint8_t> told)
      : failing_(told[1]), record_(Size(told, 2)), needed_(Size(told, 6)), count_(Little32(told, 10)),
        content_(told.subspan(kHead)) {}

  std::span<const std::uint8_t> Content() const { return content_; }
  std::uint32_t HangUps = 0;

  std::uint32_t RasEnumEntriesA(const char*, std::span<std::uint8_t> names, std::uint32_t& bytes,
                                std::uint32_t& count) override {
    return Fill(names, bytes, count);
  }
  std::uint32_t RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                std::uint32_t& count) override {
    return Fill(devices, bytes, count);
  }
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                    std::uint32_t& count) override {
    if (Little32(connections, 0) != record_) return platform::kRasInvalidSize;
    return Fill(connections, bytes, count);
  }
  std::uint32_t RasGetEntryPropertiesA(const char*, const char* name, std::span<std::uint8_t> entry,
                                       std::uint32_t& bytes) override {
    std::uint32_t count = 0;
    const std::uint32_t result = Fill(entry, bytes, count);
    if (!name) bytes = record_;
    return result;
  }
  std::uint32_t RasSetEntryPropertiesA(const char*, const char*, std::span<const std::uint8_t>) override {
    return Fails() ? 5 : 0;
  }
  std::uint32_t RasGetEntryDialParamsA(const char*, std::span<std::uint8_t>, bool&) override {
    return Fails() ? platform::kRasInvalidSize : platform::kRasCannotFindPhonebookEntry;
  }
  std::uint32_t RasSetEntryDialParamsA(const char*, std::span<const std::uint8_t>, bool) override {
    return Fails() ? 5 : 0;
  }
  std::uint32_t RasHangUpA(platform::RasConnection) override {
    ++HangUps;
    return 0;
  }

 private:
  bool Fails() { return ++calls_ == failing_; }
  /// A question for the size finds no room, and so does the first one for the names of entries.
  std::uint32_t Fill(std::span<std::uint8_t> buffer, std::uint32_t& bytes, std::uint32_t& count) {
    if (Fails()) return platform::kRasManagerCannotStart;
    bytes = needed_;
    count = count_;
    std::copy_n(content_.begin(), std::min(content_.size(), buffer.size()), buffer.begin());
    const bool asks = buffer.size() <= 4 ||
                      (buffer.size() == platform::RasEntryName::kBytes && !std::exchange(asked_, true));
    return asks ? platform::kRasBufferTooSmall : platform::kRasSuccess;
  }

  const int failing_;
  const std::uint32_t record_;
  const std::uint32_t needed_;
  const std::uint32_t count_;
  const std::span<const std::uint8_t> content_;
  int calls_ = 0;
  bool asked_ = false;
};

void Require(bool holds) {
  if (!holds) std::abort();
}

/// Written and read again, a record that was read is the same, but for the NUL behind its alternate numbers.
void RequireLasting(RasEntryRecord entry, std::uint32_t recordBytes) {
  if (recordBytes < platform::RasEntry::kAlternateOffset + 4 || recordBytes == 0xFFFFFFFF) return;
  RasEntryRecord once;
  TakeRasEntryImage(once, RasEntryImageOf(entry, recordBytes), recordBytes);
  Require(once.alternateNumbers ==
          (entry.alternateNumbers.empty() ? Text() : entry.alternateNumbers + u'\0'));
  RasEntryRecord twice;
  TakeRasEntryImage(twice, RasEntryImageOf(once, recordBytes), recordBytes);
  once.alternateNumbers = twice.alternateNumbers = {};
  Require(once == twice);
}

void RequireLasting(const RasDialParamsRecord& params) {
  std::vector<std::uint8_t> image(params.size);
  RasDialParamsRecord once;
  PutRasDialParams(params, image);
  Require(TakeRasDialParams(once, image));
  RasDialParamsRecord twice;
  PutRasDialParams(once, image);
  Require(TakeRasDialParams(twice, image) && once == twice);
}

void Entry(provisioning::mdlDun& dun, std::uint32_t recordBytes) {
  Text name = u"097";
  Text phoneBook;
  RasEntryRecord entry;
  RasDialParamsRecord params{.userName = u"user"};
  if (dun.GetEntryProperties(entry, name, phoneBook) == kTrue16) RequireLasting(entry, recordBytes);
  dun.SetEntryProperties(name, entry, params, phoneBook);
}

void DialParams(provisioning::mdlDun& dun, std::span<const std::uint8_t> image) {
  RasDialParamsRecord params;
  if (dun.DialParamsFromBytes({image.begin(), image.end()}, params) == kTrue16) RequireLasting(params);
}

void Names(provisioning::mdlDun& dun) {
  std::vector<Text> names;
  std::int32_t count = 0;
  Text phoneBook;
  if (dun.EnumEntries(names, count, phoneBook) == kTrue16) Require(names.size() == std::size_t(count));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < kHead) return 0;
  Lying machine({data, size});
  platform::unavailable::UnavailableSystem system;
  forms::headless::HeadlessDesktop desktop;
  provisioning::mdlDun dun({machine, machine}, system, desktop);
  switch (data[0] % 5) {
  case 0: Entry(dun, Size({data, size}, 2)); break;
  case 1: DialParams(dun, machine.Content()); break;
  case 2: dun.HangUpAllConnections(); break;
  case 3: Names(dun); break;
  default: dun.FindDeviceName(u"pppoe", data[1] % 2 == 0 ? kTrue16 : kFalse16);
  }
  return 0;
}
