#pragma once

#include "forms/Desktop.h"
#include "platform/adapters/Adapters.h"
#include "provisioning/frmNetworkAdapters.h"

namespace quendra::provisioning {

/// Gives a network card the addresses by which it reaches a modem that is dialled as a VPN.
class VpnAdapter {
 public:
  VpnAdapter(platform::Adapters& adapters, forms::Desktop& desktop, frmNetworkAdapters& frmNetworkAdapters)
      : adapters_(adapters), desktop_(desktop), choice_(frmNetworkAdapters) {}

  /// Whether a box stands before the system's management is asked for, after that and after its answer.
  enum class Steps { Silent, Told };
  /// Where there are several cards the user picks one, in a form over `owner`; who picks none is told to do
  /// it by hand. A choice that no card stands for raises fault 91.
  void ConfigureVpnAdapter(forms::Form& owner, Steps steps);

 private:
  using Cards = std::vector<std::shared_ptr<platform::NetworkCard>>;

  Cards FindCards(Steps steps);
  void Tell(Steps steps);
  void List(const Cards& cards);
  /// The form of the number of a row, or whatever the form leaves; empty for none.
  Text AskForCard(forms::Form& owner);

  platform::Adapters& adapters_;
  forms::Desktop& desktop_;
  frmNetworkAdapters& choice_;
};

} // namespace quendra::provisioning
