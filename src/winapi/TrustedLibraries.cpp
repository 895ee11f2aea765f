#include "winapi/TrustedLibraries.h"

#include <commctrl.h>

namespace quendra::winapi {

namespace {

/// Asked for by the system's own libraries, on one version or another: rights of files, COM, firewall,
/// passwords, names of hosts, addresses of cards, dialling, devices, settings of users, programs that are
/// started, texts that are typed, assistive tools, counters of the processor.
constexpr const wchar_t* kOthers[] = {
    L"ntmarta.dll",  L"clbcatq.dll",  L"hnetcfg.dll", L"secur32.dll",  L"netapi32.dll", L"dnsapi.dll",
    L"rasadhlp.dll", L"dhcpcsvc.dll", L"mprapi.dll",  L"rasapi32.dll", L"setupapi.dll", L"version.dll",
    L"userenv.dll",  L"apphelp.dll",  L"msctf.dll",   L"oleacc.dll",   L"perfos.dll"};

template <typename Call> Call* FindInKernel(const char* name) {
  const FARPROC call = ::GetProcAddress(::GetModuleHandleW(L"kernel32.dll"), name);
  return reinterpret_cast<Call*>(reinterpret_cast<void*>(call));
}

/// On systems that can: the working folder from XP's first service pack on, all but the system's from 7 on.
void LimitSearch() {
  constexpr DWORD kSystemFolderAlone = 0x800;
  constexpr BYTE kFirstVersionAfterXp = 6;
  if (const auto setFolder = FindInKernel<BOOL WINAPI(const wchar_t*)>("SetDllDirectoryW")) setFolder(L"");
  // Asked for by version too, so that wherever XP is imitated the program stands without it.
  const auto setFolders = FindInKernel<BOOL WINAPI(DWORD)>("SetDefaultDllDirectories");
  if (setFolders && LOBYTE(LOWORD(::GetVersion())) >= kFirstVersionAfterXp) setFolders(kSystemFolderAlone);
}

/// The manifest names the common controls of version 6, and the system then takes its own for that name, from
/// wherever it keeps them. Without their classes XP makes no window of a program with such a manifest.
void BeginCommonControls() {
  constexpr ULONG kLibrariesByManifest = 2;
  ACTCTX_SECTION_KEYED_DATA found{};
  found.cbSize = sizeof found;
  const auto find = FindInKernel<decltype(::FindActCtxSectionStringW)>("FindActCtxSectionStringW");
  if (!find || !find(0, nullptr, kLibrariesByManifest, L"comctl32.dll", &found)) return;
  const HMODULE library = ::LoadLibraryW(L"comctl32.dll");
  const auto begin = reinterpret_cast<decltype(::InitCommonControlsEx)*>(
      reinterpret_cast<void*>(::GetProcAddress(library, "InitCommonControlsEx")));
  const INITCOMMONCONTROLSEX classes{sizeof classes, ICC_LISTVIEW_CLASSES | ICC_STANDARD_CLASSES};
  if (begin) begin(&classes);
}

} // namespace

TrustedLibraries::TrustedLibraries() {
  LimitSearch();
  loaded_.emplace_back(L"uxtheme.dll");
  BeginCommonControls();
}

void TrustedLibraries::LoadTheOthers() {
  for (const wchar_t* name : kOthers) loaded_.emplace_back(name);
}

} // namespace quendra::winapi
