#include <fcntl.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <string>
#include <vector>

namespace quendra::app {

namespace {

/// The program, started on a screen that nobody sees.
class StartedProgram {
 public:
  explicit StartedProgram(std::vector<std::string> words) {
    words.insert(words.begin(), QUENDRA_BINARY_DIR "/quendra");
    id_ = ::fork();
    if (id_ == 0) Become(words);
  }
  ~StartedProgram() {
    if (id_ <= 0) return;
    ::kill(id_, SIGKILL);
    if (!ended_) ::waitpid(id_, nullptr, 0);
  }
  StartedProgram(const StartedProgram&) = delete;

  /// The toolkit's plugin for screens that the program has loaded, asked for ten seconds at most.
  std::string ScreenPlugin() {
    for (int i = 0; i < 1000 && !HasEnded(); ++i, ::usleep(10'000))
      for (const char* plugin : {"offscreen", "minimal", "xcb"})
        if (Executes(std::string("/libq") + plugin + ".so")) return plugin;
    return ended_ ? "ended" : "none";
  }

 private:
  [[noreturn]] static void Become(std::vector<std::string>& words) {
    ::alarm(60);
    ::setenv("QT_QPA_PLATFORM", "offscreen", 1);
    const int nothing = ::open("/dev/null", O_WRONLY);
    ::dup2(nothing, STDOUT_FILENO);
    ::dup2(nothing, STDERR_FILENO);
    std::vector<char*> pointers;
    for (auto& word : words) pointers.push_back(word.data());
    pointers.push_back(nullptr);
    ::execv(pointers[0], pointers.data());
    ::_exit(127);
  }
  /// Of others the toolkit reads what they are for, and maps them for a moment, but not to be executed.
  bool Executes(const std::string& library) const {
    std::ifstream maps("/proc/" + std::to_string(id_) + "/maps");
    for (std::string line; std::getline(maps, line);)
      if (line.find(" r-xp ") != std::string::npos && line.find(library) != std::string::npos) return true;
    return false;
  }
  bool HasEnded() {
    if (!ended_) ended_ = ::waitpid(id_, nullptr, WNOHANG) != 0;
    return ended_;
  }

  pid_t id_ = -1;
  bool ended_ = false;
};

TEST(ProgramStart, The_environment_picks_the_toolkits_screen) {
  EXPECT_EQ(StartedProgram({}).ScreenPlugin(), "offscreen");
}

TEST(ProgramStart, The_toolkits_switches_have_no_effect) {
  EXPECT_EQ(StartedProgram({"-platform", "minimal"}).ScreenPlugin(), "offscreen");
  EXPECT_EQ(StartedProgram({"-platform", "nowhere", "-style", "windows"}).ScreenPlugin(), "offscreen");
}

} // namespace

} // namespace quendra::app
