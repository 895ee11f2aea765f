#include "platform/linux/LinuxFixture.h"
#include "platform/linux/process/ProcFolder.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <thread>

namespace quendra::platform::linux_ {

namespace fs = std::filesystem;

TemporaryFolder::TemporaryFolder() {
  char name[] = "/tmp/quendra-test-XXXXXX";
  if (::mkdtemp(name) == nullptr) throw std::runtime_error("no temporary folder");
  path_ = name;
  fs::permissions(path_, fs::perms(0755));
}

TemporaryFolder::~TemporaryFolder() {
  std::error_code ignored;
  fs::remove_all(path_, ignored);
}

std::string TemporaryFolder::Write(const std::string& name, const std::string& content,
                                   bool isProgram) const {
  const fs::path path = fs::path(path_) / name;
  fs::create_directories(path.parent_path());
  std::ofstream(path, std::ios::binary) << content;
  if (isProgram) fs::permissions(path, fs::perms(0755));
  return path.string();
}

namespace {

void PutVariable(const std::string& name, const std::optional<std::string>& value) {
  value ? ::setenv(name.c_str(), value->c_str(), 1) : ::unsetenv(name.c_str());
}

} // namespace

Environment::~Environment() {
  for (const auto& [name, value] : before_) PutVariable(name, value);
}

void Environment::Set(const std::string& name, const std::optional<std::string>& value) {
  const char* now = ::getenv(name.c_str());
  before_.emplace(name, now == nullptr ? std::nullopt : std::optional<std::string>(now));
  PutVariable(name, value);
}

namespace {

std::string StatLine(std::uint32_t processId, const FakeProc::Process& process) {
  const std::uint32_t flags = process.isKernelThread ? 0x208040 : 0x400000;
  return std::to_string(processId) + " (" + process.comm + ") " + process.state + " " +
         std::to_string(process.parent) + " 1 1 0 -1 " + std::to_string(flags) +
         " 0 0 0 0 0 0 0 0 20 0 1 0 " + std::to_string(process.startTime) + " 1000 10 18446744073709551615\n";
}

void WriteProcess(const std::string& folder, std::uint32_t processId, const FakeProc::Process& process) {
  fs::create_directories(folder + "/fd");
  std::ofstream(folder + "/stat", std::ios::binary) << StatLine(processId, process);
  fs::remove(folder + "/exe");
  if (!process.executable.empty()) fs::create_symlink(process.executable, folder + "/exe");
}

} // namespace

void FakeProc::Add(std::uint32_t processId, const Process& process) {
  WriteProcess(FolderOf(processId), processId, process);
}

void FakeProc::Change(std::uint32_t processId, const Process& process) {
  WriteProcess(FolderOf(processId), processId, process);
}

void FakeProc::TakeOver(std::uint32_t processId, const Process& process) {
  // Made before the old one goes, so that it can't get the old one's node number.
  const std::string fresh = folder_ / "fresh";
  WriteProcess(fresh, processId, process);
  Remove(processId);
  fs::rename(fresh, FolderOf(processId));
}

void FakeProc::Remove(std::uint32_t processId) { fs::remove_all(FolderOf(processId)); }

void FakeProc::AddDescriptor(std::uint32_t processId, std::uint32_t descriptor, const std::string& target) {
  fs::create_symlink(target, FolderOf(processId) + "/fd/" + std::to_string(descriptor));
}

void FakeProc::AddSocket(std::uint32_t processId, std::uint32_t descriptor, std::uint32_t node) {
  AddDescriptor(processId, descriptor, "socket:[" + std::to_string(node) + "]");
}

void FakeProc::RemoveDescriptor(std::uint32_t processId, std::uint32_t descriptor) {
  fs::remove(FolderOf(processId) + "/fd/" + std::to_string(descriptor));
}

void FakeProc::AddThread(std::uint32_t processId, std::uint32_t threadId, const Process& figures) {
  WriteProcess(FolderOf(processId) + "/task/" + std::to_string(threadId), threadId, figures);
}

void FakeProc::AddSocketOfThread(std::uint32_t processId, std::uint32_t threadId, std::uint32_t descriptor,
                                 std::uint32_t node) {
  fs::create_symlink("socket:[" + std::to_string(node) + "]", FolderOf(processId) + "/task/" +
                                                                  std::to_string(threadId) + "/fd/" +
                                                                  std::to_string(descriptor));
}

namespace {

/// What comes through the pipe until its other end goes; at most ten seconds between two pieces.
std::string ReadAll(int descriptor) {
  std::string text;
  char buffer[4096];
  pollfd ready{descriptor, POLLIN, 0};
  while (::poll(&ready, 1, 10'000) > 0) {
    const ssize_t count = ::read(descriptor, buffer, sizeof buffer);
    if (count <= 0) return text;
    text.append(buffer, static_cast<std::size_t>(count));
  }
  throw std::runtime_error("a child process gave no answer");
}

/// Forks; the child ends with its parent, should that be killed.
pid_t Fork(int (&ends)[2]) {
  if (::pipe2(ends, O_CLOEXEC) != 0) throw std::runtime_error("no pipe");
  const pid_t id = ::fork();
  if (id < 0) throw std::runtime_error("no process");
  if (id == 0) {
    ::alarm(60);
    ::close(ends[0]);
  } else {
    ::close(ends[1]);
  }
  return id;
}

} // namespace

Child::Child(const std::function<std::string()>& work) {
  int ends[2];
  id_ = Fork(ends);
  if (id_ == 0) {
    const std::string answer = work();
    [[maybe_unused]] const ssize_t written = ::write(ends[1], answer.data(), answer.size());
    ::close(ends[1]);
    for (;;) ::pause();
  }
  answer_ = ReadAll(ends[0]);
  ::close(ends[0]);
}

Child::Child(const std::vector<std::string>& command) {
  int ends[2];
  id_ = Fork(ends);
  if (id_ == 0) {
    std::vector<char*> words;
    for (const auto& word : command) words.push_back(const_cast<char*>(word.c_str()));
    words.push_back(nullptr);
    ::execv(words[0], words.data());
    [[maybe_unused]] const ssize_t written = ::write(ends[1], "not started", 11);
    ::_exit(127);
  }
  answer_ = ReadAll(ends[0]);
  ::close(ends[0]);
}

Child::~Child() { End(); }

void Child::End() {
  if (id_ <= 0) return;
  ::kill(id_, SIGKILL);
  ::waitpid(id_, nullptr, 0);
  id_ = -1;
}

std::vector<std::string> AtOnce(const std::vector<std::function<std::string()>>& works) {
  int start[2];
  if (::pipe2(start, O_CLOEXEC) != 0) throw std::runtime_error("no pipe");
  std::vector<std::pair<pid_t, int>> running;
  for (const auto& work : works) {
    int ends[2];
    const pid_t id = Fork(ends);
    if (id == 0) {
      char go = 0;
      const std::string answer = ::read(start[0], &go, 1) == 1 ? work() : "not started";
      ::_exit(::write(ends[1], answer.data(), answer.size()) < 0);
    }
    running.emplace_back(id, ends[0]);
  }
  const std::string go(works.size(), 'g');
  [[maybe_unused]] const ssize_t told = ::write(start[1], go.data(), go.size());
  std::vector<std::string> answers;
  for (const auto& [id, end] : running) {
    answers.push_back(ReadAll(end));
    ::close(end);
    ::waitpid(id, nullptr, 0);
  }
  ::close(start[0]);
  ::close(start[1]);
  return answers;
}

ProcessWithoutFirstThread::ProcessWithoutFirstThread() {
  id_ = ::fork();
  if (id_ < 0) throw std::runtime_error("no process");
  if (id_ == 0) {
    ::alarm(60);
    std::thread([] {
      for (;;) ::pause();
    }).detach();
    ::syscall(SYS_exit, 0);
  }
  const ProcFolder proc;
  if (!Wait([&] { return proc.Stat(Id()).value_or(ProcessStat{}).state == 'Z'; }))
    throw std::runtime_error("the first thread does not end");
}

ProcessWithoutFirstThread::~ProcessWithoutFirstThread() {
  ::kill(id_, SIGKILL);
  ::waitpid(id_, nullptr, 0);
}

bool Wait(const std::function<bool()>& done) {
  for (int i = 0; i < 2000; ++i) {
    if (done()) return true;
    ::usleep(1000);
  }
  return done();
}

bool RunShell(const std::string& command) { return std::system((command + " >/dev/null 2>&1").c_str()) == 0; }

} // namespace quendra::platform::linux_
