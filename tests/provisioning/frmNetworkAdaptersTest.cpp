#include "provisioning/frmNetworkAdapters.h"

#include "forms/headless/HeadlessDesktop.h"
#include "forms/view/Accessible.h"
#include "forms/view/FocusOrder.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {
namespace {

class NetworkAdapters : public testing::Test {
 protected:
  /// As the module that asks does: cards into the list, then the dialog until it is done.
  Text Ask(const std::vector<Text>& cards, std::function<void()> answer) {
    desktop.Load(dialog);
    for (const Text& card : cards) dialog.lstNICs.AddItem(card);
    desktop.OnModal = [&](forms::Form&) { answer(); };
    desktop.Show(dialog, forms::Modality::Modal, &owner);
    return dialog.Tag;
  }

  struct Owner : forms::Form {
    Owner() : Form(u"frmMenu") {}
    void Design() override {}
  };

  forms::headless::HeadlessDesktop desktop;
  Owner owner;
  frmNetworkAdapters dialog{desktop};
};

TEST_F(NetworkAdapters, The_dialog_has_its_texts) {
  desktop.Load(dialog);

  EXPECT_EQ(dialog.Caption(), u"בחירת כרטיס רשת להתקנה...");
  EXPECT_EQ(dialog.Command1.Caption(), u"בחר");
  EXPECT_EQ(dialog.cmdClose.Caption(), u"סגור");
  EXPECT_FALSE(forms::AccessibleOf(dialog.lstNICs).name.empty());
}

TEST_F(NetworkAdapters, The_choice_is_the_index_in_the_list_and_hides_the_dialog_without_unloading_it) {
  desktop.Show(owner);

  const Text choice = Ask({u"eth0", u"eth1"}, [&] {
    desktop.ChooseItem(dialog.lstNICs, 1);
    desktop.Click(dialog.Command1);
  });

  EXPECT_EQ(choice, u"1");
  EXPECT_FALSE(dialog.Visible());
  EXPECT_TRUE(dialog.IsLoaded());
}

TEST_F(NetworkAdapters, Without_a_selected_card_the_choice_is_minus_one) {
  desktop.Show(owner);

  EXPECT_EQ(Ask({u"eth0", u"eth1"}, [&] { desktop.Click(dialog.Command1); }), u"-1");
}

TEST_F(NetworkAdapters, Closing_the_dialog_leaves_no_choice_whichever_way_it_is_done) {
  desktop.Show(owner);
  const auto choose = [&] {
    desktop.ChooseItem(dialog.lstNICs, 0);
    desktop.Click(dialog.Command1);
  };
  for (const std::function<void()>& close : std::vector<std::function<void()>>{
           [&] { desktop.Click(dialog.cmdClose); }, [&] { desktop.CloseBox(dialog); },
           [&] { desktop.PressKey(dialog, forms::kEscapeKey); }}) {
    ASSERT_EQ(Ask({u"eth0"}, choose), u"0");

    EXPECT_EQ(Ask({u"eth1"}, close), u"");

    EXPECT_FALSE(dialog.IsLoaded());
  }
}

TEST_F(NetworkAdapters,
       The_list_grows_from_run_to_run_while_the_dialog_stays_loaded_and_begins_anew_after_that) {
  desktop.Show(owner);
  Ask({u"eth0", u"eth1"}, [&] { desktop.Click(dialog.Command1); });
  Ask({u"eth0", u"eth1"}, [&] {
    EXPECT_EQ(dialog.lstNICs.ListCount(), 4);
    desktop.Click(dialog.cmdClose);
  });

  Ask({u"eth0", u"eth1"}, [&] { EXPECT_EQ(dialog.lstNICs.ListCount(), 2); });
}

TEST_F(NetworkAdapters, A_card_is_chosen_by_keys_alone) {
  desktop.Show(owner);

  const Text choice = Ask({u"eth0", u"eth1"}, [&] {
    for (const int key : {forms::kDownKey, forms::kDownKey, forms::kTabKey, forms::kSpaceKey})
      desktop.PressKey(dialog, key);
  });

  EXPECT_EQ(choice, u"1");
}

TEST_F(NetworkAdapters, Enter_in_the_list_confirms_nothing) {
  desktop.Show(owner);

  const Text choice = Ask({u"eth0", u"eth1"}, [&] { desktop.PressKey(dialog, forms::kEnterKey); });

  EXPECT_EQ(choice, u"");
  EXPECT_TRUE(dialog.Visible());
}

} // namespace
} // namespace quendra::provisioning
