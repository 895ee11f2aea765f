#pragma once

#include <gtest/gtest.h>

#include <string>

namespace quendra {

/// "Suite.Name" of a test, without what the suites' instances and parameters add.
inline std::string NameOfTest(const testing::TestInfo& test) {
  const std::string suite = test.test_suite_name();
  const std::string name = test.name();
  return suite.substr(suite.find('/') + 1) + "." + name.substr(0, name.find('/'));
}

} // namespace quendra
