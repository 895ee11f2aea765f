#include "shell/dormant/CaptureDriverSetup.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"
#include "shell/dormant/CaptureDriverSecurity.h"

#include <gtest/gtest.h>

namespace quendra::shell {
namespace {

using platform::RegistryValue;
using Bytes = std::vector<std::uint8_t>;

const std::string kMachine = "HKEY_LOCAL_MACHINE\\";
const std::string kUninstallKey =
    kMachine + "SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\Uninstall\\WinPcapInst";
const std::string kSharedDllsKey = kMachine + "SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\SharedDLLs";
const std::string kSet1 = kMachine + "SYSTEM\\ControlSet001\\Services\\";
const std::string kSet2 = kMachine + "SYSTEM\\CurrentControlSet\\Services\\";

Bytes DescriptorOf(const Text& hexBytes) {
  const std::string bytes = ToCodePage(FromHexBytes(hexBytes));
  return {bytes.begin(), bytes.end()};
}

RegistryValue TextValue(const std::string& text) { return {platform::kRegText, {text.begin(), text.end()}}; }
RegistryValue NumberValue(std::uint8_t number) { return {platform::kRegDword, {number, 0, 0, 0}}; }

struct CaptureDriverSetupTest : testing::Test {
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  foundation::RegEdit regEdit{machine.registry, desktop};
  CaptureDriverSetup setup{regEdit, machine.shellStart};

  RegistryValue Value(const std::string& path, const std::string& name) {
    return machine.registry.Value(path, name).value_or(RegistryValue{0xFFFFFFFF, {}});
  }
  std::vector<std::string> CallsOf(const std::string& operation) const {
    std::vector<std::string> calls;
    for (const auto& call : machine.registry.Calls)
      if (call.starts_with(operation)) calls.push_back(call.substr(operation.size() + 1));
    return calls;
  }
};

TEST_F(CaptureDriverSetupTest, The_keys_are_made_in_their_order) {
  setup.InstallCaptureDriver();

  EXPECT_EQ(CallsOf("RegCreateKeyA"),
            (std::vector{kUninstallKey, kSet1 + "NPF", kSet1 + "NPF\\Security", kSet1 + "rpcapd",
                         kSet1 + "rpcapd\\Security", kSet2 + "NPF", kSet2 + "NPF\\Security", kSet2 + "rpcapd",
                         kSet2 + "rpcapd\\Security"}));
}

TEST_F(CaptureDriverSetupTest, The_values_are_written_in_their_order) {
  setup.InstallCaptureDriver();

  std::vector<std::string> expected{"C:\\Program Files\\WinPcap\\Uninstall.exe",
                                    "DisplayName",
                                    "InstallDate",
                                    "InstallLocation",
                                    "InstallSource",
                                    "InstallSourceFile",
                                    "Publisher",
                                    "UninstallString"};
  for (int set = 1; set <= 2; ++set)
    for (const char* name :
         {"DisplayName", "ErrorControl", "ImagePath", "Start", "Type", "Security", "Description",
          "DisplayName", "ErrorControl", "ImagePath", "ObjectName", "Start", "Type", "Security"})
      expected.emplace_back(name);
  EXPECT_EQ(CallsOf("RegSetValueExA"), expected);
}

TEST_F(CaptureDriverSetupTest, Each_value_goes_to_its_key_in_the_order_of_the_keys) {
  setup.InstallCaptureDriver();

  std::vector<std::string> opened{kSharedDllsKey};
  opened.insert(opened.end(), 7, kUninstallKey);
  for (const auto& set : {kSet1, kSet2}) {
    opened.insert(opened.end(), 5, set + "NPF");
    opened.push_back(set + "NPF\\Security");
    opened.insert(opened.end(), 7, set + "rpcapd");
    opened.push_back(set + "rpcapd\\Security");
  }
  EXPECT_EQ(CallsOf("RegOpenKeyExA"), opened);
}

TEST_F(CaptureDriverSetupTest, The_uninstaller_is_a_shared_file_and_stands_among_the_products) {
  setup.InstallCaptureDriver();

  EXPECT_EQ(Value(kSharedDllsKey, "C:\\Program Files\\WinPcap\\Uninstall.exe"), NumberValue(1));
  EXPECT_EQ(Value(kUninstallKey, "DisplayName"), TextValue("WinPcap 3.1 beta4"));
  EXPECT_EQ(Value(kUninstallKey, "InstallDate"), TextValue("05/01/2005"));
  EXPECT_EQ(Value(kUninstallKey, "InstallLocation"), TextValue("C:\\Program Files\\WinPcap"));
  EXPECT_EQ(Value(kUninstallKey, "InstallSource"), TextValue("C:\\Program Files\\Quendra"));
  EXPECT_EQ(Value(kUninstallKey, "InstallSourceFile"), TextValue("C:\\Program Files\\Quendra\\Winpcap.exe"));
  EXPECT_EQ(Value(kUninstallKey, "Publisher"), TextValue("Politecnico di Torino"));
  EXPECT_EQ(Value(kUninstallKey, "UninstallString"),
            TextValue("\"C:\\Program Files\\WinPcap\\Uninstall.exe\" \"C:\\Program "
                      "Files\\WinPcap\\install.log\""));
}

TEST_F(CaptureDriverSetupTest, Both_sets_of_services_hold_the_driver) {
  setup.InstallCaptureDriver();

  for (const auto& set : {kSet1, kSet2}) {
    EXPECT_EQ(Value(set + "NPF", "DisplayName"), TextValue("NetGroup Packet Filter Driver"));
    EXPECT_EQ(Value(set + "NPF", "ErrorControl"), NumberValue(1));
    EXPECT_EQ(Value(set + "NPF", "ImagePath"), TextValue("system32\\drivers\\npf.sys"));
    EXPECT_EQ(Value(set + "NPF", "Start"), NumberValue(3));
    EXPECT_EQ(Value(set + "NPF", "Type"), NumberValue(1));
    EXPECT_EQ(Value(set + "NPF\\Security", "Security"),
              (RegistryValue{platform::kRegBinary, DescriptorOf(NpfSecurity())}));
  }
}

TEST_F(CaptureDriverSetupTest, Both_sets_of_services_hold_the_service_of_remote_capture) {
  setup.InstallCaptureDriver();

  for (const auto& set : {kSet1, kSet2}) {
    EXPECT_EQ(Value(set + "rpcapd", "Description"),
              TextValue("Allows to capture traffic on this machine from a remote machine."));
    EXPECT_EQ(Value(set + "rpcapd", "DisplayName"),
              TextValue("Remote Packet Capture Protocol v.0 (experimental)"));
    EXPECT_EQ(Value(set + "rpcapd", "ErrorControl"), NumberValue(1));
    EXPECT_EQ(
        Value(set + "rpcapd", "ImagePath"),
        TextValue("\"%ProgramFiles%\\WinPcap\\rpcapd.exe\" -d -f \"%ProgramFiles%\\WinPcap\\rpcapd.ini\""));
    EXPECT_EQ(Value(set + "rpcapd", "ObjectName"), TextValue("LocalSystem"));
    EXPECT_EQ(Value(set + "rpcapd", "Start"), NumberValue(3));
    EXPECT_EQ(Value(set + "rpcapd", "Type"), NumberValue(16));
    EXPECT_EQ(Value(set + "rpcapd\\Security", "Security"),
              (RegistryValue{platform::kRegBinary, DescriptorOf(RpcapdSecurity())}));
  }
}

const std::vector<std::string> kToolsStarted{"Shell 6 c:\\program files\\winpcap\\daemon_mgm.exe -i",
                                             "Shell 6 c:\\program files\\winpcap\\daemon_mgm.exe -s",
                                             "Shell 6 c:\\program files\\winpcap\\npf_mgm.exe -i",
                                             "Shell 6 c:\\program files\\winpcap\\npf_mgm.exe -s",
                                             "Shell 6 c:\\program files\\winpcap\\NetMonInstaller.exe -i"};

TEST_F(CaptureDriverSetupTest, The_tools_are_started_minimised_in_their_order) {
  setup.InstallCaptureDriver();

  EXPECT_EQ(machine.Calls, kToolsStarted);
}

TEST_F(CaptureDriverSetupTest, Missing_tools_and_refused_keys_end_no_other_step_and_show_nothing) {
  machine.shellStart.Fail = true;
  machine.registry.Refuse(kSet1 + "NPF", platform::kRegistryAccessDenied);

  setup.InstallCaptureDriver();

  EXPECT_FALSE(machine.registry.HasKey(kSet1 + "NPF\\Security"));
  EXPECT_EQ(Value(kSet2 + "rpcapd", "Type"), NumberValue(16));
  EXPECT_EQ(machine.Calls, kToolsStarted);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(CaptureDriverSetupTest, Running_it_twice_writes_the_same_and_starts_the_tools_again) {
  setup.InstallCaptureDriver();
  const auto once = machine.registry.Calls;
  machine.registry.Calls.clear();
  machine.Calls.clear();

  setup.InstallCaptureDriver();

  EXPECT_EQ(machine.registry.Calls, once);
  EXPECT_EQ(machine.Calls, kToolsStarted);
  EXPECT_EQ(Value(kSet1 + "NPF", "Start"), NumberValue(3));
}

/// Reads the fields of a descriptor by their places.
struct Descriptor {
  explicit Descriptor(const Text& hexBytes) : bytes(DescriptorOf(hexBytes)) { bytes.resize(184); }

  Bytes At(std::size_t at, std::size_t count) const {
    return {bytes.begin() + static_cast<std::ptrdiff_t>(at),
            bytes.begin() + static_cast<std::ptrdiff_t>(at + count)};
  }
  std::uint16_t Word(std::size_t at) const { return Little16(bytes, at); }
  std::uint32_t Long(std::size_t at) const { return Little32(bytes, at); }
  /// As in "S-1-5-18".
  std::string Trustee(std::size_t at) const {
    std::string text =
        "S-" + std::to_string(bytes[at]) + "-" + std::to_string(Big64(bytes, at) & 0xFFFFFFFFFFFF);
    for (std::size_t i = 0; i < bytes[at + 1]; ++i) text += "-" + std::to_string(Long(at + 8 + 4 * i));
    return text;
  }

  Bytes bytes;
};

struct CaptureDriverSecurityTest : testing::TestWithParam<Text (*)()> {
  Text text = GetParam()();
  Descriptor descriptor{text};
};

TEST_P(CaptureDriverSecurityTest, The_text_has_551_characters_and_gives_184_bytes) {
  EXPECT_EQ(text.size(), 551u);
  EXPECT_EQ(DescriptorOf(text).size(), 184u);
}

TEST_P(CaptureDriverSecurityTest, The_header_states_revision_control_bits_and_places) {
  EXPECT_EQ(descriptor.Word(0), 1);
  EXPECT_EQ(descriptor.Word(2), 0x8000 | 0x0010 | 0x0004); // self-relative, both lists present
  EXPECT_EQ(descriptor.Long(4), 0xA0u);
  EXPECT_EQ(descriptor.Long(8), 0xACu);
  EXPECT_EQ(descriptor.Long(12), 0x14u);
  EXPECT_EQ(descriptor.Long(16), 0x30u);
}

TEST_P(CaptureDriverSecurityTest, Owner_and_group_are_the_system) {
  EXPECT_EQ(descriptor.Trustee(0xA0), "S-1-5-18");
  EXPECT_EQ(descriptor.Trustee(0xAC), "S-1-5-18");
}

TEST_P(CaptureDriverSecurityTest, One_entry_audits_failures_of_everyone) {
  EXPECT_EQ(descriptor.Word(0x14), 2);        // revision
  EXPECT_EQ(descriptor.Word(0x16), 0x1C);     // size
  EXPECT_EQ(descriptor.Word(0x18), 1);        // entries
  EXPECT_EQ(descriptor.Word(0x1C), 0x8002);   // audit, failures
  EXPECT_EQ(descriptor.Word(0x1E), 20);       // size
  EXPECT_EQ(descriptor.Long(0x20), 0xF01FFu); // mask
  EXPECT_EQ(descriptor.Trustee(0x24), "S-1-1-0");
}

TEST_P(CaptureDriverSecurityTest, Four_entries_of_24_28_24_and_28_bytes_allow) {
  struct Entry {
    std::uint16_t size;
    std::uint32_t mask;
    const char* trustee;
  };
  EXPECT_EQ(descriptor.Word(0x30), 2);
  EXPECT_EQ(descriptor.Word(0x32), 0x70);
  EXPECT_EQ(descriptor.Word(0x34), 4);
  std::size_t at = 0x38;
  for (const Entry& entry : {Entry{24, 0x201FD, "S-1-5-18"}, Entry{28, 0xF01FF, "S-1-5-32-544"},
                             Entry{24, 0x2018D, "S-1-5-11"}, Entry{28, 0x201FD, "S-1-5-32-547"}}) {
    EXPECT_EQ(descriptor.Word(at), 0) << at;
    EXPECT_EQ(descriptor.Word(at + 2), entry.size) << at;
    EXPECT_EQ(descriptor.Long(at + 4), entry.mask) << at;
    EXPECT_EQ(descriptor.Trustee(at + 8), entry.trustee) << at;
    at += entry.size;
  }
  EXPECT_EQ(at, 0xA0u);
}

TEST_P(CaptureDriverSecurityTest, What_stands_between_the_fields_is_0) {
  EXPECT_EQ(descriptor.Word(0x1A), 0); // behind the audit list's count
  EXPECT_EQ(descriptor.Word(0x36), 0); // behind the access list's
  for (const std::size_t behindTrustee : {0x4EU, 0x68U, 0x6AU, 0x80U, 0x82U, 0x9CU, 0x9EU})
    EXPECT_EQ(descriptor.Word(behindTrustee), 0) << behindTrustee;
}

INSTANTIATE_TEST_SUITE_P(, CaptureDriverSecurityTest, testing::Values(NpfSecurity, RpcapdSecurity));

TEST(CaptureDriverSecurity, The_two_differ_in_two_bytes_behind_the_first_trustee) {
  Bytes expected = DescriptorOf(NpfSecurity());
  EXPECT_EQ(expected[76], 0x00);
  EXPECT_EQ(expected[77], 0x00);
  expected[76] = 0x20;
  expected[77] = 0x02;
  EXPECT_EQ(DescriptorOf(RpcapdSecurity()), expected);
}

TEST(CaptureDriverSecurity, Bytes_above_127_survive_as_characters) {
  EXPECT_EQ(ToCodePage(FromHexBytes(u"00,8d,FF,ca")), std::string("\x00\x8d\xff\xca", 4));
}

} // namespace
} // namespace quendra::shell
