#pragma once

#include "forms/Desktop.h"
#include "shell/AgreementRoll.h"
#include "shell/HandCursor.h"

namespace quendra::shell {

class frmMenu;

/// The start-up form: names the product, rolls the agreement and goes on to the main window or closes. Its
/// Tag holds "not unload" when the main window failed to come up and the user is to try again.
class frmSplash : public forms::Form {
 public:
  frmSplash(forms::Desktop& desktop, frmMenu& menu);

  void Design() override;
  void Form_Load() override;

  forms::Image imgBackground{*this, u"imgBackground"};
  forms::Label lblProductName{*this, u"lblProductName"};
  forms::Label lblPlatform{*this, u"lblPlatform"};
  forms::Label lblVersion{*this, u"lblVersion"};
  forms::Label lblWarning{*this, u"lblWarning"};
  forms::Label Label1{*this, u"Label1"};
  forms::Label Label2{*this, u"Label2"};
  forms::Label Label3{*this, u"Label3"};
  forms::Label lblCompany{*this, u"lblCompany"};
  forms::Label lblCopyright{*this, u"lblCopyright"};
  // What the user sees lies over the two buffers.
  forms::PictureBox picBackBuffer{*this, u"picBackBuffer"};
  forms::PictureBox picBuffer{*this, u"picBuffer"};
  forms::PictureBox picOut{*this, u"picOut"};
  forms::Timer ReDrawTimer{*this, u"ReDrawTimer", 1, true};

  const AgreementWrap& Lines() const { return lines_; }
  const AgreementRoll& Roll() const { return roll_; }

 private:
  void Label2_Click();
  // Escape leaves what is in front: the agreement, then the program.
  void ShowAgreement();
  void HideAgreement();
  void PlaceLinkOnItsWord();
  void DesignTexts();
  void DesignPictures();

  forms::Desktop& desktop_;
  frmMenu& menu_;
  HandCursor handCursor_;
  AgreementWrap lines_;
  AgreementRoll roll_;
};

} // namespace quendra::shell
