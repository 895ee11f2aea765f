// Any bytes as the table of network interfaces, whatever number of rows they state.

#include "diagnostics/interfaces/CIpHelper.h"
#include "forms/MessageLoop.h"
#include "platform/unavailable/UnavailableIpHelper.h"
#include "runtime/Fault.h"

#include <algorithm>
#include <cstdlib>

namespace {

using namespace quendra;

class SomeTable : public platform::unavailable::UnavailableIpHelper {
 public:
  explicit SomeTable(std::span<const std::uint8_t> bytes) : bytes_(bytes) {}
  std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool) override {
    size = static_cast<std::uint32_t>(bytes_.size());
    if (buffer.size() < bytes_.size()) return kErrorInsufficientBuffer;
    std::ranges::copy(bytes_, buffer.begin());
    return 0;
  }

 private:
  std::span<const std::uint8_t> bytes_;
};

class NoBoxes : public forms::MessageLoop {
 public:
  int MessageBox(const Text&, int, const Text&) override { std::abort(); }
  void DoEvents() override {}
  [[noreturn]] void End(int) override { std::abort(); }
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  SomeTable table({data, size});
  NoBoxes loop;
  diagnostics::CIpHelper helper(table, loop);
  try {
    const auto interfaces = helper.Interfaces();
    for (const auto& item : interfaces->NewEnum())
      if (item->InterfaceName.size() != 512 || item->LastChange != 4.0) std::abort();
  } catch (const Fault& fault) {
    // A missing byte, sums or rows without bounds, a description of negative length.
    const bool expected = fault.number == Fault::kSubscript || fault.number == Fault::kOverflow ||
                          fault.number == Fault::kInvalidCall;
    if (!expected) std::abort();
  }
  return 0;
}
