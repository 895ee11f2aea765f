#include "mail/MailClients.h"

#include "platform/simulated/mail/SimulatedInstalledProducts.h"

#include <gtest/gtest.h>

namespace quendra::mail {
namespace {

struct MailClientsTest : testing::Test {
  Text With(std::vector<std::string> codes) {
    products.Codes = std::move(codes);
    return clients.DetectMailClients();
  }

  platform::simulated::SimulatedInstalledProducts products;
  MailClients clients{products};
};

TEST_F(MailClientsTest, Outlook_Express_is_there_on_a_machine_without_products) {
  EXPECT_EQ(With({}), u"OE|");
}

TEST_F(MailClientsTest, Each_of_two_codes_is_Outlook_2000) {
  EXPECT_EQ(With({"{00160409-78E1-11D2-B60F-006097C998E7}"}), u"OE|MSO 2k|");
  EXPECT_EQ(With({"{CC29E94B-7BC2-11D1-A921-00A0C91E2AA2}"}), u"OE|MSO 2k|");
}

TEST_F(MailClientsTest, Three_products_of_the_family_XP_have_Outlook_whatever_stands_between) {
  EXPECT_EQ(With({"{90110409-6000-11D3-8CFE-0050048383C9}"}), u"OE|MSO XP|");
  EXPECT_EQ(With({"{911A040D-6000-11D3-8CFE-0050048383C9}"}), u"OE|MSO XP|");
  EXPECT_EQ(With({"{90E00409-6000-11D3-8CFE-0050048383C9}"}), u"OE|MSO XP|");
}

TEST_F(MailClientsTest, Three_products_of_the_family_2003_have_Outlook) {
  EXPECT_EQ(With({"{90110409-6000-11D3-8CFE-0150048383C9}"}), u"OE|MSO 2k3|");
  EXPECT_EQ(With({"{901A0409-6000-11D3-8CFE-0150048383C9}"}), u"OE|MSO 2k3|");
  EXPECT_EQ(With({"{90E00409-6000-11D3-8CFE-0150048383C9}"}), u"OE|MSO 2k3|");
}

TEST_F(MailClientsTest, A_product_of_another_family_or_without_Outlook_adds_nothing) {
  EXPECT_EQ(With({
                "{90120409-6000-11D3-8CFE-0050048383C9}", // no product with Outlook
                "{90160409-6000-11D3-8CFE-0150048383C9}",
                "{90110409-6000-11D3-8CFE-0250048383C9}", // another family
                "{00160409-78E1-11D2-B60F-006097C998E8}",
                "{350C97B0-3D7C-4EE8-BAA9-00BCB3D54227}",
            }),
            u"OE|");
}

TEST_F(MailClientsTest, Letters_of_a_code_are_compared_with_their_case) {
  EXPECT_EQ(With({"{901a0409-6000-11D3-8CFE-0050048383C9}", "{90110409-6000-11d3-8cfe-0050048383c9}",
                  "{cc29e94b-7bc2-11d1-a921-00a0c91e2aa2}"}),
            u"OE|");
}

TEST_F(MailClientsTest, Two_products_of_a_family_give_its_token_twice) {
  EXPECT_EQ(With({"{90110409-6000-11D3-8CFE-0050048383C9}", "{901A0409-6000-11D3-8CFE-0050048383C9}"}),
            u"OE|MSO XP|MSO XP|");
}

TEST_F(MailClientsTest, Tokens_stand_in_the_order_of_the_products) {
  EXPECT_EQ(With({"{90110409-6000-11D3-8CFE-0150048383C9}", "{350C97B0-3D7C-4EE8-BAA9-00BCB3D54227}",
                  "{00160409-78E1-11D2-B60F-006097C998E7}", "{90110409-6000-11D3-8CFE-0050048383C9}"}),
            u"OE|MSO 2k3|MSO 2k|MSO XP|");
}

TEST_F(MailClientsTest, Any_answer_but_0_ends_the_list) {
  products.EndError = 1627;
  EXPECT_EQ(With({"{90110409-6000-11D3-8CFE-0050048383C9}"}), u"OE|MSO XP|");
}

TEST_F(MailClientsTest, Blanks_before_a_code_and_what_stands_behind_it_do_not_count) {
  EXPECT_EQ(With({" {00160409-78E1-11D2-B60F-006097C998E7}"}), u"OE|MSO 2k|");
  EXPECT_EQ(With({"{00160409-78E1-11D2-B60F-006097C998E7}x"}), u"OE|MSO 2k|");
}

TEST_F(MailClientsTest, Texts_that_are_no_codes_add_nothing) {
  EXPECT_EQ(
      With({"", "}", "{90", "{9011}", "{90110409", "no code", std::string(38, '{'), std::string("\0}", 2)}),
      u"OE|");
}

/// Writes down with what it is asked, and gives whatever it is told to.
struct AskedProducts : platform::InstalledProducts {
  std::uint32_t MsiEnumProductsA(std::uint32_t index, std::span<char> code) override {
    indexes.push_back(index);
    lastBuffer.assign(code.begin(), code.end());
    std::copy_n(given.begin(), std::min(given.size(), code.size()), code.begin());
    return indexes.size() < calls ? 0 : 259;
  }

  std::string given;
  std::size_t calls = 0;
  std::vector<std::uint32_t> indexes;
  std::string lastBuffer;
};

TEST_F(MailClientsTest, Products_are_asked_for_from_index_0_on_with_a_buffer_of_39_blanks_and_a_NUL) {
  AskedProducts asked;
  asked.calls = 3;
  asked.given = "{90110409-6000-11D3-8CFE-0050048383C9}";

  EXPECT_EQ(MailClients(asked).DetectMailClients(), u"OE|MSO XP|MSO XP|");

  EXPECT_EQ(asked.indexes, (std::vector<std::uint32_t>{0, 1, 2}));
  EXPECT_EQ(asked.lastBuffer, std::string(39, ' ') + '\0');
}

TEST_F(MailClientsTest, A_code_without_its_NUL_is_read_and_a_full_buffer_without_a_brace_is_none) {
  AskedProducts asked;
  asked.calls = 2;
  asked.given = "{90110409-6000-11D3-8CFE-0150048383C9}xx";
  EXPECT_EQ(MailClients(asked).DetectMailClients(), u"OE|MSO 2k3|");

  AskedProducts full;
  full.calls = 2;
  full.given = std::string(40, '\xFF');
  EXPECT_EQ(MailClients(full).DetectMailClients(), u"OE|");
}

TEST_F(MailClientsTest, A_list_that_never_ends_is_left) {
  AskedProducts asked;
  asked.calls = 1'000'000;

  EXPECT_EQ(MailClients(asked).DetectMailClients(), u"OE|");

  EXPECT_EQ(asked.indexes.size(), 65536u);
}

} // namespace
} // namespace quendra::mail
