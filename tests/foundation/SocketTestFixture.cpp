#include "foundation/SimulatedWorld.h"
#include "runtime/Fault.h"

#include <stdexcept>

namespace quendra::foundation {

std::string FaultText(const std::function<void()>& work) {
  try {
    work();
  } catch (const Fault& fault) {
    return std::to_string(fault.number) + " " + ToUtf8(fault.description) + " [" + ToUtf8(fault.source) + "]";
  }
  return {};
}

void SocketTest::Add(const Variant& index, SocketProtocol protocol) {
  Object->ArrayAdd(index);
  Object->SetProtocol(index, protocol);
}

void SocketTest::Connect(const Variant& index) {
  Add(index);
  Object->Connect(index, Text(u"10.1.1.1"), 80);
  Settle();
  if (Object->State(index) != sckConnected) throw std::runtime_error("no connection");
  Object.Events.clear();
}

} // namespace quendra::foundation
