#include "standins/windows/reader/WindowTree.h"

#include <gtest/gtest.h>

namespace quendra::standins {
namespace {

HWND Made(const wchar_t* text, DWORD style, HWND parent = nullptr) {
  return ::CreateWindowExW(0, L"STATIC", text, style, 10, 20, 30, 40, parent, nullptr, nullptr, nullptr);
}

/// The values that a key has in all nodes, in their order.
std::vector<std::string> All(const std::string& tree, const std::string& key) {
  const std::string mark = "\"" + key + "\":\"";
  std::vector<std::string> values;
  for (auto at = tree.find(mark); at != std::string::npos; at = tree.find(mark, at)) {
    at += mark.size();
    values.push_back(tree.substr(at, tree.find('"', at) - at));
  }
  return values;
}

class WindowTree : public testing::Test {
 protected:
  ~WindowTree() override { ::DestroyWindow(top); }

  const HWND top = Made(L"Top", WS_POPUP | WS_VISIBLE);
};

TEST_F(WindowTree, Has_visible_windows_alone_from_the_lowest_up) {
  Made(L"high", WS_CHILD | WS_VISIBLE, top);
  const HWND hidden = Made(L"hidden", WS_CHILD, top);
  Made(L"inside the hidden one", WS_CHILD | WS_VISIBLE, hidden);
  Made(L"\"low\"", WS_CHILD | WS_VISIBLE, top);

  EXPECT_EQ(All(TreeOf(L"Static"), "text"), (std::vector<std::string>{"Top", R"(\u0022low\u0022)", "high"}));
}

TEST_F(WindowTree, Tells_a_name_of_ours_among_other_properties_and_none_where_there_is_none) {
  const HWND named = Made(L"", WS_CHILD | WS_VISIBLE, top);
  ::SetPropW(named, L"other:property", named);
  ::SetPropW(named, L"quendra:cmdRpt", named);

  EXPECT_EQ(All(TreeOf(L"Static"), "name"), (std::vector<std::string>{"", "cmdRpt"}));
  ::RemovePropW(named, L"quendra:cmdRpt");
  EXPECT_EQ(All(TreeOf(L"Static"), "name"), (std::vector<std::string>{"", ""}));
}

TEST_F(WindowTree, Is_empty_where_no_window_of_the_screen_has_the_class) {
  EXPECT_EQ(TreeOf(L"NoSuchClass"), "[]");
}

} // namespace
} // namespace quendra::standins
