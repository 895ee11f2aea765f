#include "foundation/Looks.h"
#include "foundation/Wording.h"
#include "shell/frmSplash.h"

namespace quendra::shell {

namespace looks = foundation::looks;
using foundation::kTitle;
using foundation::Px;

void frmSplash::Design() {
  Caption = Text(kTitle);
  Tag = Text();
  Border = forms::BorderStyle::None;
  MinimizeBox = false;
  BackColour = looks::kPaper;
  Move(0, 0, Px(600), Px(400));
  imgBackground.Contents = forms::Picture::Artwork("splash");
  imgBackground.Move(0, 0, Px(600), Px(400));
  DesignTexts();
  DesignPictures();
}

void frmSplash::DesignTexts() {
  looks::PlainText(lblProductName, kTitle, {26, true, false}, looks::kForest);
  lblProductName.Move(Px(36), Px(84), Px(360), Px(52));
  looks::PlainText(lblPlatform, u"ל-Windows XP", {12, false, false}, looks::kForest);
  lblPlatform.Move(Px(38), Px(140), Px(200), Px(26));
  looks::PlainText(lblVersion, u"גירסה 1.1", {10, false, false}, looks::kForest);
  lblVersion.Move(Px(38), Px(168), Px(200), Px(22));

  looks::PlainText(lblWarning,
                   u"הרצת התוכנה פירושה הסכמה מפורשת לתנאים המצורפים. ניתן לעיין בתנאים בלחיצה כאן.",
                   looks::kBody);
  lblWarning.Move(Px(24), Px(288), Px(560), Px(22));
  looks::Link(Label1, u"כאן", looks::kBody, looks::kLeaf);
  Label1.TabIndex = 1; // the buttons come first
  Label1.Transparent = false;
  Label1.BackColour = looks::kPaper;
  Label1.Move(Px(24), Px(288), Px(30), Px(22));

  looks::LeadingButton(Label2, u"המשך");
  Label2.Move(Px(24), Px(330), Px(120), Px(36));
  looks::Button(Label3, u"סגור");
  Label3.Move(Px(156), Px(330), Px(120), Px(36));

  looks::PlainText(lblCompany, u"זלמר בינלאומי בע\"מ", looks::kSmall, looks::kQuiet);
  lblCompany.Align = forms::Alignment::Trailing;
  lblCompany.Move(Px(300), Px(332), Px(276), Px(18));
  looks::PlainText(lblCopyright, u"© כל הזכויות שמורות", looks::kSmall, looks::kQuiet);
  lblCopyright.Align = forms::Alignment::Trailing;
  lblCopyright.Move(Px(300), Px(350), Px(276), Px(18));
}

void frmSplash::DesignPictures() {
  for (forms::PictureBox* picture : {&picBackBuffer, &picBuffer, &picOut}) {
    picture->ScaleMode = forms::ScaleMode::Pixels;
    picture->TextFont = looks::kBody;
    picture->BackColour = forms::kBlack;
    picture->Visible = false;
    picture->Move(Px(24), Px(24), Px(552), Px(248));
  }
  ReDrawTimer.Interval = 1;
  ReDrawTimer.Enabled = true;
}

} // namespace quendra::shell
