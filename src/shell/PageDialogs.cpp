#include "shell/PageDialogs.h"

namespace quendra::shell {

void PageDialogs::ShowModally(forms::Form& dialog) {
  // A window that stood over all others would hide the dialog.
  desktop_.SetWindowPos(desktop_.HandleOf(owner_), forms::InsertAfter::NotTopmost, 0, 0, 0, 0,
                        forms::kKeepsSize | forms::kKeepsPlace);
  desktop_.Show(dialog, forms::Modality::Modal, &owner_);
}

} // namespace quendra::shell
