#include <windows.h>

int main() { return GetFileVersionInfoSizeW(L"", nullptr) == GetTickCount64(); }
