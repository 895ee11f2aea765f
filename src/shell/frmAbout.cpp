#include "shell/frmAbout.h"

#include "foundation/Twips.h"

namespace quendra::shell {

using foundation::Px;

frmAbout::frmAbout(forms::Desktop& desktop) : Form(u"frmAbout"), desktop_(desktop) {
  Image1.Click = [this] { desktop_.Unload(*this); };
  Default = Cancel = &Image1;
}

void frmAbout::Design() {
  Caption = u"About Quendra Monitor";
  Border = forms::BorderStyle::None;
  MinimizeBox = false;
  Move(0, 0, Px(420), Px(280));
  Image1.Contents = forms::Picture::Artwork("about");
  Image1.Move(0, 0, Px(420), Px(280));
}

} // namespace quendra::shell
