#include "forms/Desktop.h"

#include "forms/headless/HeadlessDesktop.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct TracedForm : Form {
  TracedForm(Text name, std::vector<std::string>& trace_) : Form(std::move(name)), trace(trace_) {}
  void Design() override {
    Say("design");
    label.Caption = u"as designed";
    if (!tagByDesign.empty()) Tag = tagByDesign;
  }
  void Form_Load() override {
    Say("load");
    if (onLoad) onLoad();
  }
  void Form_Unload() override {
    Say("unload");
    if (onUnload) onUnload();
  }
  void Form_Activate() override { Say("activate"); }
  void Form_Deactivate() override { Say("deactivate"); }

  Label label{*this, u"Label1"};
  Text tagByDesign;
  std::function<void()> onLoad;
  std::function<void()> onUnload;

 private:
  void Say(const std::string& what) { trace.push_back(ToUtf8(Name()) + " " + what); }
  std::vector<std::string>& trace;
};

using Trace = std::vector<std::string>;

struct DesktopTest : testing::Test {
  Trace trace;
  headless::HeadlessDesktop desktop;
  TracedForm form{u"frmOne", trace};
  TracedForm other{u"frmTwo", trace};
};

TEST_F(DesktopTest, Loading_designs_the_form_then_runs_its_load_and_shows_nothing) {
  desktop.Load(form);

  EXPECT_EQ(trace, (Trace{"frmOne design", "frmOne load"}));
  EXPECT_TRUE(form.IsLoaded());
  EXPECT_FALSE(form.Visible());
}

TEST_F(DesktopTest, Loading_a_loaded_form_does_nothing) {
  desktop.Load(form);
  trace.clear();

  desktop.Load(form);

  EXPECT_TRUE(trace.empty());
}

TEST_F(DesktopTest, Showing_loads_where_needed_and_activates) {
  desktop.Show(form);
  desktop.Show(form);

  EXPECT_EQ(trace, (Trace{"frmOne design", "frmOne load", "frmOne activate"}));
  EXPECT_TRUE(form.Visible());
}

TEST_F(DesktopTest, Showing_a_second_form_deactivates_the_first) {
  desktop.Show(form);
  trace.clear();

  desktop.Show(other);

  EXPECT_EQ(trace, (Trace{"frmTwo design", "frmTwo load", "frmOne deactivate", "frmTwo activate"}));
}

TEST_F(DesktopTest, Unloading_runs_the_unload_and_hides_the_form) {
  desktop.Show(form);
  desktop.Show(other);
  trace.clear();

  desktop.Unload(form);

  EXPECT_EQ(trace, Trace{"frmOne unload"});
  EXPECT_FALSE(form.IsLoaded());
  EXPECT_FALSE(form.Visible());
}

TEST_F(DesktopTest, Unloading_a_form_that_is_not_loaded_does_nothing) {
  desktop.Unload(form);

  EXPECT_TRUE(trace.empty());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(DesktopTest, A_form_that_unloads_itself_while_it_unloads_goes_once) {
  desktop.Load(other);
  desktop.Load(form);
  trace.clear();
  form.onUnload = [&] { desktop.Unload(form); };

  desktop.Unload(form);

  EXPECT_EQ(trace, Trace{"frmOne unload"});
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(DesktopTest, A_fault_while_unloading_leaves_the_form_loaded) {
  desktop.Load(form);
  form.onUnload = [] { throw Fault(Fault::kOverflow); };

  EXPECT_THROW(desktop.Unload(form), Fault);
  EXPECT_TRUE(form.IsLoaded());
  form.onUnload = nullptr;
  EXPECT_THROW(desktop.Unload(form), ProgramEnded);
}

TEST_F(DesktopTest, A_form_that_is_loaded_again_is_designed_anew) {
  desktop.Load(other);
  desktop.Load(form);
  form.label.Caption = u"changed";
  desktop.Unload(form);

  desktop.Load(form);

  EXPECT_EQ(form.label.Caption(), u"as designed");
}

TEST_F(DesktopTest, A_form_that_is_loaded_again_starts_with_an_empty_Tag) {
  desktop.Load(other);
  desktop.Load(form);
  form.Tag = u"not close";
  desktop.Unload(form);
  EXPECT_EQ(form.Tag(), u"not close");

  desktop.Load(form);

  EXPECT_EQ(form.Tag(), u"");
}

TEST_F(DesktopTest, A_Tag_that_the_design_sets_stays) {
  form.tagByDesign = u"designed";

  desktop.Load(form);

  EXPECT_EQ(form.Tag(), u"designed");
}

TEST_F(DesktopTest, A_fault_in_the_load_leaves_the_form_loaded_and_not_shown) {
  form.onLoad = [] { throw Fault(Fault::kTypeMismatch); };

  EXPECT_THROW(desktop.Show(form), Fault);

  EXPECT_TRUE(form.IsLoaded());
  EXPECT_FALSE(form.Visible());
}

TEST_F(DesktopTest, The_program_ends_with_status_0_when_the_last_form_has_gone) {
  desktop.Load(form);
  desktop.Load(other);

  desktop.Dispatch([&] { desktop.Unload(form); });
  EXPECT_FALSE(desktop.Ended);
  desktop.Dispatch([&] { desktop.Unload(other); });

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
}

TEST_F(DesktopTest, Ending_unwinds_the_handler_and_unloads_no_form) {
  desktop.Show(form);
  desktop.Show(other);
  trace.clear();
  bool reached = false;
  form.label.Click = [&] {
    desktop.End();
    reached = true;
  };

  desktop.Click(form.label);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_FALSE(reached);
  EXPECT_TRUE(trace.empty());
}

} // namespace
} // namespace quendra::forms
