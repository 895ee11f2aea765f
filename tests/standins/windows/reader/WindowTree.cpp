#include "standins/windows/reader/WindowTree.h"

#include "standins/windows/reader/Json.h"

#include <array>

namespace quendra::standins {

namespace {

constexpr std::u16string_view kMark = u"quendra:";

struct Tree {
  std::wstring topClass;
  std::vector<std::string> nodes{};
};

std::wstring ClassOf(HWND window) {
  std::array<wchar_t, 256> name{};
  const int length = ::GetClassNameW(window, name.data(), static_cast<int>(name.size()));
  return {name.data(), static_cast<std::size_t>(length)};
}

/// Kept by the system: that of an EDIT window and the like is not its content.
Text TextOf(HWND window) {
  std::array<wchar_t, 4096> text{};
  const int length = ::InternalGetWindowText(window, text.data(), static_cast<int>(text.size()));
  return winapi::TextOf(text.data(), static_cast<std::size_t>(length));
}

BOOL CALLBACK FindMark(HWND, wchar_t* property, HANDLE, ULONG_PTR found) noexcept {
  if (!(reinterpret_cast<std::uintptr_t>(property) >> 16)) return TRUE; // a number in place of a name
  const Text name = winapi::TextOf(property);
  if (!name.starts_with(kMark)) return TRUE;
  *reinterpret_cast<Text*>(found) = name.substr(kMark.size());
  return FALSE;
}

Text MarkOf(HWND window) {
  Text mark;
  ::EnumPropsExW(window, FindMark, reinterpret_cast<LPARAM>(&mark));
  return mark;
}

bool HasFocus(HWND window) {
  GUITHREADINFO state{};
  state.cbSize = sizeof state;
  return ::GetGUIThreadInfo(::GetWindowThreadProcessId(window, nullptr), &state) && state.hwndFocus == window;
}

std::string Number(LONG_PTR number) { return std::to_string(number); }

std::string Node(HWND window, HWND parent) {
  RECT place{};
  ::GetWindowRect(window, &place);
  DWORD process = 0;
  ::GetWindowThreadProcessId(window, &process);
  const auto truth = [](bool is) { return std::string(is ? "true" : "false"); };
  const auto handle = [](HWND of) { return Number(reinterpret_cast<LONG_PTR>(of)); };
  const std::wstring windowClass = ClassOf(window);
  return "{\"window\":" + handle(window) + ",\"parent\":" + handle(parent) +
         ",\"process\":" + std::to_string(process) +
         ",\"class\":" + Quoted(winapi::TextOf(windowClass.c_str())) + ",\"name\":" + Quoted(MarkOf(window)) +
         ",\"text\":" + Quoted(TextOf(window)) + ",\"style\":" + Number(::GetWindowLongW(window, GWL_STYLE)) +
         ",\"place\":[" + Number(place.left) + "," + Number(place.top) + "," +
         Number(place.right - place.left) + "," + Number(place.bottom - place.top) + "]" +
         ",\"enabled\":" + truth(::IsWindowEnabled(window)) + ",\"focus\":" + truth(HasFocus(window)) + "}";
}

// NOLINTNEXTLINE(misc-no-recursion): as deep as windows lie in one another.
void Add(HWND window, HWND parent, Tree& tree) {
  if (!::IsWindowVisible(window)) return;
  tree.nodes.push_back(Node(window, parent));
  // In the order in which they were made, from the lowest up.
  HWND child = ::GetWindow(window, GW_CHILD);
  if (child) child = ::GetWindow(child, GW_HWNDLAST);
  constexpr int kMost = 2000;
  for (int count = 0; child && count < kMost; ++count, child = ::GetWindow(child, GW_HWNDPREV))
    Add(child, window, tree);
}

BOOL CALLBACK AddTop(HWND window, LPARAM parameter) noexcept {
  auto& tree = *reinterpret_cast<Tree*>(parameter);
  if (ClassOf(window) == tree.topClass) Add(window, nullptr, tree);
  return TRUE;
}

} // namespace

std::string TreeOf(const std::wstring& topClass) {
  Tree tree{topClass};
  ::EnumWindows(AddTop, reinterpret_cast<LPARAM>(&tree));
  return Listed(tree.nodes);
}

} // namespace quendra::standins
