#include "shell/dormant/CaptureDriverSetup.h"

#include "shell/dormant/CaptureDriverSecurity.h"

namespace quendra::shell {

namespace {

constexpr const char16_t* kUninstall =
    u"HKEY_LOCAL_MACHINE\\SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\Uninstall\\WinPcapInst";
constexpr const char16_t* kSharedDlls =
    u"HKEY_LOCAL_MACHINE\\SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\SharedDLLs";
/// The set of services to start with next, and the one that runs.
constexpr const char16_t* kServiceFolders[] = {u"HKEY_LOCAL_MACHINE\\SYSTEM\\ControlSet001\\Services\\",
                                               u"HKEY_LOCAL_MACHINE\\SYSTEM\\CurrentControlSet\\Services\\"};
constexpr const char16_t* kNpf = u"NPF";
constexpr const char16_t* kRpcapd = u"rpcapd";
constexpr const char16_t* kSecurity = u"\\Security";

constexpr const char* kTools[] = {
    "c:\\program files\\winpcap\\daemon_mgm.exe -i",      "c:\\program files\\winpcap\\daemon_mgm.exe -s",
    "c:\\program files\\winpcap\\npf_mgm.exe -i",         "c:\\program files\\winpcap\\npf_mgm.exe -s",
    "c:\\program files\\winpcap\\NetMonInstaller.exe -i",
};

} // namespace

void CaptureDriverSetup::InstallCaptureDriver() {
  CreateKeys();
  regEdit_.SetRegDword(kSharedDlls, u"C:\\Program Files\\WinPcap\\Uninstall.exe", 1);
  WriteUninstall();
  for (const char16_t* services : kServiceFolders) {
    WriteNpf(services);
    WriteRpcapd(services);
  }
  StartTools();
}

void CaptureDriverSetup::CreateKeys() {
  regEdit_.CreateRegKey(kUninstall);
  for (const char16_t* services : kServiceFolders)
    for (const char16_t* service : {kNpf, kRpcapd}) {
      regEdit_.CreateRegKey(Text(services) + service);
      regEdit_.CreateRegKey(Text(services) + service + kSecurity);
    }
}

void CaptureDriverSetup::WriteUninstall() {
  regEdit_.SetRegString(kUninstall, u"DisplayName", u"WinPcap 3.1 beta4");
  regEdit_.SetRegString(kUninstall, u"InstallDate", u"05/01/2005");
  regEdit_.SetRegString(kUninstall, u"InstallLocation", u"C:\\Program Files\\WinPcap");
  regEdit_.SetRegString(kUninstall, u"InstallSource", u"C:\\Program Files\\Quendra");
  regEdit_.SetRegString(kUninstall, u"InstallSourceFile", u"C:\\Program Files\\Quendra\\Winpcap.exe");
  regEdit_.SetRegString(kUninstall, u"Publisher", u"Politecnico di Torino");
  regEdit_.SetRegString(
      kUninstall, u"UninstallString",
      u"\"C:\\Program Files\\WinPcap\\Uninstall.exe\" \"C:\\Program Files\\WinPcap\\install.log\"");
}

void CaptureDriverSetup::WriteNpf(const Text& services) {
  const Text key = services + kNpf;
  regEdit_.SetRegString(key, u"DisplayName", u"NetGroup Packet Filter Driver");
  regEdit_.SetRegDword(key, u"ErrorControl", 1);
  regEdit_.SetRegString(key, u"ImagePath", u"system32\\drivers\\npf.sys");
  regEdit_.SetRegDword(key, u"Start", 3);
  regEdit_.SetRegDword(key, u"Type", 1);
  regEdit_.SetRegBinary(key + kSecurity, u"Security", FromHexBytes(NpfSecurity()));
}

void CaptureDriverSetup::WriteRpcapd(const Text& services) {
  const Text key = services + kRpcapd;
  regEdit_.SetRegString(key, u"Description",
                        u"Allows to capture traffic on this machine from a remote machine.");
  regEdit_.SetRegString(key, u"DisplayName", u"Remote Packet Capture Protocol v.0 (experimental)");
  regEdit_.SetRegDword(key, u"ErrorControl", 1);
  regEdit_.SetRegString(
      key, u"ImagePath",
      u"\"%ProgramFiles%\\WinPcap\\rpcapd.exe\" -d -f \"%ProgramFiles%\\WinPcap\\rpcapd.ini\"");
  regEdit_.SetRegString(key, u"ObjectName", u"LocalSystem");
  regEdit_.SetRegDword(key, u"Start", 3);
  regEdit_.SetRegDword(key, u"Type", 16);
  regEdit_.SetRegBinary(key + kSecurity, u"Security", FromHexBytes(RpcapdSecurity()));
}

void CaptureDriverSetup::StartTools() {
  for (const char* tool : kTools) shellStart_.Shell(tool, platform::ShellStart::kMinimizedWithoutFocus);
}

} // namespace quendra::shell
