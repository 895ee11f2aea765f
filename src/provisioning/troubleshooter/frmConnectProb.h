#pragma once

#include "forms/Desktop.h"
#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

/// The dialog that tries a connection and says what may be wrong with it. What its check does is the work of
/// the troubleshooter, which is made later.
class frmConnectProb : public forms::Form {
 public:
  frmConnectProb(forms::Desktop& desktop, mdlDun& dun);

  void Design() override;
  void Form_Load() override;
  /// Hangs up whatever is open or being dialled.
  void Form_Unload() override;

  forms::Label Label1{*this, u"Label1"};
  forms::ComboBox cmbDialups{*this, u"cmbDialups"};
  forms::Label Label3{*this, u"Label3"};
  forms::TextBox txtEmunrateError{*this, u"txtEmunrateError"};
  forms::Label Label2{*this, u"Label2"};
  forms::TextBox txtStatus{*this, u"txtStatus"};
  forms::Label Label4{*this, u"Label4"};
  forms::Label lblDiagnoze{*this, u"lblDiagnoze"};
  forms::CommandButton cmdCheck{*this, u"cmdCheck"};
  forms::CommandButton Command1{*this, u"Command1"};

  /// The entry that is picked. Fault 9 for none.
  const Text& PickedEntry() const;
  WindowHandle Window() { return desktop_.HandleOf(*this); }

  /// One line more in the log, which shows its end.
  void Append(TextView line);
  /// Shows the log as it is now, whoever holds the thread.
  void RefreshStatus() { desktop_.Repaint(txtStatus); }
  /// Shows a diagnosis, in red.
  void Diagnose(const char16_t* diagnosis);

 private:
  void DesignEntries();
  void DesignOutcome();

  forms::Desktop& desktop_;
  mdlDun& dun_;
  std::vector<Text> entries_;
  std::int32_t entryCount_ = 0;
};

} // namespace quendra::provisioning
