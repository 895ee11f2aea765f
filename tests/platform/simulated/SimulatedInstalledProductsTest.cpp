#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {
namespace {

TEST_F(SimulatedMachineTest, Products_have_their_codes_with_a_NUL_in_their_order) {
  machine.installedProducts.Codes = {"{1}", "{22}"};
  std::string code(5, ' ');

  EXPECT_EQ(operations.installedProducts.MsiEnumProductsA(1, code), 0u);
  EXPECT_EQ(code, std::string("{22}\0", 5));
  EXPECT_EQ(operations.installedProducts.MsiEnumProductsA(0, code), 0u);
  EXPECT_EQ(code, std::string("{1}\0\0", 5));
  EXPECT_EQ(operations.installedProducts.MsiEnumProductsA(2, code), 259u);
}

TEST_F(SimulatedMachineTest, A_product_code_is_cut_to_the_room_for_it) {
  machine.installedProducts.Codes = {"{1234}"};
  std::string code(3, ' ');

  EXPECT_EQ(operations.installedProducts.MsiEnumProductsA(0, code), 0u);
  EXPECT_EQ(code, std::string("{1\0", 3));
  EXPECT_EQ(operations.installedProducts.MsiEnumProductsA(0, {}), 0u);
}

} // namespace
} // namespace quendra::platform::simulated
