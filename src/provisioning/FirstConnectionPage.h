#pragma once

#include "forms/Page.h"
#include "provisioning/page/Choice.h"
#include "provisioning/page/ConnectionPanel.h"
#include "provisioning/page/KeyMending.h"
#include "provisioning/page/MailPanel.h"
#include "provisioning/page/StepMenu.h"

#include <functional>

namespace quendra::provisioning {

/// The page on which a subscriber makes the first connection and then sets up the mail: a menu of two steps,
/// each a panel that lies over the menu while it is open. What the steps do is other modules' work.
class FirstConnectionPage : public forms::Page {
 public:
  FirstConnectionPage(forms::PageWindow& window, const forms::PageRow& row, platform::KeyboardLayout& layout);

  void Design() override;

  /// Raised by `frsCon_cmdCreate` and `frsCon_cmdCreateEmail`.
  forms::Event<> CreateConnection;
  forms::Event<> CreateMailAccount;
  /// Tells which mail programs the machine has, as tokens that end in "|" each. Asked at each opening of the
  /// page.
  std::function<Text()> DetectMailClients;

  forms::Frame& frameFirstConnection = frame;
  forms::Label frsCon_lblTitle{frame, u"frsCon_lblTitle"};
  StepMenu menu{frame};
  MailPanel mail{frame};
  ConnectionPanel connection{frame};
  /// Beside the user name, the password and the mail user name.
  std::array<forms::Label, 3> frsCon_lblError;
  forms::Label frsCon_lblBack{frame, u"frsCon_lblBack"};

 private:
  Choice modems_{connection.frsCon_lblModemBG};
  Choice mails_{mail.frsCon_lblMailBG2};

 public:
  /// The chosen row and the one under the mouse, -1 for none.
  const std::int16_t& SelectedModem = modems_.Selected;
  const std::int16_t& HoverModem = modems_.Hovered;
  const std::int16_t& SelectedMail = mails_.Selected;
  const std::int16_t& HoverMail = mails_.Hovered;

  void HoverModemRow(std::int16_t row);
  void SelectModemRow(std::int16_t row);
  void HoverMailRow(std::int16_t row);
  void SelectMailRow(std::int16_t row);
  void UpdateCreateEnabled();
  void ClearMenuLines() { menu.ClearMenuLines(); }

 private:
  void PrepareFirstConnectionPage();
  void CloseFirstConnectionPage();
  void HideConnectionErrors();

  void WireMenu();
  void WireConnectionStep();
  void WireMailStep();
  /// Shows the hand over the control and does nothing else.
  void OfferHand(forms::Control& control);
  void frsCon_lblBack_Click();

  KeyMending keys_;
};

} // namespace quendra::provisioning
