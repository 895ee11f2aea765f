#include "platform/windows/adapters/WindowsAdapters.h"
#include "platform/adapters/AdapterNumbers.h"
#include "platform/windows/adapters/Management.h"
#include "platform/windows/adapters/ScriptedManagement.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {
namespace {

using Lines = std::vector<std::string>;

struct ManagementTest : testing::Test {
  Management Connected() { return {com, ComPtr<IWbemServices>(new ScriptedServices(machine, *com))}; }
  std::shared_ptr<NetworkCard> FirstCard() { return Connected().ExecQuery(Adapters::kCards).at(0); }

  const std::shared_ptr<const ComRuntime> com = std::make_shared<const ComRuntime>();
  ScriptedMachine machine{.cards = {{7, u"Second"}, {3, u"\u05DB\u05E8\u05D8\u05D9\u05E1 A"}}};
};

TEST_F(ManagementTest, Cards_come_by_their_index_with_descriptions_in_the_code_page) {
  Lines descriptions;
  for (const auto& card : Connected().ExecQuery(Adapters::kCards))
    descriptions.push_back(card->Description());

  EXPECT_EQ(descriptions, (Lines{"\xEB\xF8\xE8\xE9\xF1 A", "Second"}));
  EXPECT_EQ(machine.queries,
            Lines{"WQL: Select * from Win32_NetworkAdapterConfiguration where IPEnabled=TRUE"});
}

TEST_F(ManagementTest, A_static_address_goes_to_the_card_as_lists_of_texts) {
  EXPECT_EQ(FirstCard()->EnableStatic({"10.0.0.1", "10.0.0.2"}, {"255.0.0.0", "255.255.0.0"}), 0U);

  EXPECT_EQ(machine.calls, Lines{"EnableStatic of card 3: IPAddress 10.0.0.1 10.0.0.2, "
                                 "SubnetMask 255.0.0.0 255.255.0.0"});
}

TEST_F(ManagementTest, Gateways_go_to_the_card_with_their_metrics_as_numbers) {
  EXPECT_EQ(FirstCard()->SetGateways({"10.0.0.138"}, {1}), 0U);

  EXPECT_EQ(machine.calls, Lines{"SetGateways of card 3: DefaultIPGateway 10.0.0.138, GatewayCostMetric 1"});
}

TEST_F(ManagementTest, What_a_method_gives_is_passed_on) {
  machine.result = kCardInvalidSubnetMask;

  EXPECT_EQ(FirstCard()->EnableStatic({"10.0.0.1"}, {"1.2.3.4"}), kCardInvalidSubnetMask);
}

TEST_F(ManagementTest, A_method_that_cannot_be_run_gives_a_number_too) {
  machine.method = E_ACCESSDENIED;
  EXPECT_EQ(FirstCard()->SetGateways({}, {}), kCardAccessDenied);
  machine.method = static_cast<HRESULT>(WBEM_E_ACCESS_DENIED);
  EXPECT_EQ(FirstCard()->SetGateways({}, {}), kCardAccessDenied);
  machine.method = E_FAIL;

  EXPECT_EQ(FirstCard()->SetGateways({}, {}), kCardUnknownFailure);
}

TEST_F(ManagementTest, A_query_that_is_refused_finds_no_card) {
  machine.query = E_FAIL;

  EXPECT_TRUE(Connected().ExecQuery(Adapters::kCards).empty());
}

TEST_F(ManagementTest, A_card_outlives_the_services_and_then_nothing_is_held) {
  auto card = FirstCard();
  EXPECT_EQ(card->EnableStatic({"10.0.0.1"}, {"255.0.0.0"}), 0U);
  EXPECT_EQ(machine.objects, 1) << "the services, by the card";

  card.reset();

  EXPECT_EQ(machine.objects, 0);
}

// Of the machine that runs the tests.

TEST(WindowsAdapters, Cards_of_this_machine_have_a_description) {
  const auto cards = WindowsAdapters().GetObject(Adapters::kMoniker)->ExecQuery(Adapters::kCards);

  for (const auto& card : cards) EXPECT_NE(card->Description(), "");
}

TEST(WindowsAdapters, The_management_answers_queries_time_and_again) {
  WindowsAdapters adapters;
  for (int i = 0; i < 3; ++i) {
    const auto management = adapters.GetObject(Adapters::kMoniker);
    EXPECT_FALSE(management->ExecQuery("Select * from Win32_OperatingSystem").empty()) << i;
    EXPECT_TRUE(management->ExecQuery("Select nothing").empty()) << i;
  }
}

TEST(WindowsAdapters, A_moniker_of_no_such_management_raises_429) {
  for (const char* moniker :
       {"", "winmgmts", "winmgmts:\\\\.\\root\\no_such_namespace", "other:\\\\.\\root"}) {
    try {
      WindowsAdapters().GetObject(moniker);
      ADD_FAILURE() << moniker;
    } catch (const Fault& fault) {
      EXPECT_EQ(fault.number, Fault::kCannotCreateObject) << moniker;
    }
  }
}

} // namespace
} // namespace quendra::platform::windows
