#include "app/windows/Resources.h"

#include "platform/windows/process/WindowsHandles.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <new>
#include <ostream>
#include <vector>

namespace {

int objectsOnHeap = 0; // there is one thread

} // namespace

// These take the place of the compiler's own in this executable.
void* operator new(std::size_t size) {
  void* const object = std::malloc(size ? size : 1);
  if (!object) throw std::bad_alloc();
  ++objectsOnHeap;
  return object;
}
void operator delete(void* object) noexcept {
  objectsOnHeap -= object != nullptr;
  std::free(object);
}
void operator delete(void* object, std::size_t) noexcept { operator delete(object); }

namespace quendra::app::windows {

namespace {

/// Of the table that the process block shows, as Wine lays it out. There the call that counts answers 0.
struct DrawingEntry {
  std::uint64_t object;
  std::uint32_t owner;
  std::uint16_t unique;
  std::uint16_t kind; ///< 0 for one that is free
  std::uint64_t users;
};
static_assert(sizeof(DrawingEntry) == 24);
constexpr std::size_t kDrawingEntries = 0x4000;

const DrawingEntry* DrawingTable() {
  constexpr std::size_t kPlaceInThreadBlock = 0x30;
  constexpr std::size_t kPlaceInProcessBlock = 0x94;
  const auto* thread = reinterpret_cast<const std::uint8_t*>(::NtCurrentTeb());
  const auto* process = *reinterpret_cast<const std::uint8_t* const*>(thread + kPlaceInThreadBlock);
  return *reinterpret_cast<const DrawingEntry* const*>(process + kPlaceInProcessBlock);
}

int DrawingObjects() {
  if (const DWORD told = ::GetGuiResources(::GetCurrentProcess(), GR_GDIOBJECTS))
    return static_cast<int>(told);
  const DrawingEntry* table = DrawingTable();
  return static_cast<int>(std::count_if(table, table + kDrawingEntries,
                                        [](const DrawingEntry& entry) { return entry.kind != 0; }));
}

int HighestOfNewIcons() {
  if (const DWORD told = ::GetGuiResources(::GetCurrentProcess(), GR_USEROBJECTS))
    return static_cast<int>(told);
  const std::array<BYTE, 128> bits{};
  std::vector<HICON> icons(64);
  int highest = 0;
  for (HICON& icon : icons) {
    icon = ::CreateIcon(nullptr, 16, 16, 1, 1, bits.data(), bits.data());
    highest = std::max<int>(highest, LOWORD(reinterpret_cast<std::uintptr_t>(icon)) / 2);
  }
  for (const HICON icon : icons) ::DestroyIcon(icon);
  return highest;
}

/// By the table of all: the call that counts those of a process answers 0 in Wine.
int Handles() {
  using platform::Handles;
  platform::windows::LastError lastError;
  platform::windows::WindowsHandles handles(lastError);
  std::vector<std::uint8_t> table(1 << 20);
  std::uint32_t length = 0;
  if (handles.NtQuerySystemInformation(Handles::kHandleTable, table, length) != 0) return -1;
  int count = 0;
  for (std::uint32_t i = 0; i < Little32(table, 0); ++i)
    count += Little32(table, Handles::kCountBytes + i * Handles::kRecordBytes) == ::GetCurrentProcessId();
  return count;
}

std::size_t BytesOf(HANDLE heap) {
  std::size_t bytes = 0;
  PROCESS_HEAP_ENTRY entry{};
  while (::HeapWalk(heap, &entry))
    if (entry.wFlags & PROCESS_HEAP_ENTRY_BUSY) bytes += entry.cbData;
  return bytes;
}

int KilobytesOfHeaps() {
  std::array<HANDLE, 64> heaps{};
  const DWORD count = std::min<DWORD>(::GetProcessHeaps(static_cast<DWORD>(heaps.size()), heaps.data()), 64);
  std::size_t bytes = 0;
  for (DWORD i = 0; i < count; ++i) bytes += BytesOf(heaps[i]);
  return static_cast<int>(bytes / 1024);
}

} // namespace

Resources Resources::Now() {
  return {DrawingObjects(), HighestOfNewIcons(), Handles(), objectsOnHeap, KilobytesOfHeaps()};
}

std::ostream& operator<<(std::ostream& out, const Resources& held) {
  return out << held.drawing << " drawing objects, " << held.windows << " the highest window or icon, "
             << held.handles << " handles, " << held.objects << " objects, " << held.kilobytes << " KB";
}

} // namespace quendra::app::windows
