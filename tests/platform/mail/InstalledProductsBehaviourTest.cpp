#include "platform/BehaviourFixture.h"
#include "platform/mail/InstalledProducts.h"

namespace quendra::platform {
namespace {

struct InstalledProductsBehaviourTest : BehaviourTest {};

TEST_P(InstalledProductsBehaviourTest, A_machine_on_which_nothing_is_installed_has_no_product_at_any_index) {
  std::string code(40, 'x');
  for (const std::uint32_t index : {0U, 1U, 0xFFFFFFFFU})
    EXPECT_EQ(machine.installedProducts.MsiEnumProductsA(index, code), InstalledProducts::kNoMoreItems)
        << index;
  EXPECT_EQ(machine.installedProducts.MsiEnumProductsA(0, {}), InstalledProducts::kNoMoreItems);
  EXPECT_EQ(code, std::string(40, 'x'));
}

INSTANTIATE_TEST_SUITE_P(, InstalledProductsBehaviourTest, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
