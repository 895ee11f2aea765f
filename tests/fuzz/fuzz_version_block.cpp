// Any bytes as the version block of an executable file, and any path below it.

#include "platform/process/VersionBlock.h"

#include <cstdlib>

namespace {

using namespace quendra;

void Look(std::span<const std::uint8_t> block, TextView path) {
  const auto value = platform::ValueOfVersionBlock(block, path);
  // A text has a byte for two and a NUL of its own: no value is longer than what it is read from.
  if (value && value->size() > block.size()) std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::span<const std::uint8_t> block(data, size);
  for (const char16_t* path :
       {u"\\", u"\\VarFileInfo\\Translation", u"\\StringFileInfo\\040D04B0\\ProductName",
        u"\\StringFileInfo\\040D04B0\\CompanyName"})
    Look(block, path);
  return 0;
}
