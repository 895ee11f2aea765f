#include "platform/linux/system/LinuxShellStart.h"

#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/FileManager.h"
#include "platform/linux/system/UserFolders.h"
#include "runtime/Text.h"

#include <fcntl.h>
#include <sys/wait.h>

#include <algorithm>
#include <array>
#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

/// In the child of a fork: only calls that are safe there. Says on `report` why nothing could be started.
[[noreturn]] void BecomeProgram(const std::vector<std::string>& files, char* const* words, int report) {
  ::setsid();
  const pid_t second = ::fork();
  // The first child ends at once, so that the program has no parent that would have to wait for it.
  if (second > 0) ::_exit(0);
  if (second == 0) {
    const int nothing = ::open("/dev/null", O_RDONLY | O_CLOEXEC);
    if (nothing >= 0) ::dup2(nothing, STDIN_FILENO);
    // Not by execvp, which hands a text that is no program to a shell.
    for (const std::string& file : files) ::execv(file.c_str(), words);
  }
  const int error = errno;
  [[maybe_unused]] const ssize_t told = ::write(report, &error, sizeof error);
  ::_exit(127);
}

/// Where the program may lie: as it is named, or by that name in each folder of programs.
std::vector<std::string> FilesOf(const std::string& program) {
  if (program.find('/') != std::string::npos) return {program};
  std::vector<std::string> files;
  for (const auto& folder : UserFolders::OfEnvironment().programDirs) files.push_back(folder + "/" + program);
  return files;
}

/// True when the other end was closed with nothing written, as happens when the program takes its process
/// over.
bool StaysSilent(int report) {
  int error = 0;
  ssize_t count = 0;
  do {
    count = ::read(report, &error, sizeof error);
  } while (count < 0 && errno == EINTR);
  return count == 0;
}

} // namespace

std::vector<std::string> CommandWords(std::string_view commandLine) {
  std::vector<std::string> words;
  bool inWord = false, quoted = false;
  for (const char character : commandLine) {
    if (character == '\0') break;
    if (character == '"') {
      quoted = !quoted;
    } else if ((character == ' ' || character == '\t') && !quoted) {
      inWord = false;
      continue;
    }
    if (!inWord) words.emplace_back();
    inWord = true;
    if (character != '"') words.back().push_back(character);
  }
  return words;
}

namespace {

constexpr std::string_view kShowFile = "explorer.exe /n, /e, /select, ";
constexpr std::string_view kCommand = "CMD /c \"";
constexpr std::string_view kAddRemove = "rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,";
/// What adds and removes programs, the desktops' own before others.
constexpr std::array kSoftwareCentres{"gnome-software", "plasma-discover", "pamac-manager", "mintinstall",
                                      "io.elementary.appcenter"};

bool Start(std::vector<std::string> words);

bool ShowFile(const std::string& path) {
  if (path.empty() || path[0] != '/') return false;
  return ShowInFileManager(path) ||
         Start({"xdg-open", path.substr(0, std::max<std::size_t>(path.rfind('/'), 1))});
}

bool StartSoftwareCentre() {
  return std::ranges::any_of(kSoftwareCentres, [](const char* program) { return Start({program}); });
}

bool Start(std::vector<std::string> words) {
  if (words.empty() || words[0].empty()) return false;
  const auto files = FilesOf(words[0]);
  std::vector<char*> pointers;
  for (auto& word : words) pointers.push_back(word.data());
  pointers.push_back(nullptr);

  int ends[2];
  if (::pipe2(ends, O_CLOEXEC) != 0) return false;
  const Descriptor reading(ends[0]);
  Descriptor writing(ends[1]);
  const pid_t child = ::fork();
  if (child < 0) return false;
  if (child == 0) BecomeProgram(files, pointers.data(), ends[1]);
  writing = Descriptor();
  while (::waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
  }
  return StaysSilent(reading.Number());
}

/// The path on drive C: that the command interpreter is given as its whole command; empty for other command
/// lines.
std::string CommandOf(std::string_view line) {
  if (!line.starts_with(kCommand) || line.size() <= kCommand.size() || line.back() != '"') return {};
  const std::string_view path = line.substr(kCommand.size(), line.size() - kCommand.size() - 1);
  return path.starts_with("C:\\") && path.find('"') == std::string_view::npos ? std::string(path) : "";
}

/// Nobody waits for it, and nobody hears when there is no such file or nothing that opens it.
void OpenByAssociation(const std::string& file) {
  if (!file.empty()) Start({"xdg-open", file});
}

} // namespace

bool LinuxShellStart::Shell(const std::string& commandLine, int) {
  const std::string_view line(commandLine.c_str()); // up to its NUL
  if (line.starts_with(kShowFile)) return ShowFile(paths_.ToRaw(std::string(line.substr(kShowFile.size()))));
  if (line == kAddRemove) return StartSoftwareCentre();
  if (const std::string file = CommandOf(line); !file.empty()) {
    OpenByAssociation(drive_.FileOf(file));
    return true;
  }
  return Start(CommandWords(ToUtf8(FromCodePage(line))));
}

} // namespace quendra::platform::linux_
