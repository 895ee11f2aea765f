#include "forms/suite/DesktopSuite.h"

#include "runtime/Fault.h"

namespace quendra::forms {

// The life of forms and the order of their events.

TEST_P(DesktopSuite, Loading_designs_the_form_then_runs_its_load_and_shows_nothing) {
  desktop.Load(form);

  EXPECT_EQ(trace, (Trace{"frmOne design", "frmOne load"}));
  EXPECT_TRUE(form.IsLoaded());
  EXPECT_FALSE(form.Visible());
  EXPECT_FALSE(user->Stands(form));
}

TEST_P(DesktopSuite, Loading_a_loaded_form_does_nothing) {
  desktop.Load(form);
  trace.clear();

  desktop.Load(form);

  EXPECT_TRUE(trace.empty());
}

TEST_P(DesktopSuite, Showing_loads_where_needed_and_activates) {
  ShowActive(form);
  desktop.Show(form);
  loop.PumpOnce();

  EXPECT_EQ(trace, (Trace{"frmOne design", "frmOne load", "frmOne activate"}));
  EXPECT_TRUE(form.Visible());
  EXPECT_TRUE(user->Stands(form));
}

TEST_P(DesktopSuite, Showing_a_second_form_deactivates_the_first) {
  ShowActive(form);
  trace.clear();

  ShowActive(other);

  EXPECT_EQ(trace, (Trace{"frmTwo design", "frmTwo load", "frmOne deactivate", "frmTwo activate"}));
}

TEST_P(DesktopSuite, Unloading_runs_the_unload_and_hides_the_form) {
  ShowActive(form);
  ShowActive(other);
  trace.clear();

  desktop.Unload(form);

  EXPECT_EQ(trace, Trace{"frmOne unload"});
  EXPECT_FALSE(form.IsLoaded());
  EXPECT_FALSE(form.Visible());
}

TEST_P(DesktopSuite, Unloading_a_form_that_is_not_loaded_does_nothing) {
  desktop.Load(other);
  trace.clear();

  desktop.Unload(form);

  EXPECT_TRUE(trace.empty());
}

TEST_P(DesktopSuite, A_form_that_unloads_itself_while_it_unloads_goes_once) {
  desktop.Load(other);
  desktop.Load(form);
  trace.clear();
  form.onUnload = [&] { desktop.Unload(form); };

  desktop.Unload(form);

  EXPECT_EQ(trace, Trace{"frmOne unload"});
  EXPECT_FALSE(form.IsLoaded());
}

TEST_P(DesktopSuite, A_fault_while_unloading_leaves_the_form_loaded) {
  desktop.Load(other);
  desktop.Load(form);
  form.onUnload = [] { throw Fault(Fault::kOverflow); };

  EXPECT_THROW(desktop.Unload(form), Fault);
  EXPECT_TRUE(form.IsLoaded());
  form.onUnload = nullptr;
  desktop.Unload(form);

  EXPECT_FALSE(form.IsLoaded());
}

TEST_P(DesktopSuite, A_form_that_is_loaded_again_is_designed_anew) {
  desktop.Load(other);
  desktop.Load(form);
  form.label.Caption = u"changed";
  desktop.Unload(form);

  desktop.Load(form);

  EXPECT_EQ(form.label.Caption(), u"as designed");
}

TEST_P(DesktopSuite, A_form_that_is_loaded_again_starts_with_an_empty_Tag) {
  desktop.Load(other);
  desktop.Load(form);
  form.Tag = u"not close";
  desktop.Unload(form);
  EXPECT_EQ(form.Tag(), u"not close");

  desktop.Load(form);

  EXPECT_EQ(form.Tag(), u"");
}

TEST_P(DesktopSuite, A_Tag_that_the_design_sets_stays) {
  form.tagByDesign = u"designed";

  desktop.Load(form);

  EXPECT_EQ(form.Tag(), u"designed");
}

TEST_P(DesktopSuite, A_fault_in_the_load_leaves_the_form_loaded_and_not_shown) {
  form.onLoad = [] { throw Fault(Fault::kTypeMismatch); };

  EXPECT_THROW(desktop.Show(form), Fault);

  EXPECT_TRUE(form.IsLoaded());
  EXPECT_FALSE(form.Visible());
  EXPECT_FALSE(user->Stands(form));
}

TEST_P(DesktopSuite, A_form_can_be_shown_again_after_it_was_unloaded) {
  desktop.Load(other);
  ShowActive(form);
  desktop.Unload(form);
  form.active = false;

  ShowActive(form);

  EXPECT_TRUE(user->Stands(form));
  EXPECT_NE(form.View(), nullptr);
}

TEST_P(DesktopSuite, A_form_can_go_without_having_been_unloaded) {
  desktop.Load(other);
  {
    TracedForm shortLived(u"frmShort", trace);
    ShowActive(shortLived);
  }
  loop.PumpOnce();

  EXPECT_EQ(trace.back(), "frmShort activate");
}

TEST_P(DesktopSuite, Handles_differ_and_end_with_their_window) {
  desktop.Load(form);
  desktop.Load(other);
  const WindowHandle handle = desktop.HandleOf(form);
  EXPECT_NE(handle, kNoWindow);
  EXPECT_EQ(desktop.HandleOf(form), handle);
  EXPECT_NE(handle, desktop.HandleOf(other));

  desktop.Unload(form);

  EXPECT_EQ(desktop.HandleOf(form), kNoWindow);
  EXPECT_EQ(desktop.SendMessage(handle, 0xA1, 2, 0), 0);
  desktop.SetWindowRgn(handle, {}, true);
}

TEST_P(DesktopSuite, Clicks_reach_a_control_that_is_there_and_no_other) {
  int clicks = 0;
  form.label.Click = [&] { ++clicks; };
  ShowActive(form);

  user->Click(form.label);
  EXPECT_EQ(clicks, 1);
  form.label.Enabled = false;
  user->Click(form.label);

  EXPECT_EQ(clicks, 1);
}

} // namespace quendra::forms
