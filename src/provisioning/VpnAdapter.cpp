#include "provisioning/VpnAdapter.h"

#include "foundation/Wording.h"
#include "runtime/Fault.h"
#include "runtime/Format.h"

namespace quendra::provisioning {

namespace {

/// As modems of this kind expect it.
constexpr const char* kAddress = "10.200.1.1";
constexpr const char* kMask = "255.0.0.0";
constexpr const char* kGateway = "10.0.0.138";
constexpr std::uint16_t kMetric = 1;

/// The cards are walked up to the one that is chosen, so a choice without any is compared with nothing.
platform::NetworkCard& Chosen(const std::vector<std::shared_ptr<platform::NetworkCard>>& cards,
                              const Text& choice) {
  double position = 0;
  for (const auto& card : cards)
    if (NumberOf(choice) == position++) return *card;
  throw Fault(Fault::kObjectNotSet);
}

} // namespace

void VpnAdapter::ConfigureVpnAdapter(forms::Form& owner, Steps steps) {
  const Cards cards = FindCards(steps);
  List(cards);
  const Text choice = cards.size() > 1 ? AskForCard(owner) : u"0";
  if (choice.empty()) {
    desktop_.MessageBox(u"לא בחרת כרטיס רשת להגדרה!\r\nעליך להגדירו באופן ידני.",
                        forms::kQuestion | forms::kHebrewBox, foundation::kTitle);
    return;
  }
  platform::NetworkCard& card = Chosen(cards, choice);
  card.EnableStatic({kAddress}, {kMask});
  card.SetGateways({kGateway}, {kMetric});
}

VpnAdapter::Cards VpnAdapter::FindCards(Steps steps) {
  Tell(steps);
  const auto management = adapters_.GetObject(platform::Adapters::kMoniker);
  Tell(steps);
  Cards cards = management->ExecQuery(platform::Adapters::kCards);
  Tell(steps);
  return cards;
}

void VpnAdapter::Tell(Steps steps) {
  if (steps == Steps::Told) desktop_.MessageBox(u"OK", 0, u"Quendra");
}

// The list keeps what an earlier run left there as long as the form stays loaded.
void VpnAdapter::List(const Cards& cards) {
  desktop_.Load(choice_);
  for (const auto& card : cards) choice_.lstNICs.AddItem(FromCodePage(card->Description()));
}

Text VpnAdapter::AskForCard(forms::Form& owner) {
  desktop_.Show(choice_, forms::Modality::Modal, &owner);
  return choice_.IsLoaded() ? choice_.Tag() : Text();
}

} // namespace quendra::provisioning
