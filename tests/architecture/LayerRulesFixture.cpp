#include "LayerRulesFixture.h"

#include <algorithm>
#include <cctype>
#include <map>
#include <regex>
#include <set>
#include <sstream>

namespace quendra::architecture {

namespace {

using Names = std::set<std::string>;

const Names kBelowSubsystems{"foundation", "forms", "platform", "runtime"};

Names With(Names names, const Names& more) {
  names.insert(more.begin(), more.end());
  return names;
}

/// What each folder may include beside itself. Arrows go down; those that go sideways are all here.
const std::map<std::string, Names>& Allowed() {
  static const Names subsystems{"monitor", "capture", "report", "diagnostics", "provisioning", "mail"};
  static const Names backends{
      "forms/qt",         "forms/win32",        "forms/headless",      "platform/linux",
      "platform/windows", "platform/simulated", "platform/unavailable"};
  static const Names belowShell = With(subsystems, kBelowSubsystems);
  static const std::map<std::string, Names> allowed{
      {"runtime", {}},
      // The system's headers as both backends of one system take them.
      {"winapi", {"runtime"}},
      {"forms", {"runtime"}},
      {"platform", {"runtime"}},
      {"foundation", {"forms", "platform", "runtime"}},
      {"monitor", kBelowSubsystems},
      {"capture", With(kBelowSubsystems, {"monitor"})},
      {"report", With(kBelowSubsystems, {"monitor"})},
      {"diagnostics", kBelowSubsystems},
      {"provisioning", With(kBelowSubsystems, {"mail", "diagnostics"})},
      {"mail", kBelowSubsystems},
      {"shell", belowShell},
      {"app", With(With(belowShell, {"shell", "winapi"}), backends)},
      {"forms/qt", {"forms", "runtime"}},
      {"forms/win32", {"forms", "runtime", "winapi"}},
      {"forms/headless", {"forms", "runtime"}},
      {"forms/headless/posix", {"forms", "forms/headless", "runtime"}},
      // What a system lacks is answered by the backend that lacks everything.
      {"platform/linux", {"platform", "platform/unavailable", "runtime"}},
      {"platform/windows", {"platform", "platform/unavailable", "runtime", "winapi"}},
      {"platform/simulated", {"platform", "runtime"}},
      {"platform/unavailable", {"platform", "runtime"}},
  };
  return allowed;
}

bool IsDesktop(const std::string& folder) { return folder.starts_with("forms/"); }
bool IsBackend(const std::string& folder) { return folder.find('/') != std::string::npos; }

/// What only systems of one kind can be built with stands in these; all others compile for every edition.
bool IsPortable(const std::string& folder) {
  static const Names ofOneSystem{"forms/qt",       "forms/win32",      "forms/headless/posix",
                                 "platform/linux", "platform/windows", "winapi"};
  return !ofOneSystem.contains(folder);
}

/// The layer or backend that a path lies in, however deep: "forms/qt" for "forms/qt/views/FormView.h",
/// "forms" for "forms/Form.h", "platform" for "platform/net/Sockets.h", empty for a path outside the layers.
std::string FolderOf(std::string path) {
  for (auto end = path.rfind('/'); end != std::string::npos; end = path.rfind('/')) {
    path.resize(end);
    if (Allowed().contains(path)) return path;
  }
  return {};
}

const Names kStandardHeaders{"algorithm",
                             "any",
                             "array",
                             "atomic",
                             "barrier",
                             "bit",
                             "bitset",
                             "cassert",
                             "cctype",
                             "cerrno",
                             "cfloat",
                             "charconv",
                             "chrono",
                             "cinttypes",
                             "climits",
                             "cmath",
                             "compare",
                             "complex",
                             "concepts",
                             "condition_variable",
                             "csignal",
                             "cstdarg",
                             "cstddef",
                             "cstdint",
                             "cstdio",
                             "cstdlib",
                             "cstring",
                             "ctime",
                             "cwchar",
                             "deque",
                             "exception",
                             "filesystem",
                             "forward_list",
                             "fstream",
                             "functional",
                             "future",
                             "initializer_list",
                             "iomanip",
                             "ios",
                             "iosfwd",
                             "iostream",
                             "istream",
                             "iterator",
                             "latch",
                             "limits",
                             "list",
                             "locale",
                             "map",
                             "memory",
                             "memory_resource",
                             "mutex",
                             "new",
                             "numbers",
                             "numeric",
                             "optional",
                             "ostream",
                             "queue",
                             "random",
                             "ranges",
                             "ratio",
                             "regex",
                             "semaphore",
                             "set",
                             "shared_mutex",
                             "source_location",
                             "span",
                             "sstream",
                             "stack",
                             "stdexcept",
                             "stop_token",
                             "streambuf",
                             "string",
                             "string_view",
                             "system_error",
                             "thread",
                             "tuple",
                             "type_traits",
                             "typeindex",
                             "typeinfo",
                             "unordered_map",
                             "unordered_set",
                             "utility",
                             "valarray",
                             "variant",
                             "vector",
                             "version"};

/// Headers of the standard library that the compiler of the Windows edition offers nothing of: its threads
/// would need a system newer than XP.
const Names kThreadHeaders{"barrier",   "condition_variable", "future",     "latch", "mutex",
                           "semaphore", "shared_mutex",       "stop_token", "thread"};

bool IsQtHeader(const std::string& header) {
  return header.starts_with("Qt") ||
         (header.size() > 1 && header[0] == 'Q' && std::isupper(static_cast<unsigned char>(header[1])));
}

/// Headers of a system or toolkit that a source may name.
bool MayNameSystemHeader(const std::string& folder, const std::string& header) {
  if (header == "windows.h") return folder == "winapi";
  if (folder == "forms/qt") return IsQtHeader(header);
  if (folder == "forms/headless/posix" || folder == "forms/win32" || folder == "platform/linux" ||
      folder == "platform/windows" || folder == "winapi")
    return !IsQtHeader(header);
  return false;
}

/// Above platform/ a class takes the families that it uses; the program and the backends alone see them all.
bool MaySeeTheWholeMachine(const std::string& folder) {
  return folder == "app" || folder.starts_with("platform");
}

std::string WhyNotIncluded(const std::string& path, const std::string& header) {
  const std::string folder = FolderOf(path);
  const std::string target = FolderOf(header);
  if (target.empty()) return "is not written from src/";
  if (target == folder) return {};
  if (IsDesktop(folder) && (header == "platform/EventLoop.h" || header == "platform/DescriptorWatch.h"))
    return {};
  if (header == "platform/Machine.h" && !MaySeeTheWholeMachine(folder)) return "names the whole machine";
  if (Allowed().at(folder).contains(target)) return {};
  return IsBackend(target) ? "names a backend" : "goes against the layers";
}

std::string WhyNotSystem(const std::string& path, const std::string& header) {
  if (IsPortable(FolderOf(path)) && kThreadHeaders.contains(header)) return "asks for threads";
  if (kStandardHeaders.contains(header)) return {};
  return MayNameSystemHeader(FolderOf(path), header) ? "" : "is a header of a system or toolkit";
}

/// An atomic number of 64 bits is a call into a library on 32-bit machines.
bool HasWideAtomic(const std::string& line) {
  static const std::regex wide(R"(\batomic(_ref)?\s*<\s*(std::)?(u?int(_least|_fast)?64_t|u?intmax_t|)"
                               R"((unsigned\s+)?long\s+long(\s+int)?|(long\s+)?double)\s*>|)"
                               R"(\batomic_(u?int(_least|_fast)?64_t|u?intmax_t|u?llong)\b)");
  return std::regex_search(line.substr(0, line.find("//")), wide);
}

std::string WhyWrongLine(const std::string& path, const std::string& line) {
  static const std::regex include(R"(^\s*#\s*include\b\s*(.*)$)");
  static const std::regex quoted(R"(^"([^"]+)\".*$)");
  static const std::regex angled(R"(^<([^>]+)>.*$)");
  static const std::regex condition(R"(^\s*#\s*(if|ifdef|ifndef|elif)\b(.*)$)");
  static const std::regex system(
      R"((\b(_?_?WIN(32|64)?(__)?|_WIN32|_WIN64|_MSC_VER|__MINGW\w*|__CYGWIN__|(__)?linux(__)?|__gnu_linux__|(__)?unix(__)?|__APPLE__|__ANDROID__)\b|\bQ_OS_\w+|__has_include))");
  std::smatch match;
  if (std::regex_match(line, match, include)) {
    const std::string target = match[1];
    if (std::regex_match(target, match, quoted)) return WhyNotIncluded(path, match[1]);
    if (std::regex_match(target, match, angled)) return WhyNotSystem(path, match[1]);
    return "is no plain include";
  }
  if (std::regex_match(line, match, condition) && !IsBackend(FolderOf(path))) {
    const std::string asked = match[2];
    if (std::regex_search(asked, system)) return "asks for an operating system";
  }
  if (IsPortable(FolderOf(path)) && HasWideAtomic(line)) return "is an atomic number of 64 bits";
  return {};
}

} // namespace

std::vector<std::string> ViolationsOf(const Source& source) {
  if (FolderOf(source.path).empty()) return {source.path + ": stands in no layer"};
  std::vector<std::string> violations;
  std::istringstream lines(source.text);
  std::string line;
  for (int number = 1; std::getline(lines, line); ++number) {
    if (!line.empty() && line.back() == '\r') line.pop_back();
    const std::string why = WhyWrongLine(source.path, line);
    if (!why.empty())
      violations.push_back(source.path + ":" + std::to_string(number) + ": " + line + " " + why);
  }
  return violations;
}

} // namespace quendra::architecture
