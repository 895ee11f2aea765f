#pragma once

#include "forms/Desktop.h"

namespace quendra::shell {

/// The about box: one picture, which a click closes. The main window cuts it to its rounded shape.
class frmAbout : public forms::Form {
 public:
  explicit frmAbout(forms::Desktop& desktop);

  void Design() override;

  forms::Image Image1{*this, u"Image1"};

 private:
  forms::Desktop& desktop_;
};

} // namespace quendra::shell
