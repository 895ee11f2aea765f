#include "forms/qt/QtFixture.h"

#include <QAbstractItemView>
#include <QAccessible>

namespace quendra::forms::qt {

class Accessibility : public QtFixture {
 protected:
  static QAccessibleInterface& InterfaceOf(const Control& control) {
    return *QAccessible::queryAccessibleInterface(&WidgetOf(control));
  }
  static QString NameOf(const Control& control) { return InterfaceOf(control).text(QAccessible::Name); }
  static QString DescriptionOf(const Control& control) {
    return InterfaceOf(control).text(QAccessible::Description);
  }
};

TEST_F(Accessibility, The_name_is_the_caption_and_the_description_is_the_controls_name) {
  Label label(form, u"main_Label2");
  Frame frame(form, u"main_frameAdapters");
  form.design = [&] {
    form.Caption = Text(u"חלון");
    label.Caption = Text(u"העלאה:");
    frame.Caption = Text(u" עקוב אחרי התקן ");
  };

  desktop.Load(form);

  EXPECT_EQ(NameOf(label), QStringLiteral("העלאה:"));
  EXPECT_EQ(DescriptionOf(label), QStringLiteral("main_Label2"));
  EXPECT_EQ(NameOf(frame), QStringLiteral("עקוב אחרי התקן"));
  EXPECT_EQ(DescriptionOf(frame), QStringLiteral("main_frameAdapters"));
  EXPECT_EQ(NameOf(form), QStringLiteral("חלון"));
  EXPECT_EQ(DescriptionOf(form), QStringLiteral("frmTest"));
}

TEST_F(Accessibility, Every_kind_of_control_is_described_by_its_name) {
  PictureBox box(form, u"picOut");
  Image image(form, u"imgAbout");
  Line line(form, u"Line1");
  ComboBox combo(form, u"main_cmbAdapters");
  ListView list(form, u"main_ListView1");

  desktop.Load(form);

  for (const Control* control : std::initializer_list<const Control*>{&box, &image, &line, &combo, &list})
    EXPECT_EQ(DescriptionOf(*control).toStdU16String(), control->Name());
}

TEST_F(Accessibility, A_label_without_a_caption_is_named_by_its_description) {
  Label label(form, u"lblCaption0");
  form.design = [&] { label.Description = u"מוניטור"; };

  desktop.Show(form);

  EXPECT_EQ(NameOf(label), QStringLiteral("מוניטור"));
}

TEST_F(Accessibility, A_combo_box_in_a_frame_is_named_by_the_frames_caption) {
  Frame frame(form, u"main_frameAdapters");
  ComboBox combo(frame, u"main_cmbAdapters");
  form.design = [&] { frame.Caption = Text(u" עקוב אחרי התקן "); };

  desktop.Load(form);

  EXPECT_EQ(NameOf(combo), QStringLiteral("עקוב אחרי התקן"));
}

TEST_F(Accessibility, A_clickable_label_is_a_button_and_any_other_a_text) {
  Label button(form, u"Label2");
  Label text(form, u"lblVersion");
  button.Click = [] {};

  desktop.Load(form);

  EXPECT_EQ(InterfaceOf(button).role(), QAccessible::Button);
  EXPECT_EQ(InterfaceOf(text).role(), QAccessible::StaticText);
}

TEST_F(Accessibility, A_label_with_a_double_click_alone_is_no_button) {
  Label label(form, u"label");
  label.DoubleClick = [] {};

  desktop.Load(form);

  EXPECT_EQ(InterfaceOf(label).role(), QAccessible::StaticText);
}

TEST_F(Accessibility, Assistive_technology_presses_a_label) {
  Label button(form, u"Label2");
  int clicks = 0;
  button.Click = [&] { ++clicks; };
  desktop.Show(form);
  QAccessibleActionInterface* actions = InterfaceOf(button).actionInterface();
  ASSERT_TRUE(actions);
  ASSERT_TRUE(actions->actionNames().contains(QAccessibleActionInterface::pressAction()));

  actions->doAction(QAccessibleActionInterface::pressAction());

  EXPECT_EQ(clicks, 1);
}

TEST_F(Accessibility, A_disabled_label_offers_no_press) {
  Label button(form, u"Label2");
  button.Click = [] {};
  form.design = [&] { button.Enabled = false; };

  desktop.Show(form);

  EXPECT_FALSE(InterfaceOf(button).actionInterface()->actionNames().contains(
      QAccessibleActionInterface::pressAction()));
}

TEST_F(Accessibility, A_label_behind_a_modal_form_takes_no_press) {
  Label button(form, u"Label2");
  TestForm dialog;
  Label ok(dialog, u"ok");
  std::string pressed;
  button.Click = [&] { pressed += "covered "; };
  ok.Click = [&] { pressed += "ok "; };
  desktop.Show(form);
  desktop.Post([&] {
    for (const Label* label : {&button, &ok})
      InterfaceOf(*label).actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    desktop.Unload(dialog);
  });

  desktop.Show(dialog, Modality::Modal, &form);

  EXPECT_EQ(pressed, "ok ");
}

TEST_F(Accessibility, A_table_gives_its_rows_and_headers) {
  ListView list(form, u"main_ListView1");
  list.AddColumn({u"שם תהליך", 3000});
  list.AddColumn({u"", 1296, Alignment::Centre, 1, u"קצב העלאה"});
  ListRow& row = list.Add(u"p1", u"firefox", 0);
  row.AddCell(u"012.50", {});

  desktop.Show(form);

  QAccessibleTableInterface* table = InterfaceOf(list).tableInterface();
  ASSERT_TRUE(table);
  EXPECT_EQ(table->rowCount(), 1);
  EXPECT_EQ(table->columnCount(), 2);
  EXPECT_EQ(table->cellAt(0, 1)->text(QAccessible::Name), QStringLiteral("012.50"));
  EXPECT_EQ(table->columnDescription(0), QStringLiteral("שם תהליך"));
  EXPECT_EQ(
      As<QAbstractItemView>(list).model()->headerData(1, Qt::Horizontal, Qt::AccessibleTextRole).toString(),
      QStringLiteral("קצב העלאה"));
}

} // namespace quendra::forms::qt
