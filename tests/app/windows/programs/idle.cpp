#include <windows.h>

/// A process of a crowd. It ends by itself, should nobody end it.
int main() { Sleep(120'000); }
