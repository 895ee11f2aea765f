#include "forms/suite/DesktopSuite.h"

namespace quendra::forms {

// Modal forms and message boxes: who waits for whom.

TEST_P(DesktopSuite, A_modal_form_holds_its_caller_until_it_is_unloaded) {
  std::string events;

  user->Run([&] {
    desktop.Show(form);
    loop.Post([&] {
      events += "u";
      desktop.Unload(other);
    });
    desktop.Show(other, Modality::Modal, &form);
    events += "r";
    desktop.Unload(form);
  });

  EXPECT_EQ(events, "ur");
}

TEST_P(DesktopSuite, A_modal_form_returns_when_it_is_hidden) {
  bool returned = false;

  user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { other.Visible = false; });
    desktop.Show(other, Modality::Modal, &form);
    returned = other.IsLoaded();
    desktop.End();
  });

  EXPECT_TRUE(returned);
}

TEST_P(DesktopSuite, A_modal_form_returns_when_its_close_box_is_pressed) {
  bool returned = false;

  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { user->PressCloseBox(other); });
    desktop.Show(other, Modality::Modal, &form);
    returned = !other.IsLoaded();
    desktop.Unload(form);
  });

  EXPECT_TRUE(returned);
  EXPECT_EQ(status, 0);
}

TEST_P(DesktopSuite, A_modal_form_that_its_load_hides_again_holds_nobody) {
  bool returned = false;
  other.onLoad = [&] { loop.Post([&] { other.Visible = false; }); };

  user->Run([&] {
    desktop.Show(other, Modality::Modal);
    returned = true;
    desktop.End();
  });

  EXPECT_TRUE(returned);
}

TEST_P(DesktopSuite, The_end_behind_a_modal_form_unwinds_its_caller) {
  bool wentOn = false;

  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { desktop.End(5); });
    desktop.Show(other, Modality::Modal, &form);
    wentOn = true;
  });

  EXPECT_EQ(status, 5);
  EXPECT_FALSE(wentOn);
}

TEST_P(DesktopSuite, The_end_behind_a_message_box_unwinds_its_caller) {
  bool wentOn = false;

  const int status = user->Run([&] {
    loop.Post([&] { desktop.End(6); });
    desktop.MessageBox(u"text", kInformation, u"title");
    wentOn = true;
  });

  EXPECT_EQ(status, 6);
  EXPECT_FALSE(wentOn);
}

TEST_P(DesktopSuite, A_modal_form_stands_on_when_its_owner_goes) {
  bool stood = false;
  std::unique_ptr<platform::EventLoop::Subscription> later;

  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] {
      desktop.Unload(form);
      later = loop.StartTimer(50, [&] {
        stood = user->Stands(other);
        later.reset();
        desktop.Unload(other);
      });
    });
    desktop.Show(other, Modality::Modal, &form);
  });

  EXPECT_TRUE(stood);
  EXPECT_EQ(status, 0);
}

TEST_P(DesktopSuite, A_form_that_was_modal_over_another_can_be_shown_when_that_one_has_gone) {
  ShowActive(form);
  loop.Post([&] { other.Visible = false; });
  desktop.Show(other, Modality::Modal, &form);
  desktop.Unload(form);
  Pass(20);

  desktop.Show(other);

  EXPECT_TRUE(user->Stands(other));
}

TEST_P(DesktopSuite, A_box_stands_on_when_the_form_below_goes) {
  SeenBox box;
  int answer = 0;
  std::unique_ptr<platform::EventLoop::Subscription> later;

  user->Run([&] {
    desktop.Load(other);
    desktop.Show(form);
    loop.Post([&] {
      desktop.Unload(form);
      later = loop.StartTimer(50, [&] {
        later.reset();
        user->AnswerBox(box, 7);
      });
    });
    answer = desktop.MessageBox(u"text", kYesNo, u"title");
    desktop.Unload(other);
  });

  EXPECT_EQ(box.count, 1);
  EXPECT_EQ(answer, 7);
}

TEST_P(DesktopSuite, The_loop_tells_how_many_boxes_and_modal_forms_stand) {
  std::vector<int> depths;
  SeenBox box;
  loop.Post([&] {
    depths.push_back(loop.ModalDepth());
    loop.Post([&] {
      depths.push_back(loop.ModalDepth());
      user->AnswerBox(box);
    });
    desktop.MessageBox(u"text", 0, u"title");
    depths.push_back(loop.ModalDepth());
    form.Visible = false;
  });

  desktop.Show(form, Modality::Modal);
  depths.push_back(loop.ModalDepth());

  EXPECT_EQ(depths, (std::vector<int>{1, 2, 1, 0}));
}

TEST_P(DesktopSuite, Pumping_is_no_modal_loop) {
  int depth = -1;
  loop.Post([&] { depth = loop.ModalDepth(); });

  desktop.DoEvents();

  EXPECT_EQ(depth, 0);
}

// What a box shows.

TEST_P(DesktopSuite, A_Hebrew_message_box_reads_from_right_to_left_with_a_Hebrew_button) {
  SeenBox box;
  user->AnswerBox(box);

  const int answer =
      desktop.MessageBox(u"נתוני IP:\r\n1: 10.0.0.5", kInformation | kHebrewBox, u"זלמר בינלאומי@נט");

  EXPECT_EQ(answer, 1);
  EXPECT_EQ(box.content.title, u"זלמר בינלאומי@נט");
  EXPECT_EQ(box.content.text, u"\u200Fנתוני IP:\n\u200F1: 10.0.0.5");
  EXPECT_EQ(box.content.buttons, (std::vector<BoxButton>{{1, u"אישור"}}));
  EXPECT_TRUE(box.content.rightToLeft);
  EXPECT_EQ(box.content.sign, BoxSign::Information);
}

TEST_P(DesktopSuite, Other_message_boxes_read_from_left_to_right) {
  SeenBox box;
  user->AnswerBox(box);

  desktop.MessageBox(u"An error occured", kExclamation, u"  Error Getting OS Information");

  EXPECT_EQ(box.content.text, u"An error occured");
  EXPECT_EQ(box.content.buttons, (std::vector<BoxButton>{{1, u"OK"}}));
  EXPECT_FALSE(box.content.rightToLeft);
  EXPECT_EQ(box.content.sign, BoxSign::Exclamation);
}

TEST_P(DesktopSuite, A_box_gives_the_number_of_the_pressed_button) {
  SeenBox box;
  user->AnswerBox(box, 7);
  EXPECT_EQ(desktop.MessageBox(u"text", kYesNo | kHebrewBox, u"title"), 7);
  EXPECT_EQ(box.content.buttons, (std::vector<BoxButton>{{6, u"כן"}, {7, u"לא"}}));

  user->AnswerBox(box, 6);

  EXPECT_EQ(desktop.MessageBox(u"text", kYesNo, u"title"), 6);
}

TEST_P(DesktopSuite, Work_and_timers_go_on_while_a_box_stands) {
  SeenBox box;
  int ticks = 0;
  bool ran = false;
  const auto timer = loop.StartTimer(1, [&] {
    if (++ticks == 3) user->AnswerBox(box);
  });
  loop.Post([&] { ran = true; });

  desktop.MessageBox(u"text", 0, u"title");

  EXPECT_TRUE(ran);
  EXPECT_GE(ticks, 3);
}

} // namespace quendra::forms
