#include "forms/view/ActiveForm.h"

#include <gtest/gtest.h>

#include <functional>

namespace quendra::forms {
namespace {

using Trace = std::vector<Text>;

struct HearingForm : Form {
  HearingForm(Text name, Trace& heard_) : Form(std::move(name)), heard(heard_) {}
  void Design() override {}
  void Form_Activate() override { heard.push_back(Name() + u" activate"); }
  void Form_Deactivate() override {
    heard.push_back(Name() + u" deactivate");
    if (onDeactivate) onDeactivate();
  }
  std::function<void()> onDeactivate;
  Trace& heard;
};

struct ActiveFormTest : testing::Test {
  Trace heard;
  HearingForm one{u"one", heard};
  HearingForm two{u"two", heard};
  ActiveForm active;
};

TEST_F(ActiveFormTest, The_old_form_hears_of_it_before_the_new_one) {
  active.Activate(one);

  active.Activate(two);
  active.Deactivate(one); // which the toolkit tells last

  EXPECT_EQ(heard, (Trace{u"one activate", u"one deactivate", u"two activate"}));
  EXPECT_TRUE(active.Is(two));
}

TEST_F(ActiveFormTest, A_form_that_is_active_hears_nothing_of_being_so_again) {
  active.Activate(one);
  active.Activate(one);

  EXPECT_EQ(heard, Trace{u"one activate"});
}

TEST_F(ActiveFormTest, Another_programs_window_leaves_none_active) {
  active.Activate(one);

  active.Deactivate(one);
  active.Activate(one);

  EXPECT_EQ(heard, (Trace{u"one activate", u"one deactivate", u"one activate"}));
}

TEST_F(ActiveFormTest, A_form_that_went_hears_nothing) {
  active.Activate(one);

  active.Forget(one);
  active.Activate(two);

  EXPECT_EQ(heard, (Trace{u"one activate", u"two activate"}));
}

TEST_F(ActiveFormTest, A_form_that_goes_while_the_old_one_hears_of_it_is_not_activated) {
  active.Activate(one);
  one.onDeactivate = [this] { active.Forget(two); };

  active.Activate(two);

  EXPECT_EQ(heard, (Trace{u"one activate", u"one deactivate"}));
}

} // namespace
} // namespace quendra::forms
