// Reads the windows of a running program for another that can't ask them itself, as screen readers do. A line
// on its input is a question, a line of JSON on its output the answer:
//
//   tree CLASS      all windows in those of the screen that have this class
//   field WINDOW    the text in a field
//   table WINDOW    headers, rows and selection of a table
//   items WINDOW    items of a list box or a combo box
//
// A program that hangs is waited for two seconds a message, and five for a table. It ends with its input.

#include "standins/windows/reader/Contents.h"
#include "standins/windows/reader/WindowTree.h"

#include <cstdio>
#include <iostream>

namespace {

std::string AnswerTo(const std::string& question, const std::string& subject) {
  using namespace quendra::standins;
  if (question == "tree") return TreeOf({subject.begin(), subject.end()});
  const auto window = reinterpret_cast<HWND>(std::strtoul(subject.c_str(), nullptr, 10));
  if (question == "field") return FieldIn(window);
  if (question == "table") return TableIn(window);
  if (question == "items") return ItemsIn(window);
  return "null";
}

} // namespace

int main() {
  for (std::string line; std::getline(std::cin, line);) {
    if (line.ends_with('\r')) line.pop_back();
    const auto blank = line.find(' ');
    const std::string subject = blank == std::string::npos ? "" : line.substr(blank + 1);
    std::cout << AnswerTo(line.substr(0, blank), subject) << std::endl;
  }
}
