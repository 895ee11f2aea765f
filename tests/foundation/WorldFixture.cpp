#include "foundation/WorldFixture.h"

#include <algorithm>

namespace quendra::foundation {

std::string NameOf(const Variant& index) {
  if (const Text* text = index.Find<Text>()) return ToUtf8(*text);
  return ToUtf8(index.AsText());
}

ByteArray BytesFrom(const std::string& text) { return ByteArray(text.begin(), text.end()); }

void Program::Record(CSocketPlus& sockets) {
  auto& events = sockets.Events;
  const auto add = [this](std::string event) { Events.push_back(std::move(event)); };
  events.Connect = [add](const Variant& index) { add("Connect " + NameOf(index)); };
  events.CloseSck = [add](const Variant& index) { add("CloseSck " + NameOf(index)); };
  events.SendComplete = [add](const Variant& index) { add("SendComplete " + NameOf(index)); };
  events.DataArrival = [add](const Variant& index, std::int32_t total) {
    add("DataArrival " + NameOf(index) + " " + std::to_string(total));
  };
  events.ConnectionRequest = [add](const Variant& index, platform::SocketHandle) {
    add("ConnectionRequest " + NameOf(index));
  };
  events.SendProgress = [add](const Variant& index, std::int32_t sent, std::int32_t left) {
    add("SendProgress " + NameOf(index) + " " + std::to_string(sent) + " " + std::to_string(left));
  };
  events.Error = [add](const Variant& index, std::int16_t number, const Text&, std::int32_t,
                       const Text& source, const Text&, std::int32_t, bool&) {
    add("Error " + NameOf(index) + " " + std::to_string(number) + " " + ToUtf8(source));
  };
}

bool Program::Saw(const std::string& event) const {
  return std::find(Events.begin(), Events.end(), event) != Events.end();
}

std::string Program::Take(const Variant& index) {
  Variant data;
  sockets_->GetData(index, data);
  const auto* bytes = data.Find<ByteArray>();
  return bytes ? std::string(bytes->begin(), bytes->end()) : std::string();
}

} // namespace quendra::foundation
