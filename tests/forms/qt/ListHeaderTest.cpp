#include "forms/qt/QtFixture.h"

#include <QHeaderView>
#include <QTreeView>

namespace quendra::forms::qt {

class Header : public QtFixture {
 protected:
  Header() {
    form.design = [this] { list.Move(0, 0, 6000, 3000); };
    for (const char16_t* caption : {u"first", u"second", u"third"})
      list.AddColumn({caption, 1500, {}, 0, {}});
    list.ColumnClick = [this](int header) { clicked.push_back(header); };
  }

  void ClickSection(int section) {
    QHeaderView& header = *dynamic_cast<QTreeView&>(WidgetOf(list)).header();
    const int middle = header.sectionPosition(section) + header.sectionSize(section) / 2;
    const int x = form.RightToLeft ? header.viewport()->width() - 1 - middle : middle;
    PressMouse(*header.viewport(), {x, header.height() / 2});
    ReleaseMouse(*header.viewport(), {x, header.height() / 2});
  }

  ListView list{form, u"list"};
  std::vector<int> clicked;
};

TEST_F(Header, A_click_on_each_header_tells_its_number_from_1) {
  desktop.Show(form);

  for (int section = 0; section < 3; ++section) ClickSection(section);

  EXPECT_EQ(clicked, (std::vector{1, 2, 3}));
}

TEST_F(Header, In_a_form_that_reads_from_left_to_right_it_does_so_too) {
  form.RightToLeft = false;
  desktop.Show(form);

  for (int section = 0; section < 3; ++section) ClickSection(section);

  EXPECT_EQ(clicked, (std::vector{1, 2, 3}));
}

} // namespace quendra::forms::qt
