#pragma once

#include "winapi/Winapi.h"

#include <ras.h>

/// What the calls of the stand-in do, by records of the phone book's own code page.
namespace quendra::standins {

struct DialNotifier {
  DWORD type = 0;
  void* target = nullptr;
};

DWORD EnumEntries(const char* phoneBook, RASENTRYNAMEA* first, DWORD* bytes, DWORD* count);
DWORD DeleteEntry(const char* phoneBook, const char* entryName);
DWORD GetEntryProperties(const char* phoneBook, const char* entryName, RASENTRYA* entry, DWORD* bytes);
DWORD SetEntryProperties(const char* phoneBook, const char* entryName, const RASENTRYA* entry, DWORD bytes);
DWORD GetEntryDialParams(const char* phoneBook, RASDIALPARAMSA* params, BOOL* hasPassword);
DWORD SetEntryDialParams(const char* phoneBook, RASDIALPARAMSA* params, BOOL removePassword);
DWORD EnumDevices(RASDEVINFOA* first, DWORD* bytes, DWORD* count);
DWORD DialBy(RASDIALEXTENSIONS* extensions, const char* phoneBook, RASDIALPARAMSA* params,
             DialNotifier notifier, HRASCONN* connection);
DWORD EndConnection(HRASCONN connection);
DWORD ConnectStatus(HRASCONN connection);
DWORD EnumConnections(RASCONNA* first, DWORD* bytes, DWORD* count);
DWORD ErrorText(UINT error, char* text, DWORD bytes);

} // namespace quendra::standins
