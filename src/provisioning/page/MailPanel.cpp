#include "provisioning/page/MailPanel.h"

#include "provisioning/page/StepLooks.h"

#include <algorithm>

namespace quendra::provisioning {

using foundation::Px;

namespace {

// Twips: where the first tile stands, and how far the next one from it.
constexpr int kFirstTileLeft = 6525;
constexpr int kTilePitch = 1266;

constexpr int kTileWidth = 82;
constexpr int kTileHeight = 124;
constexpr int kPictureHeight = 66;
/// What is left of a tile round its picture and its caption.
constexpr int kEdge = 2;

struct MailProgram {
  const char16_t* token;
  const char16_t* caption;
  const char* artwork;
};
constexpr std::array<MailProgram, MailPanel::kTiles> kPrograms{{
    {u"OE", u" אאוטלוק אקספרס", "mail_0"},
    {u"MSO XP", u"מיקרוסופט אאוטלוק XP", "mail_1"},
    {u"MSO 2k", u"מיקרוסופט אאוטלוק 2000", "mail_2"},
    {u"MSO 97", u"מיקרוסופט אאוטלוק 97", "mail_3"},
    {u"MSO 2k3", u"מיקרוסופט אאוטלוק 2003", "mail_4"},
}};

} // namespace

void MailPanel::Design(const forms::Geometry& place) {
  steps::StepFrame(frsCon_Frame2, place);
  steps::StepTitle(Title, u"פרטי הדואר");
  steps::StepField(FullNamePrompt, u"שם מלא:", frsCon_txtFullName, 66);
  steps::StepField(EmailUNPrompt, u"שם משתמש בדואר:", frsCon_txtEmailUN, kEmailUNTop);
  DesignTiles();
  steps::StepButton(frsCon_Picture12, "create_mail", frsCon_cmdCreateEmail, u"צור חשבון דואר", place.height);
}

void MailPanel::DesignTiles() {
  steps::ChoicePrompt(MailsPrompt, u"בחר את תוכנת הדואר שלך:");
  Tiles.Caption = Text();
  Tiles.Border = false;
  Tiles.BackColour = steps::kStepGround;
  Tiles.Move(Px(steps::kChoiceLeft), Px(56), Px(524), Px(kTileHeight));
  for (std::size_t tile = 0; tile < kTiles; ++tile) DesignTile(tile);
}

void MailPanel::DesignTile(std::size_t tile) {
  frsCon_lblMailsBG[tile].BackColour = steps::kStepGround;
  frsCon_lblMailsBG[tile].Visible = false;
  frsCon_lblMailsBG[tile].Move(kFirstTileLeft, 0, Px(kTileWidth), Px(kTileHeight));
  frsCon_lblMailBG2[tile].Transparent = true;
  frsCon_lblMailBG2[tile].BackColour = forms::kWhite;
  // Inside the tile's edge, where the mouse finds the tile itself.
  frsCon_lblMailBG2[tile].Move(Px(kEdge), Px(kEdge), Px(kTileWidth - 2 * kEdge), Px(kTileHeight - 2 * kEdge));
  frsCon_imgMails[tile].Contents = forms::Picture::Artwork(kPrograms[tile].artwork);
  frsCon_imgMails[tile].Move(Px(kEdge), Px(kEdge), Px(kTileWidth - 2 * kEdge), Px(kPictureHeight));
  steps::PlainText(frsCon_lblMails[tile], kPrograms[tile].caption, steps::kSmall, steps::kForest);
  frsCon_lblMails[tile].WordWrap = true;
  frsCon_lblMails[tile].Align = forms::Alignment::Centre;
  frsCon_lblMails[tile].Move(Px(kEdge), Px(kEdge + kPictureHeight), Px(kTileWidth - 2 * kEdge),
                             Px(kTileHeight - kPictureHeight - 2 * kEdge));
}

void MailPanel::PlaceTiles(TextView tokens) {
  int left = kFirstTileLeft;
  while (!tokens.empty()) {
    const std::size_t end = std::min(tokens.find(u'|'), tokens.size());
    const auto program = std::find_if(kPrograms.begin(), kPrograms.end(), [&](const MailProgram& known) {
      return tokens.substr(0, end) == known.token;
    });
    tokens.remove_prefix(std::min(end + 1, tokens.size()));
    if (program == kPrograms.end()) continue;
    forms::PictureBox& tile = frsCon_lblMailsBG[static_cast<std::size_t>(program - kPrograms.begin())];
    forms::Geometry place = tile.Position;
    place.left = left;
    tile.Position = place;
    tile.Visible = true;
    left -= kTilePitch;
  }
}

} // namespace quendra::provisioning
