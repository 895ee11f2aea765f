#pragma once

#include "forms/FormHost.h"
#include "forms/controls/Image.h"

namespace quendra::diagnostics {

/// The about box: one picture, which a click closes. The main window cuts it to its rounded shape.
class frmAbout : public forms::Form {
 public:
  explicit frmAbout(forms::FormHost& forms);

  void Design() override;

  forms::Image Image1{*this, u"Image1"};

 private:
  forms::FormHost& forms_;
};

} // namespace quendra::diagnostics
