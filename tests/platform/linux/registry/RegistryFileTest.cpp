#include "platform/linux/registry/RegistryFile.h"

#include "platform/linux/registry/LinuxRegistryFixture.h"
#include "platform/linux/system/Descriptor.h"

#include <poll.h>
#include <signal.h>
#include <sqlite3.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <stdexcept>

namespace quendra::platform::linux_ {
namespace {

struct RegistryFileTest : LinuxRegistryTest {
  /// A registry with a key and a value of many pages; gives what the file holds.
  std::string MakeFile() {
    auto registry = Registry();
    EXPECT_EQ(Write(registry, "One", 7), kRegistrySuccess);
    EXPECT_EQ(registry.RegSetValueExA(kCurrentUser, "big", kRegBinary, Bytes(50'000, 3)), kRegistrySuccess);
    return Content(file);
  }
};

TEST_F(RegistryFileTest, A_write_that_was_torn_off_is_as_if_it_never_began) {
  {
    auto registry = Registry();
    ASSERT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  }
  // A program that ends in the midst of a change whose pages are in the file already.
  Child([&] {
    sqlite3* database = nullptr;
    sqlite3_open(file.c_str(), &database);
    sqlite3_exec(database, "PRAGMA cache_size = 1; BEGIN; UPDATE data SET bytes = zeroblob(200000)", nullptr,
                 nullptr, nullptr);
    return std::string("torn");
  }).End();
  ASSERT_TRUE(std::filesystem::exists(file + "-journal"));
  auto registry = Registry();

  EXPECT_EQ(Read(registry, "One"), 1u);
  EXPECT_TRUE(told.empty());
}

TEST_F(RegistryFileTest, A_broken_file_is_kept_under_another_name_and_told_of_once) {
  const std::string rubbish = "not a database at all, " + std::string(5000, 'x');
  folder.Write("quendra/registry.sqlite", rubbish);
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  EXPECT_EQ(Read(registry, "One"), 1u);

  EXPECT_EQ(Content(file + ".damaged-1"), rubbish);
  EXPECT_EQ(told, std::vector{file + ".damaged-1"});
}

TEST_F(RegistryFileTest, A_second_broken_file_doesnt_overwrite_the_first) {
  const std::string one = "one, " + std::string(5000, 'x');
  const std::string two = "two, " + std::string(5000, 'x');
  for (const auto& rubbish : {one, two}) {
    folder.Write("quendra/registry.sqlite", rubbish);
    auto registry = Registry();
    EXPECT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  }
  EXPECT_EQ(Content(file + ".damaged-1"), one);
  EXPECT_EQ(Content(file + ".damaged-2"), two);
}

TEST_F(RegistryFileTest, A_file_with_a_damaged_page_is_put_aside_whole) {
  {
    auto registry = Registry();
    ASSERT_EQ(Write(registry, "1", 1), kRegistrySuccess);
    ASSERT_EQ(registry.RegSetValueExA(kCurrentUser, "big", kRegBinary, Bytes(50'000)), kRegistrySuccess);
  }
  std::string content = Content(file);
  ASSERT_GT(content.size(), 8192u);
  for (std::size_t at = 4096; at < content.size(); ++at) content[at] = '\x5A';
  std::ofstream(file, std::ios::binary) << content;
  auto registry = Registry();

  EXPECT_EQ(Read(registry, "1"), 1000u + kKeyNotFound);
  EXPECT_EQ(Content(file + ".damaged-1"), content);
  EXPECT_EQ(told.size(), 1u);
}

TEST_F(RegistryFileTest, A_file_of_a_later_edition_is_left_alone) {
  {
    auto registry = Registry();
    Write(registry, "One", 1);
  }
  sqlite3* other = nullptr;
  ASSERT_EQ(sqlite3_open(file.c_str(), &other), SQLITE_OK);
  sqlite3_exec(other, "PRAGMA user_version = 2", nullptr, nullptr, nullptr);
  sqlite3_close(other);
  const std::string before = Content(file);
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 2), kRegistryBroken);
  EXPECT_EQ(Content(file), before);
  EXPECT_TRUE(told.empty());
}

TEST_F(RegistryFileTest, An_empty_file_becomes_a_fresh_registry) {
  folder.Write("quendra/registry.sqlite", "");
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  EXPECT_TRUE(told.empty());
}

TEST_F(RegistryFileTest, A_pipe_at_the_files_place_is_not_waited_on) {
  std::filesystem::create_directory(folder / "quendra");
  ASSERT_EQ(::mkfifo(file.c_str(), 0600), 0);
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistryBroken);
}

TEST_F(RegistryFileTest, A_file_that_was_cut_off_anywhere_is_put_aside_whole) {
  const std::string whole = MakeFile();
  int number = 0;
  for (const std::size_t length :
       {std::size_t{2}, std::size_t{15}, std::size_t{99}, std::size_t{100}, std::size_t{4095},
        std::size_t{4096}, std::size_t{8192}, whole.size() / 2, whole.size() - 4096}) {
    std::ofstream(file, std::ios::binary) << whole.substr(0, length);
    told.clear();
    auto registry = Registry();

    EXPECT_EQ(Write(registry, "Two", 2), kRegistrySuccess) << length;
    EXPECT_EQ(Read(registry, "Two"), 2U) << length;

    const std::string kept = file + ".damaged-" + std::to_string(++number);
    EXPECT_EQ(told, std::vector{kept}) << length;
    EXPECT_TRUE(Content(kept) == whole.substr(0, length)) << length;
  }
}

TEST_F(RegistryFileTest, A_folder_at_the_files_place_is_an_error_and_stays) {
  folder.Write("quendra/registry.sqlite/inside", "content");
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistryBroken);
  EXPECT_EQ(Read(registry, "One"), 1000U + kRegistryBroken);
  EXPECT_EQ(Content(file + "/inside"), "content");
  EXPECT_TRUE(told.empty());
}

/// What a user gets who may look into the folder and write nothing there.
std::string AsReader(const std::function<std::string()>& work) {
  return Child([&] {
           if (::geteuid() == 0 && (::setgid(65534) != 0 || ::setuid(65534) != 0))
             return std::string("no other user");
           return work();
         })
      .Answer();
}

TEST_F(RegistryFileTest, A_folder_that_can_only_be_read_tells_its_values_and_takes_none) {
  MakeFile();
  ASSERT_EQ(::chmod((folder / "quendra").c_str(), 0555), 0);
  ASSERT_EQ(::chmod(file.c_str(), 0444), 0);

  EXPECT_EQ(AsReader([&] {
              auto registry = Registry();
              std::string answer = std::to_string(Read(registry, "One"));
              answer += " " + std::to_string(Write(registry, "One", 1));
              return answer + " " + std::to_string(Read(registry, "One"));
            }),
            "7 5 7");
}

TEST_F(RegistryFileTest, A_damaged_file_in_a_folder_that_can_only_be_read_is_an_error_and_stays) {
  const std::string rubbish(5000, 'x');
  folder.Write("quendra/registry.sqlite", rubbish);
  ASSERT_EQ(::chmod((folder / "quendra").c_str(), 0555), 0);

  EXPECT_EQ(AsReader([&] {
              auto registry = Registry();
              const auto error = Write(registry, "One", 1);
              return std::to_string(error) + " " + std::to_string(told.size());
            }),
            std::to_string(kRegistryBroken) + " 0");
  EXPECT_EQ(Content(file), rubbish);
}

/// A program that writes one value after the other, each of many pages of one byte, until it is killed.
class Writer {
 public:
  Writer(LinuxRegistry& registry, std::uint8_t first) {
    int ends[2];
    if (::pipe(ends) != 0) throw std::runtime_error("no pipe");
    id_ = ::fork();
    if (id_ == 0) WriteOn(registry, first, ends[1]);
    ::close(ends[1]);
    written_ = Descriptor(ends[0]);
  }
  ~Writer() { Kill(); }
  Writer(const Writer&) = delete;

  /// Kills it as soon as so many values are written; gives the last one that it had written for sure.
  std::uint8_t KillAfter(int count) {
    std::uint8_t last = 0;
    pollfd ready{written_.Number(), POLLIN, 0};
    for (int i = 0; i < count; ++i)
      if (::poll(&ready, 1, 10'000) <= 0 || ::read(written_.Number(), &last, 1) != 1)
        throw std::runtime_error("nothing is written");
    Kill();
    // What it wrote between.
    while (::read(written_.Number(), &last, 1) == 1) {
    }
    return last;
  }

 private:
  [[noreturn]] static void WriteOn(LinuxRegistry& registry, std::uint8_t value, int report) {
    ::alarm(60);
    for (;; ++value)
      if (registry.RegSetValueExA(kCurrentUser, "v", kRegBinary, std::vector(30'000, value)) != 0 ||
          ::write(report, &value, 1) != 1)
        ::_exit(1);
  }
  void Kill() {
    if (id_ <= 0) return;
    ::kill(id_, SIGKILL);
    ::waitpid(id_, nullptr, 0);
    id_ = -1;
  }

  pid_t id_ = -1;
  Descriptor written_;
};

TEST_F(RegistryFileTest, A_program_that_is_killed_amid_many_writes_leaves_the_last_value_whole) {
  for (int round = 0; round < 30; ++round) {
    // Not opened before the fork: a database must not be carried into another process.
    auto registry = Registry();
    const auto first = static_cast<std::uint8_t>(round * 8);

    const std::uint8_t last = Writer(registry, first).KillAfter(1 + round % 7);

    std::uint32_t type = 0;
    std::uint32_t size = 0;
    Bytes data(30'000);
    ASSERT_EQ(registry.RegQueryValueExA(kCurrentUser, "v", type, data, size), kRegistrySuccess) << round;
    // The one after may have been written, too, with no time to say so.
    EXPECT_LE(static_cast<std::uint8_t>(data[0] - last), 1) << round;
    EXPECT_TRUE(data == Bytes(30'000, data[0])) << round;
  }
  EXPECT_TRUE(told.empty());
}

TEST_F(RegistryFileTest, Programs_that_find_the_damage_at_once_put_the_file_aside_once) {
  const std::string rubbish(5000, 'x');
  const std::vector<std::string> names{"One", "Other", "Third"};
  for (int round = 1; round <= 10; ++round) {
    folder.Write("quendra/registry.sqlite", rubbish);
    std::vector<std::function<std::string()>> programs;
    for (const auto& name : names)
      programs.emplace_back([this, name] {
        auto registry = Registry();
        const auto error = Write(registry, name, 1);
        return std::to_string(error) + " told " + std::to_string(told.size());
      });

    auto answers = AtOnce(programs);

    std::ranges::sort(answers);
    EXPECT_EQ(answers, (std::vector<std::string>{"0 told 0", "0 told 0", "0 told 1"})) << round;
    EXPECT_EQ(Content(file + ".damaged-" + std::to_string(round)), rubbish);
    auto registry = Registry();
    for (const auto& name : names) EXPECT_EQ(Read(registry, name), 1U) << round;
  }
}

} // namespace
} // namespace quendra::platform::linux_
