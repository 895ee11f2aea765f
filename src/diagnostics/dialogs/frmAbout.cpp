#include "diagnostics/dialogs/frmAbout.h"

#include "foundation/Twips.h"

namespace quendra::diagnostics {

using foundation::Px;

frmAbout::frmAbout(forms::FormHost& forms) : Form(u"frmAbout"), forms_(forms) {
  Image1.Click = [this] { forms_.Unload(*this); };
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

} // namespace quendra::diagnostics
