#include "forms/suite/DesktopSuite.h"

#include "runtime/Fault.h"

#include <algorithm>

namespace quendra::forms {

// The end of the program, by itself and by a fault.

TEST_P(DesktopSuite, The_last_form_that_goes_ends_the_program_with_status_0) {
  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { desktop.Unload(form); });
  });

  EXPECT_EQ(status, 0);
  EXPECT_FALSE(form.IsLoaded());
}

TEST_P(DesktopSuite, The_program_ends_with_status_0_when_the_last_form_has_gone) {
  bool outlivedTheFirst = false;

  const int status = user->Run([&] {
    desktop.Load(form);
    desktop.Load(other);
    loop.Post([&] { desktop.Unload(form); });
    loop.Post([&] {
      loop.Post([&] {
        outlivedTheFirst = true;
        desktop.Unload(other);
      });
    });
  });

  EXPECT_EQ(status, 0);
  EXPECT_TRUE(outlivedTheFirst);
}

TEST_P(DesktopSuite, A_handler_that_swaps_the_last_form_for_another_goes_on) {
  bool reached = false;

  user->Run([&] {
    desktop.Show(form);
    desktop.Unload(form);
    desktop.Show(other);
    loop.Post([&] {
      loop.Post([&] {
        reached = true;
        desktop.Unload(other);
      });
    });
  });

  EXPECT_TRUE(reached);
}

TEST_P(DesktopSuite, End_unwinds_the_handler_and_gives_its_status_without_unloading) {
  bool wentOn = false;

  const int status = user->Run([&] {
    desktop.Show(form);
    trace.clear();
    desktop.End(3);
    wentOn = true;
  });

  EXPECT_EQ(status, 3);
  EXPECT_FALSE(wentOn);
  EXPECT_TRUE(trace.empty());
}

TEST_P(DesktopSuite, Ending_unwinds_the_handler_and_unloads_no_form) {
  bool reached = false;
  form.label.Click = [&] {
    trace.clear();
    desktop.End();
    reached = true;
  };

  user->Run([&] {
    desktop.Show(other);
    desktop.Show(form);
    loop.Post([&] { user->Click(form.label); });
  });

  EXPECT_FALSE(reached);
  EXPECT_TRUE(trace.empty());
}

TEST_P(DesktopSuite, End_in_a_handler_inside_DoEvents_unwinds_the_handler_outside_too) {
  bool outerWentOn = false;

  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { desktop.End(4); });
    desktop.DoEvents();
    outerWentOn = true;
  });

  EXPECT_EQ(status, 4);
  EXPECT_FALSE(outerWentOn);
}

TEST_P(DesktopSuite, The_first_status_of_several_ends_stands) {
  const int status = user->Run([&] {
    loop.Post([&] { desktop.End(5); });
    try {
      desktop.DoEvents();
    } catch (const ProgramEnded&) {
      desktop.End(6);
    }
  });

  EXPECT_EQ(status, 5);
}

TEST_P(DesktopSuite, No_handler_runs_after_the_end) {
  int ran = 0;
  form.label.Click = [&] { ++ran; };
  const auto timer = loop.StartTimer(1, [&] { ++ran; });
  user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { ++ran; });
    desktop.End();
  });

  int looks = 0;
  EXPECT_TRUE(user->WaitUntil([&] { return ++looks > 5; }));
  user->Click(form.label);

  EXPECT_EQ(ran, 0);
}

TEST_P(DesktopSuite, A_fault_that_nobody_traps_shows_the_run_times_message_and_ends_with_status_1) {
  form.label.Click = [] { throw Fault(Fault::kOverflow); };
  SeenBox box;
  user->AnswerBox(box);

  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { user->Click(form.label); });
  });

  EXPECT_EQ(status, 1);
  EXPECT_EQ(box.count, 1);
  EXPECT_EQ(box.content.title, u"Quendra");
  EXPECT_EQ(box.content.text, u"Run-time error '6':\n\nOverflow");
  EXPECT_EQ(box.content.sign, BoxSign::Critical);
  EXPECT_FALSE(box.content.rightToLeft);
}

TEST_P(DesktopSuite, A_fault_inside_DoEvents_ends_the_handler_outside_too) {
  bool outerWentOn = false;
  SeenBox box;
  user->AnswerBox(box);

  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([] { throw Fault(Fault::kDivision); });
    desktop.DoEvents();
    outerWentOn = true;
  });

  EXPECT_EQ(status, 1);
  EXPECT_FALSE(outerWentOn);
  EXPECT_EQ(box.count, 1);
  EXPECT_EQ(box.content.text, u"Run-time error '11':\n\nDivision by zero");
}

TEST_P(DesktopSuite, No_handler_runs_behind_the_message_of_a_fault) {
  int ticks = 0;
  const auto timer = loop.StartTimer(1, [&] {
    if (++ticks == 1) throw Fault(Fault::kTypeMismatch);
  });
  SeenBox box;
  user->AnswerBox(box);

  user->Run([&] { desktop.Show(form); });

  EXPECT_EQ(ticks, 1);
  EXPECT_EQ(box.count, 1);
}

TEST_P(DesktopSuite, A_fault_in_the_load_of_the_first_form_ends_with_status_1) {
  form.onLoad = [] { throw Fault(Fault::kObjectNotSet); };
  SeenBox box;
  user->AnswerBox(box);

  EXPECT_EQ(user->Run([&] { desktop.Show(form); }), 1);
  EXPECT_EQ(box.content.text, u"Run-time error '91':\n\nObject variable or With block variable not set");
}

TEST_P(DesktopSuite, Running_out_of_memory_is_fault_7) {
  SeenBox box;
  user->AnswerBox(box);

  EXPECT_EQ(user->Run([&] { throw std::bad_alloc(); }), 1);
  EXPECT_EQ(box.content.text, u"Run-time error '7':\n\nOut of memory");
}

TEST_P(DesktopSuite, The_close_box_unloads_the_form) {
  const int status = user->Run([&] {
    desktop.Show(form);
    loop.Post([&] { user->PressCloseBox(form); });
  });

  EXPECT_EQ(status, 0);
  EXPECT_EQ(std::count(trace.begin(), trace.end(), "frmOne unload"), 1);
  EXPECT_FALSE(form.IsLoaded());
}

TEST_P(DesktopSuite, An_unload_handler_that_ends_the_program_leaves_other_forms_alone) {
  form.onUnload = [&] {
    trace.clear();
    desktop.End();
  };

  user->Run([&] {
    desktop.Show(other);
    desktop.Show(form);
    loop.Post([&] { user->PressCloseBox(form); });
  });

  EXPECT_TRUE(trace.empty());
}

} // namespace quendra::forms
