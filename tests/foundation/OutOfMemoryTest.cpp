#include "foundation/SimulatedWorld.h"

#include <cstdlib>
#include <new>

namespace {

/// The next allocation of at least this many bytes fails, once; 0 for none.
thread_local std::size_t failingSize = 0;

void* Allocate(std::size_t size) {
  if (failingSize != 0 && size >= failingSize) {
    failingSize = 0;
    throw std::bad_alloc();
  }
  if (void* memory = std::malloc(size == 0 ? 1 : size)) return memory;
  throw std::bad_alloc();
}

} // namespace

void* operator new(std::size_t size) { return Allocate(size); }
void* operator new[](std::size_t size) { return Allocate(size); }
void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
  return std::malloc(size == 0 ? 1 : size);
}
void* operator new[](std::size_t size, const std::nothrow_t&) noexcept {
  return std::malloc(size == 0 ? 1 : size);
}
void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete[](void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }
void operator delete[](void* memory, std::size_t) noexcept { std::free(memory); }

namespace quendra::foundation {
namespace {

class SocketMemory : public SocketTest {
 protected:
  ~SocketMemory() override { failingSize = 0; }
};

TEST_F(SocketMemory, A_look_up_without_memory_for_its_buffer_raises_7_and_leaves_the_error_state) {
  Add(1);
  Object->Bind(1);
  Object->CloseSck(1);
  failingSize = 1024;
  EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"name"), 80); }),
            "7 Out of memory [CSocketPlus.ResolveIfHostname]");
  EXPECT_EQ(failingSize, 0u);
  EXPECT_EQ(Object->State(1), sckError);
  EXPECT_EQ(Net().LookUpsUnderWay(), 0);
}

TEST_F(SocketMemory, An_array_that_can_not_grow_raises_7_and_keeps_its_sockets) {
  Object->ArrayAdd(1);
  Object->SetTag(1, u"kept");
  std::string fault;
  for (std::int32_t index = 2; index <= 10 && fault.empty(); ++index) {
    failingSize = sizeof(SocketRecord); // not every addition makes the array grow
    fault = FaultText([&] { Object->ArrayAdd(index); });
  }
  failingSize = 0;
  EXPECT_EQ(fault, "7 Out of memory [CSocketPlus.GetFreeSocketIndex]");
  EXPECT_EQ(Object->Tag(1), u"kept");
}

TEST_F(SocketMemory, A_free_list_that_can_not_grow_raises_7) {
  Object->ArrayAdd(1);
  Object->ArrayAdd(2);
  failingSize = 1;
  EXPECT_EQ(FaultText([&] { Object->ArrayRemove(1); }), "7 Out of memory [CSocketPlus.CleanSocketArray]");
  EXPECT_FALSE(Object->ArrayIndexInUse(1));
  EXPECT_TRUE(Object->ArrayIndexInUse(2));
}

} // namespace
} // namespace quendra::foundation
