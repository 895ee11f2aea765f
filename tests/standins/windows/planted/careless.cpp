#include <windows.h>

#include <cstdlib>

/// A program that asks for libraries by their mere names, which are its arguments.
int main(int, char** words) {
  while (*++words) LoadLibraryA(*words);
  // Without the end of each library: those of the system are not all made to be loaded together.
  TerminateProcess(GetCurrentProcess(), EXIT_SUCCESS);
}
