#include "winapi/SystemLibrary.h"

#include <fstream>
#include <iostream>
#include <sstream>

/// Uses what makes the compiler's own library ask most of the system.
int main(int count, char** arguments) {
  const quendra::winapi::SystemLibrary library(L"version.dll");
  std::ostringstream content;
  try {
    content << std::ifstream(arguments[count - 1]).rdbuf() << 1.5;
  } catch (const std::exception& failure) {
    std::cerr << failure.what();
  }
  std::cout << content.str() << library.IsThere();
}
