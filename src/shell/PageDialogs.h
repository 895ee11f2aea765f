#pragma once

#include "forms/Desktop.h"

namespace quendra::shell {

/// The dialogs that buttons of pages show over the main window.
class PageDialogs {
 public:
  PageDialogs(forms::Desktop& desktop, forms::Form& owner) : desktop_(desktop), owner_(owner) {}

  /// A click on the button shows the dialog.
  void Offer(forms::Label& button, forms::Form& dialog) {
    button.Click = [this, &dialog] { ShowModally(dialog); };
  }

 private:
  void ShowModally(forms::Form& dialog);

  forms::Desktop& desktop_;
  forms::Form& owner_;
};

} // namespace quendra::shell
