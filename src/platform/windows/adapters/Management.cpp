#include "platform/windows/adapters/Management.h"

#include <algorithm>
#include <limits>
#include <utility>

namespace quendra::platform::windows {

namespace {

constexpr LONG kPatience = 30'000; // milliseconds, for one object
constexpr std::size_t kMostObjects = 1000;

} // namespace

std::vector<std::shared_ptr<NetworkCard>> Management::ExecQuery(const std::string& query) {
  using Found = std::pair<std::uint32_t, std::shared_ptr<NetworkCard>>;
  std::vector<Found> found;
  for (const auto& object : Objects(query)) {
    ComValue index(*com_);
    object->Get(L"Index", 0, index.Get(), nullptr, nullptr);
    ManagedCard::Place place{ToCodePage(TextOf(*object.Get(), L"Description")),
                             TextOf(*object.Get(), L"__PATH")};
    found.emplace_back(index.AsNumber(std::numeric_limits<std::uint32_t>::max()),
                       std::make_shared<ManagedCard>(com_, services_, std::move(place)));
  }
  std::ranges::stable_sort(found, {}, &Found::first);
  std::vector<std::shared_ptr<NetworkCard>> cards;
  for (auto& [index, card] : found) cards.push_back(std::move(card));
  return cards;
}

std::vector<ComPtr<IWbemClassObject>> Management::Objects(const std::string& query) {
  const ComText language(*com_, u"WQL");
  const ComText text(*com_, FromCodePage(query));
  ComPtr<IEnumWbemClassObject> answer;
  const HRESULT asked =
      services_->ExecQuery(language.Get(), text.Get(), WBEM_FLAG_FORWARD_ONLY | WBEM_FLAG_RETURN_IMMEDIATELY,
                           nullptr, answer.Receive());
  std::vector<ComPtr<IWbemClassObject>> objects;
  if (FAILED(asked) || !answer) return objects;
  com_->LetActAsUser(answer.Get());
  while (objects.size() < kMostObjects) {
    ComPtr<IWbemClassObject> object;
    ULONG count = 0;
    if (answer->Next(kPatience, 1, object.Receive(), &count) != WBEM_S_NO_ERROR || count == 0) break;
    objects.push_back(std::move(object));
  }
  return objects;
}

Text Management::TextOf(IWbemClassObject& object, const wchar_t* property) {
  ComValue value(*com_);
  object.Get(property, 0, value.Get(), nullptr, nullptr);
  return value.AsText();
}

} // namespace quendra::platform::windows
