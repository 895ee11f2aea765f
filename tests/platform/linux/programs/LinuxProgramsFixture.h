#pragma once

#include "platform/linux/LinuxFixture.h"
#include "platform/linux/programs/LinuxIcons.h"
#include "platform/linux/programs/LinuxVersionInfo.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {

inline const std::string kPng = std::string("\x89PNG\r\n\x1A\n") + "picture";

/// A session with folders of its own.
struct LinuxPrograms : testing::Test {
  TemporaryFolder folder;
  TestClock clock;
  SystemPaths paths;
  UserFolders folders{folder / "home",
                      folder / "home/.config",
                      {folder / "etc"},
                      {folder / "home/.local/share", folder / "share", folder / "share2"},
                      {folder / "bin", folder / "bin2"}};
  DesktopIndex index{folders, clock.AsClock()};
  IconTheme theme{folders, clock.AsClock()};
  LinuxVersionInfo versions{index, paths};
  LinuxIcons icons{index, theme, paths};

  std::string Program(const std::string& name) {
    return folder.Write(name,
                        "\x7F"
                        "ELF",
                        true);
  }
  void AddEntry(const std::string& name, const std::string& keys, const std::string& data = "share") {
    folder.Write(data + "/applications/" + name, "[Desktop Entry]\nType=Application\n" + keys);
  }
  void AddTheme(const std::string& name, const std::string& keys, const std::vector<std::string>& sizes,
                const std::string& base = "share/icons") {
    std::string text = "[Icon Theme]\nName=x\n" + keys + "Directories=";
    for (const auto& size : sizes) text += size + "/apps,";
    text += "\n";
    for (const auto& size : sizes)
      text +=
          "[" + size + "/apps]\n" +
          (size == "scalable" ? "Size=48\nType=Scalable\n" : "Size=" + size.substr(0, size.find('x')) + "\n");
    folder.Write(base + "/" + name + "/index.theme", text);
  }
  std::string AddIcon(const std::string& name) { return folder.Write(name, kPng); }

  /// The named field of the file's version record: "?" when the record lacks it, "" for a file without a
  /// record.
  std::string Field(const std::string& path, const std::string& name = "ProductName") {
    std::vector<std::uint8_t> block(versions.GetFileVersionInfoSizeA(path));
    if (block.empty() || !versions.GetFileVersionInfoA(path, block)) return "";
    const auto value = versions.VerQueryValueA(block, "\\StringFileInfo\\040D04E7\\" + name);
    return value ? std::string(value->begin(), value->end() - 1) : "?";
  }
  std::string IconOf(const std::string& path) {
    const Handle icon = icons.ExtractIconExA(path, 0);
    const auto& bytes = icons.ImageOf(icon);
    const std::string text(bytes.begin(), bytes.end());
    EXPECT_EQ(icons.DestroyIcon(icon), icon != kNoHandle);
    return text;
  }
  std::string Found(const std::string& icon) {
    return theme.Find(icon).value_or(folder / "(none)").substr(folder.Path().size() + 1);
  }
};

} // namespace quendra::platform::linux_
