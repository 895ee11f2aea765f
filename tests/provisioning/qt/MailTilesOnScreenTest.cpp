#include "forms/qt/QtFixture.h"
#include "provisioning/FirstConnectionPageFixture.h"

namespace quendra::provisioning {
namespace {

/// The step of the mail account as the mouse finds it.
class MailTilesOnScreen : public forms::qt::QtFixture {
 protected:
  MailTilesOnScreen() {
    page.DetectMailClients = [] { return Text(u"OE|MSO XP|"); };
    desktop.Show(window);
    page.Start();
    page.mail.frsCon_Frame2.Visible = true;
  }

  /// A small screen's rounding may cut off a row of pixels.
  QRect SeenOf(std::size_t tile) const {
    return WidgetOf(page.mail.frsCon_lblMailsBG[tile]).visibleRegion().boundingRect();
  }
  /// To a place of a tile, over whatever lies on top there.
  void MoveOver(std::size_t tile, QPoint place) {
    QWidget& whole = WidgetOf(window);
    const QPoint onWindow = WidgetOf(page.mail.frsCon_lblMailsBG[tile]).mapTo(&whole, place);
    QWidget* const found = whole.childAt(onWindow);
    ASSERT_NE(found, nullptr);
    MoveMouse(*found, found->mapFrom(&whole, onWindow));
  }

  platform::simulated::SimulatedMachine machine;
  WindowOfPage window{machine.keyboardLayout};
  FirstConnectionPage& page = window.page;
};

TEST_F(MailTilesOnScreen, The_mouse_over_the_edge_of_a_tile_hovers_it_without_a_hand) {
  const QRect tile = SeenOf(1);
  const QPoint middle = tile.center();
  for (const QPoint edge : {QPoint(tile.left(), middle.y()), QPoint(tile.right(), middle.y()),
                            QPoint(middle.x(), tile.top()), QPoint(middle.x(), tile.bottom())}) {
    page.HoverMailRow(-1);

    MoveOver(1, edge);

    EXPECT_EQ(page.HoverMail, 1) << edge.x() << "," << edge.y();
  }
  EXPECT_EQ(window.Hands, 0);
}

TEST_F(MailTilesOnScreen, The_mouse_within_a_tile_hovers_it_with_a_hand) {
  MoveOver(1, SeenOf(1).center());

  EXPECT_EQ(page.HoverMail, 1);
  EXPECT_EQ(window.Hands, 1);
}

} // namespace
} // namespace quendra::provisioning
