// Any text as a path of the registry, a value's name and its data, split at line feeds: what is written is
// found again, and nothing stays open.

#include "foundation/RegEdit.h"
#include "platform/registry/StoredRegistry.h"
#include "platform/simulated/registry/RegistryTree.h"
#include "runtime/Fault.h"

#include <algorithm>
#include <cstdlib>

namespace {

using namespace quendra;

void Require(bool holds) {
  if (!holds) std::abort();
}

/// Boxes are counted, and nothing else happens.
struct CountingLoop : forms::MessageLoop {
  int boxes = 0;
  int MessageBox(const Text& text, int flags, const Text& title) override {
    Require(text.starts_with(u"Incorrect Format:\n\n") && flags == 0 && title == u"Quendra");
    return ++boxes;
  }
  void DoEvents() override {}
  [[noreturn]] void End(int) override { std::abort(); }
};

/// One hive, in which keys can be made; a fresh system's other keys would have to be made for every run.
struct SmallRegistry {
  SmallRegistry() {
    platform::RegistryStore::KeyNumber made = 0;
    Require(tree.Make(platform::kLocalMachine.Value(), {"SOFTWARE"}, made) == platform::kRegistrySuccess);
  }
  platform::simulated::RegistryTree tree;
  platform::StoredRegistry registry{tree};
};

std::string TakeLine(std::string_view& rest) {
  const std::size_t end = std::min(rest.find('\n'), rest.size());
  std::string line(rest.substr(0, end));
  rest.remove_prefix(std::min(end + 1, rest.size()));
  return line;
}

void CheckSplit(foundation::RegEdit& regEdit, const Text& path, int boxesBefore, const CountingLoop& loop) {
  Text rest = path;
  platform::RegistryKey hive(1);
  regEdit.SplitRegPath(rest, hive);
  const bool isWellFormed = path.starts_with(u"HKEY_") && !path.ends_with(u'\\');
  Require((loop.boxes == boxesBefore) == isWellFormed);
  Require(isWellFormed ? path.ends_with(rest) && hive != platform::RegistryKey(1)
                       : rest == path && hive == platform::RegistryKey(1));
}

void CheckWritten(platform::Registry& registry, foundation::RegEdit& regEdit, const Text& path,
                  const Text& name, const Text& data) {
  regEdit.CreateRegKey(path);
  regEdit.SetRegDword(path, name, 0x12345678);
  regEdit.SetRegString(path, name, data);
  if (regEdit.LastHive() == platform::kNoRegistryKey || regEdit.LastRegStatus() != 0) return;
  const bool isWellFormed = path.starts_with(u"HKEY_") && !path.ends_with(u'\\');
  const std::size_t backslash = path.find(u'\\');
  const Text below = !isWellFormed ? path : backslash == Text::npos ? Text() : path.substr(backslash + 1);
  platform::RegistryKey key;
  std::uint32_t type = 0;
  std::uint32_t size = 0;
  Require(registry.RegOpenKeyExA(regEdit.LastHive(), ToCodePage(below), platform::kKeyRead, key) == 0);
  // A name that is too long is refused, which the closing of its key hides.
  if (registry.RegQueryValueExA(key, ToCodePage(name), type, {}, size) == 0)
    Require(type == platform::kRegText && size == data.size());
  Require(registry.RegCloseKey(key) == 0);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  std::string_view rest(reinterpret_cast<const char*>(data), size);
  SmallRegistry small;
  CountingLoop loop;
  foundation::RegEdit regEdit(small.registry, loop);
  // Two paths, so that a bad one comes after a good one.
  for (int i = 0; i < 2; ++i) {
    const Text path = FromCodePage(TakeLine(rest));
    const Text name = FromCodePage(TakeLine(rest));
    CheckSplit(regEdit, path, loop.boxes, loop);
    CheckWritten(small.registry, regEdit, path, name, FromCodePage(rest));
  }
  Require(small.registry.OpenCount() == 0);
  return 0;
}
