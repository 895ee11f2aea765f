#include "foundation/SocketSuite.h"

namespace quendra::foundation {
namespace {

class HandlerSuite : public SocketSuite {};

QUENDRA_OVER_BOTH_NETWORKS(HandlerSuite);

TEST_P(HandlerSuite, A_handler_may_remove_its_own_index_in_each_event) {
  const auto remove = [&](const Variant& index) { program->ArrayRemove(index); };
  program->Events.Connect = remove;
  program->ArrayAdd(1);
  program->Connect(1, Text(u"127.0.0.1"), server->Port());
  ASSERT_TRUE(world->Until([&] { return program->ArrayCount() == 0; }));
  ASSERT_TRUE(world->Until([&] { return server->TakeConnection() != nullptr; }));
  program.Record(*program);

  const auto far = Connected(2);
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { remove(index); };
  far->Send("data");
  ASSERT_TRUE(world->Until([&] { return program->ArrayCount() == 0; }));

  const auto closing = Connected(3);
  program->Events.CloseSck = remove;
  closing->Close();
  ASSERT_TRUE(world->Until([&] { return program->ArrayCount() == 0; }));

  const auto taking = Connected(4);
  program->Events.SendProgress = [&](const Variant& index, std::int32_t, std::int32_t) { remove(index); };
  program->SendData(4, Text(u"data"));
  EXPECT_EQ(program->ArrayCount(), 0);

  program->Events.Error = [&](const Variant& index, auto&&...) { remove(index); };
  program->ArrayAdd(5);
  program->Connect(5, Text(u"127.0.0.1"), world->ClosedPort());
  ASSERT_TRUE(world->Until([&] { return program->ArrayCount() == 0; }));

  const std::int32_t port = Listening(6);
  program->Events.ConnectionRequest = [&](const Variant& index, platform::SocketHandle) { remove(index); };
  const auto dialler = world->Dial(port);
  ASSERT_TRUE(world->Until([&] { return program->ArrayCount() == 0 && dialler->Ended(); }));
  EXPECT_FALSE(world->Desktop.Ended);
  EXPECT_EQ(program.module.SocketWindow(), kNoWindow);
}

TEST_P(HandlerSuite, A_handler_may_end_the_object_in_DataArrival) {
  const auto far = Connected();
  bool ended = false;
  program->Events.DataArrival = [&](const Variant&, std::int32_t) {
    program.End();
    ended = true;
  };
  far->Send("data");
  ASSERT_TRUE(world->Until([&] { return ended; }));
  world->Settle();
  EXPECT_EQ(program.module.SocketClassCount(), 0);
  EXPECT_FALSE(world->Desktop.Ended);
}

TEST_P(HandlerSuite, A_handler_may_end_the_object_in_Connect_and_in_CloseSck) {
  bool ended = false;
  {
    const auto far = Connected();
    program->Events.CloseSck = [&](const Variant&) {
      program.End();
      ended = true;
    };
    far->Close();
    ASSERT_TRUE(world->Until([&] { return ended; }));
  }
  Program second(*world);
  ended = false;
  second->Events.Connect = [&](const Variant&) {
    second.End();
    ended = true;
  };
  second->ArrayAdd(1);
  second->Connect(1, Text(u"127.0.0.1"), server->Port());
  ASSERT_TRUE(world->Until([&] { return ended; }));
  world->Settle();
  EXPECT_FALSE(world->Desktop.Ended);
}

TEST_P(HandlerSuite, A_handler_may_end_the_object_in_SendProgress) {
  const auto far = Connected();
  program->Events.SendProgress = [&](const Variant&, std::int32_t, std::int32_t) { program.End(); };
  program->SendData(1, Text(u"data"));
  EXPECT_EQ(program.module.SocketClassCount(), 0);
  EXPECT_FALSE(program.Saw("SendComplete 1"));
}

TEST_P(HandlerSuite, A_handler_may_end_the_object_in_Error_even_if_it_asks_for_the_box) {
  bool ended = false;
  program->Events.Error = [&](const Variant&, std::int16_t, const Text&, std::int32_t, const Text&,
                              const Text&, std::int32_t, bool& cancelDisplay) {
    cancelDisplay = false;
    program.End();
    ended = true;
  };
  program->ArrayAdd(1);
  program->Connect(1, Text(u"127.0.0.1"), world->ClosedPort());
  ASSERT_TRUE(world->Until([&] { return ended; }));
  const forms::headless::HeadlessDesktop::Box box{u"Connection refused.", 0, u"CSocketPlus.PostSocket"};
  EXPECT_EQ(world->Desktop.Boxes, std::vector{box});
}

TEST_P(HandlerSuite, A_handler_may_end_the_object_in_ConnectionRequest) {
  const std::int32_t port = Listening(1);
  bool ended = false;
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle) {
    program.End();
    ended = true;
  };
  const auto far = world->Dial(port);
  ASSERT_TRUE(world->Until([&] { return ended && far->Ended(); }));
  EXPECT_EQ(program.module.SocketClassCount(), 0);
  EXPECT_EQ(program.module.SocketWindow(), kNoWindow);
}

TEST_P(HandlerSuite, A_handler_may_end_the_object_while_it_takes_a_connection) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  bool ended = false;
  program->Events.DataArrival = [&](const Variant&, std::int32_t) {
    program.End();
    ended = true;
  };
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    const auto pending = program.module.GetAcceptClass(request);
    world->Until([&] { return pending->BytesReceived(Text(u"Temporal_Socket")) == 3; });
    program->Accept(2, request);
  };
  const auto far = world->Dial(port);
  far->Send("now");
  ASSERT_TRUE(world->Until([&] { return ended; }));
  world->Settle();
  EXPECT_EQ(program.module.SocketClassCount(), 0);
}

TEST_P(HandlerSuite, An_ending_object_closes_its_sockets_and_its_window) {
  const auto far = Connected();
  program.End();
  EXPECT_TRUE(world->Until([&] { return far->Ended(); }));
  EXPECT_EQ(world->Desktop.Windows.Count(), 0);
}

TEST_P(HandlerSuite, Sixty_four_look_ups_at_once_all_connect) {
  for (std::int32_t i = 1; i <= 64; ++i) {
    program->ArrayAdd(i);
    program->Connect(i, Text(u"localhost"), server->Port());
  }
  EXPECT_EQ(program.module.ResolveCount(), 64);
  std::vector<std::unique_ptr<FarEnd>> ends;
  EXPECT_TRUE(world->Until([&] {
    if (auto far = server->TakeConnection()) ends.push_back(std::move(far));
    return std::count_if(program.Events.begin(), program.Events.end(),
                         [](const auto& event) { return event.starts_with("Connect "); }) == 64;
  }));
}

} // namespace
} // namespace quendra::foundation
