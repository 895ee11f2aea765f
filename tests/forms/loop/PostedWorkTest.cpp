#include "forms/loop/PostedWork.h"

#include <gtest/gtest.h>

#include <string>

namespace quendra::forms {
namespace {

struct PostedWorkTest : testing::Test {
  void RunWaiting() { posted.RunWaiting(run); }
  void Add(const std::string& name) {
    posted.Add([this, name] { ran += name; });
  }

  PostedWork posted;
  PostedWork::Run run = [](const PostedWork::Work& work) { work(); };
  std::string ran;
};

TEST_F(PostedWorkTest, Work_runs_in_the_order_in_which_it_was_added) {
  Add("a");
  Add("b");
  EXPECT_FALSE(posted.IsEmpty());

  RunWaiting();

  EXPECT_EQ(ran, "ab");
  EXPECT_TRUE(posted.IsEmpty());
}

TEST_F(PostedWorkTest, What_work_adds_waits_for_the_next_call) {
  std::function<void()> again = [&] {
    ran += "x";
    posted.Add(again);
  };
  posted.Add(again);

  RunWaiting();
  EXPECT_EQ(ran, "x");
  RunWaiting();

  EXPECT_EQ(ran, "xx");
}

TEST_F(PostedWorkTest, Work_that_pumps_lets_the_work_after_it_run_first) {
  posted.Add([&] {
    RunWaiting();
    ran += "first";
  });
  Add("second ");

  RunWaiting();

  EXPECT_EQ(ran, "second first");
}

TEST_F(PostedWorkTest, What_is_added_after_an_inner_call_waits_for_the_next_outer_one_too) {
  posted.Add([&] {
    RunWaiting();
    Add("late");
  });
  Add("waiting ");

  RunWaiting();
  EXPECT_EQ(ran, "waiting ");
  RunWaiting();

  EXPECT_EQ(ran, "waiting late");
}

TEST_F(PostedWorkTest, One_piece_may_be_taken_at_a_time) {
  Add("a");
  Add("b");

  posted.RunNext(run);
  EXPECT_EQ(ran, "a");
  posted.RunNext(run);
  posted.RunNext(run);

  EXPECT_EQ(ran, "ab");
}

TEST_F(PostedWorkTest, Work_that_an_ended_program_refuses_is_gone_all_the_same) {
  Add("a");
  run = [](const PostedWork::Work&) {};

  RunWaiting();

  EXPECT_TRUE(posted.IsEmpty());
  EXPECT_EQ(ran, "");
}

} // namespace
} // namespace quendra::forms
