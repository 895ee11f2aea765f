#pragma once

#include "forms/controls/TextBox.h"

#include <cstdint>

namespace quendra::forms {
class MessageLoop;
}

namespace quendra::mail {

class ExpressAccount;
class OutlookProfile;

/// What the module reads of the page, and the box in which it mends the name.
struct MailForm {
  const std::int16_t& SelectedMail; ///< the tile that the user chose; -1 for none
  forms::TextBox& frsCon_txtEmailUN;
  const forms::TextBox& frsCon_txtFullName;
  const forms::TextBox& frsCon_txtUsername; ///< the connection's
};

/// The numbers of the tiles.
enum MailTile : std::int16_t {
  kOutlookExpress = 0,
  kOutlookXp = 1,
  kOutlook2000 = 2,
  kOutlook97 = 3, ///< has a tile that is never shown, and no account can be made for it
  kOutlook2003 = 4,
};

/// Makes the mail account that the user asks for on the page.
class mdlEmail {
 public:
  mdlEmail(const MailForm& form, forms::MessageLoop& loop, ExpressAccount& express, OutlookProfile& outlook)
      : form_(form), loop_(loop), express_(express), outlook_(outlook) {}

  /// Tells in a box how it ended, or why it didn't begin.
  void CreateMailAccount();

 private:
  bool MayGoOn();
  void MendUserName();
  bool IsNameOfConnection() const;
  /// 0 for success.
  std::int32_t CreateChosen();
  int Tell(const Text& text, int icon);

  MailForm form_;
  forms::MessageLoop& loop_;
  ExpressAccount& express_;
  OutlookProfile& outlook_;
};

} // namespace quendra::mail
