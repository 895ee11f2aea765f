#include "forms/qt/QtFixture.h"

#include "runtime/Fault.h"

#include <QMessageBox>

namespace quendra::forms::qt {

class ProgramEnd : public QtFixture {
 protected:
  ProgramEnd() {
    form.design = [this] { label.Move(0, 0, 1500, 450); };
  }

  Label label{form, u"label"};
};

TEST_F(ProgramEnd, The_last_form_that_goes_ends_the_program_with_status_0) {
  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { desktop.Unload(form); });
  });

  EXPECT_EQ(status, 0);
  EXPECT_FALSE(form.IsLoaded());
}

TEST_F(ProgramEnd, A_handler_that_swaps_the_last_form_for_another_goes_on) {
  TestForm next;
  bool reached = false;

  desktop.Run([&] {
    desktop.Show(form);
    desktop.Unload(form);
    desktop.Show(next);
    desktop.Post([&] {
      desktop.Post([&] {
        reached = true;
        desktop.Unload(next);
      });
    });
  });

  EXPECT_TRUE(reached);
}

TEST_F(ProgramEnd, End_unwinds_the_handler_and_gives_its_status_without_unloading) {
  bool wentOn = false;
  bool unloaded = false;
  form.unload = [&] { unloaded = true; };

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.End(3);
    wentOn = true;
  });

  EXPECT_EQ(status, 3);
  EXPECT_FALSE(wentOn);
  EXPECT_FALSE(unloaded);
  EXPECT_EQ(form.View(), nullptr);
}

TEST_F(ProgramEnd, End_in_a_handler_inside_DoEvents_unwinds_the_handler_outside_too) {
  bool outerWentOn = false;

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { desktop.End(4); });
    desktop.DoEvents();
    outerWentOn = true;
  });

  EXPECT_EQ(status, 4);
  EXPECT_FALSE(outerWentOn);
}

TEST_F(ProgramEnd, No_handler_runs_after_the_end) {
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { ++clicks; });
    desktop.End();
  });
  QCoreApplication::processEvents();

  EXPECT_EQ(clicks, 0);
}

TEST_F(ProgramEnd, A_fault_that_nobody_traps_shows_the_run_times_message_and_ends_with_status_1) {
  label.Click = [] { throw Fault(Fault::kOverflow); };
  Box box;
  AnswerBox(box);

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { Click(WidgetOf(label)); });
  });

  EXPECT_EQ(status, 1);
  EXPECT_EQ(box.title, QStringLiteral("Quendra"));
  EXPECT_EQ(box.text, QStringLiteral("Run-time error '6':\n\nOverflow"));
  EXPECT_EQ(box.icon, QMessageBox::Critical);
  EXPECT_EQ(box.direction, Qt::LeftToRight);
}

TEST_F(ProgramEnd, A_fault_inside_DoEvents_ends_the_handler_outside_too) {
  bool outerWentOn = false;
  Box box;
  AnswerBox(box);

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([] { throw Fault(Fault::kDivision); });
    desktop.DoEvents();
    outerWentOn = true;
  });

  EXPECT_EQ(status, 1);
  EXPECT_FALSE(outerWentOn);
  EXPECT_EQ(box.text, QStringLiteral("Run-time error '11':\n\nDivision by zero"));
}

TEST_F(ProgramEnd, No_handler_runs_behind_the_message_of_a_fault) {
  int ticks = 0;
  const auto timer = desktop.StartTimer(1, [&] {
    if (++ticks == 1) throw Fault(Fault::kTypeMismatch);
  });
  Box box;
  AnswerBox(box);

  desktop.Run([&] { desktop.Show(form); });

  EXPECT_EQ(ticks, 1);
  EXPECT_EQ(box.count, 1);
}

TEST_F(ProgramEnd, A_fault_in_the_load_of_the_first_form_ends_with_status_1) {
  form.load = [] { throw Fault(Fault::kObjectNotSet); };
  Box box;
  AnswerBox(box);

  EXPECT_EQ(desktop.Run([&] { desktop.Show(form); }), 1);
  EXPECT_EQ(box.text,
            QStringLiteral("Run-time error '91':\n\nObject variable or With block variable not set"));
}

TEST_F(ProgramEnd, Running_out_of_memory_is_fault_7) {
  Box box;
  AnswerBox(box);

  EXPECT_EQ(desktop.Run([&] { throw std::bad_alloc(); }), 1);
  EXPECT_EQ(box.text, QStringLiteral("Run-time error '7':\n\nOut of memory"));
}

TEST_F(ProgramEnd, The_close_box_unloads_the_form) {
  int unloads = 0;
  form.unload = [&] { ++unloads; };

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { WidgetOf(form).close(); });
  });

  EXPECT_EQ(status, 0);
  EXPECT_EQ(unloads, 1);
  EXPECT_FALSE(form.IsLoaded());
}

TEST_F(ProgramEnd, An_unload_handler_that_ends_the_program_leaves_other_forms_alone) {
  TestForm other;
  bool otherUnloaded = false;
  other.unload = [&] { otherUnloaded = true; };
  form.unload = [&] { desktop.End(); };

  desktop.Run([&] {
    desktop.Show(other);
    desktop.Show(form);
    desktop.Post([&] { WidgetOf(form).close(); });
  });

  EXPECT_FALSE(otherUnloaded);
}

TEST_F(ProgramEnd, A_modal_form_holds_its_caller_until_it_is_unloaded) {
  TestForm dialog;
  std::string events;

  desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] {
      events += "u";
      desktop.Unload(dialog);
    });
    desktop.Show(dialog, Modality::Modal, &form);
    events += "r";
    desktop.Unload(form);
  });

  EXPECT_EQ(events, "ur");
}

TEST_F(ProgramEnd, A_modal_form_returns_when_it_is_hidden) {
  TestForm dialog;
  bool returned = false;

  desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { dialog.Visible = false; });
    desktop.Show(dialog, Modality::Modal, &form);
    returned = dialog.IsLoaded();
    desktop.End();
  });

  EXPECT_TRUE(returned);
}

TEST_F(ProgramEnd, The_end_behind_a_modal_form_unwinds_its_caller) {
  TestForm dialog;
  bool wentOn = false;

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.Post([&] { desktop.End(5); });
    desktop.Show(dialog, Modality::Modal, &form);
    wentOn = true;
  });

  EXPECT_EQ(status, 5);
  EXPECT_FALSE(wentOn);
}

TEST_F(ProgramEnd, A_Hebrew_message_box_reads_from_right_to_left_with_a_Hebrew_button) {
  Box box;
  int answer = 0;
  AnswerBox(box);

  desktop.Run([&] {
    desktop.Show(form);
    answer = desktop.MessageBox(u"נתוני IP:\r\n1: 10.0.0.5", kInformation | kHebrewBox, u"זלמר בינלאומי@נט");
    desktop.Unload(form);
  });

  EXPECT_EQ(answer, 1);
  EXPECT_EQ(box.title, QStringLiteral("זלמר בינלאומי@נט"));
  EXPECT_EQ(box.text, QStringLiteral("נתוני IP:\n1: 10.0.0.5"));
  EXPECT_EQ(box.button, QStringLiteral("אישור"));
  EXPECT_EQ(box.direction, Qt::RightToLeft);
  EXPECT_EQ(box.icon, QMessageBox::Information);
}

TEST_F(ProgramEnd, Other_message_boxes_read_from_left_to_right) {
  Box box;
  AnswerBox(box);

  desktop.Run([&] {
    desktop.MessageBox(u"An error occured", kExclamation, u"  Error Getting OS Information");
    desktop.End();
  });

  EXPECT_EQ(box.button, QStringLiteral("OK"));
  EXPECT_EQ(box.direction, Qt::LeftToRight);
  EXPECT_EQ(box.icon, QMessageBox::Warning);
}

TEST_F(ProgramEnd, The_end_behind_a_message_box_unwinds_its_caller) {
  bool wentOn = false;

  const int status = desktop.Run([&] {
    desktop.Post([&] { desktop.End(6); });
    desktop.MessageBox(u"text", kInformation, u"title");
    wentOn = true;
  });

  EXPECT_EQ(status, 6);
  EXPECT_FALSE(wentOn);
}

} // namespace quendra::forms::qt
