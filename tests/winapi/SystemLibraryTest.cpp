#include "winapi/SystemLibrary.h"

#include <gtest/gtest.h>

namespace quendra::winapi {

namespace {

constexpr const wchar_t* kThatNobodyElseLoads = L"avifil32.dll";

TEST(SystemLibraryTest, It_comes_from_the_systems_folder_and_gives_its_calls) {
  const SystemLibrary library(L"version.dll");
  wchar_t path[MAX_PATH] = {};
  ::GetModuleFileNameW(library.Module(), path, MAX_PATH);

  EXPECT_TRUE(library.IsThere());
  EXPECT_EQ(::lstrcmpiW(path, Wide(SystemFolder() + u"\\version.dll")), 0);
  EXPECT_TRUE(library.Find<void>("GetFileVersionInfoW"));
  EXPECT_FALSE(library.Find<void>("NoSuchCall"));
}

TEST(SystemLibraryTest, One_that_the_system_lacks_has_no_calls) {
  const SystemLibrary library(L"quendra-lacks-this.dll");

  EXPECT_FALSE(library.IsThere());
  EXPECT_FALSE(library.Find<void>("GetFileVersionInfoW"));
}

TEST(SystemLibraryTest, It_stays_for_the_threads_that_it_runs_when_who_loaded_it_goes) {
  ASSERT_FALSE(::GetModuleHandleW(kThatNobodyElseLoads));
  {
    const SystemLibrary library(kThatNobodyElseLoads);
    ASSERT_TRUE(library.IsThere());
  }

  EXPECT_TRUE(::GetModuleHandleW(kThatNobodyElseLoads));
}

} // namespace

} // namespace quendra::winapi
