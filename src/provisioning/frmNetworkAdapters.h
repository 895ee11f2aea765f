#pragma once

#include "forms/FormHost.h"
#include "forms/controls/Controls.h"

namespace quendra::provisioning {

/// The dialog in which the subscriber picks a network card. Whoever shows it loads it first and adds the
/// cards to `lstNICs`, and reads the choice from its Tag: the index in the list, "-1" with none selected,
/// nothing when the dialog was closed. The list is emptied by a new load alone.
class frmNetworkAdapters : public forms::Form {
 public:
  explicit frmNetworkAdapters(forms::FormHost& forms);

  void Design() override;
  /// A choice of an earlier showing must not be read as this one's.
  void Form_Unload() override { Tag = Text(); }

  forms::ListBox lstNICs{*this, u"lstNICs"};
  forms::CommandButton Command1{*this, u"Command1"};
  forms::CommandButton cmdClose{*this, u"cmdClose"};

 private:
  void Command1_Click();
};

} // namespace quendra::provisioning
