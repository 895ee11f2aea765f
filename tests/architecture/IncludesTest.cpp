#include "LayerRulesFixture.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sstream>

namespace quendra::architecture {
namespace {

namespace fs = std::filesystem;

bool IsSource(const fs::path& path) {
  const std::string ending = path.extension().string();
  return ending == ".h" || ending == ".cpp" || ending == ".in";
}

std::string TextOf(const fs::path& path) {
  std::ostringstream text;
  text << std::ifstream(path, std::ios::binary).rdbuf();
  return text.str();
}

std::vector<Source> SourcesBelow(const fs::path& top) {
  std::vector<Source> sources;
  if (!fs::exists(top)) return sources;
  for (const auto& entry : fs::recursive_directory_iterator(top))
    if (entry.is_regular_file() && IsSource(entry.path()))
      sources.push_back({fs::relative(entry.path(), top).generic_string(), TextOf(entry.path())});
  std::sort(sources.begin(), sources.end(), [](const Source& a, const Source& b) { return a.path < b.path; });
  return sources;
}

const fs::path kTop = QUENDRA_SOURCE_DIR;

TEST(Includes, The_sources_are_found_and_read) {
  const auto sources = SourcesBelow(kTop / "src");
  const auto with = [&](const char* text) {
    return std::count_if(sources.begin(), sources.end(),
                         [&](const Source& source) { return source.text.find(text) != std::string::npos; });
  };

  EXPECT_GT(sources.size(), 60U);
  EXPECT_GT(with("#include \"forms/"), 20);
}

TEST(Includes, No_source_goes_against_the_layers) {
  for (const Source& source : SourcesBelow(kTop / "src"))
    for (const std::string& violation : ViolationsOf(source)) ADD_FAILURE() << violation;
}

TEST(Includes, No_source_outside_the_tests_is_longer_than_600_lines) {
  for (const char* folder : {"src", "bench"})
    for (const Source& source : SourcesBelow(kTop / folder)) {
      const auto lines = std::count(source.text.begin(), source.text.end(), '\n');
      EXPECT_LE(lines, 600) << folder << "/" << source.path;
    }
}

TEST(Includes, Each_header_guards_itself_with_pragma_once) {
  for (const Source& source : SourcesBelow(kTop / "src")) {
    const bool guarded = source.text.find("#pragma once") != std::string::npos;
    EXPECT_TRUE(guarded || !source.path.ends_with(".h")) << source.path;
  }
}

} // namespace
} // namespace quendra::architecture
