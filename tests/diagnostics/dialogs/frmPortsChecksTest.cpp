#include "diagnostics/dialogs/frmPortsChecks.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

class PortsChecks : public SurfTest {
 protected:
  void OpenDialog() {
    ComeHome();
    ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));
    ASSERT_TRUE(desktop.Click(program.monitorPage.main_cmdChecks));
    Run();
  }
  std::vector<Text> Results() const {
    return {dialog.Label3.Caption, dialog.Label4.Caption, dialog.Label6.Caption};
  }

  frmPortsChecks& dialog = program.frmPortsChecks;
};

TEST_F(PortsChecks, The_dialog_says_which_ports_it_tries) {
  OpenDialog();

  EXPECT_EQ(dialog.Caption(), u"בדיקת פורטים");
  EXPECT_EQ(dialog.Label1.Caption(), u"פורט 80 (גלישה/HTTP):");
  EXPECT_EQ(dialog.Label2.Caption(), u"פורט 25 (דואר/SMTP):");
  EXPECT_EQ(dialog.Label5.Caption(), u"פורט 110 (דואר/POP3):");
  EXPECT_EQ(dialog.Command1.Caption(), u"בדוק...");
  EXPECT_EQ(dialog.Command2.Caption(), u"סגור");
}

TEST_F(PortsChecks, Stands_before_the_main_window_as_a_modal_dialog) {
  int depth = 0;
  desktop.OnModal = [&](forms::Form& form) {
    EXPECT_EQ(&form, &dialog);
    depth = desktop.ModalDepth();
  };

  OpenDialog();

  EXPECT_EQ(depth, 1);
}

TEST_F(PortsChecks, The_three_probes_run_at_once_and_say_what_they_have_to) {
  WebByName();
  OutgoingMail();
  IncomingMail();

  OpenDialog();

  EXPECT_EQ(Connection(WebByName()).Received, "GET / HTTP/1.0\n\n");
  EXPECT_EQ(Connection(OutgoingMail()).Received, "HELO localhost");
  EXPECT_EQ(Connection(IncomingMail()).Received, "USER temp");
  EXPECT_EQ(Results(), std::vector<Text>(3));
}

TEST_F(PortsChecks, A_reply_in_one_piece_of_1024_bytes_is_one_kilobyte_in_green) {
  OutgoingMail().Greet(std::string(1024, 'x'));

  OpenDialog();

  EXPECT_EQ(dialog.Label4.Caption(), u"OK! (1.00 KB)");
  EXPECT_EQ(dialog.Label4.ForeColour(), 32768u);
  EXPECT_EQ(dialog.Label4.Tag(), u"1");
}

TEST_F(PortsChecks, Each_further_piece_adds_the_whole_that_waits_in_the_socket) {
  WebByName();
  OpenDialog();
  Connection(WebByName()).Send(std::string(1024, 'x'));
  Run();

  Connection(WebByName()).Send(std::string(512, 'x'));
  Run();

  EXPECT_EQ(dialog.Label3.Caption(), u"OK! (2.50 KB)");
  EXPECT_EQ(program.frmPortsChecks.Sockets()->BytesReceived(std::int16_t{1}), 1536);
}

TEST_F(PortsChecks, One_byte_shows_as_nothing_after_the_point) {
  IncomingMail().Greet("+");

  OpenDialog();

  EXPECT_EQ(dialog.Label6.Caption(), u"OK! (0.00 KB)");
  EXPECT_EQ(dialog.Label6.Tag(), u"0.0009765625");
}

TEST_F(PortsChecks, A_refused_port_shows_its_error_in_red_without_a_box) {
  WebByName().Refuse();

  OpenDialog();

  EXPECT_EQ(dialog.Label3.Caption(), u"ERROR: 10061 - Connection refused.");
  EXPECT_EQ(dialog.Label3.ForeColour(), 255u);
  EXPECT_EQ(dialog.Label3.Tag(), u"0");
  EXPECT_EQ(dialog.Sockets()->State(std::int16_t{1}), foundation::sckClosed);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(PortsChecks, A_name_that_fails_shows_its_error_for_each_probe_that_needs_it) {
  machine.sockets.FailName(mailName, 11001);

  OpenDialog();

  EXPECT_EQ(dialog.Label4.Caption(), u"ERROR: 11001 - Host not found.");
  EXPECT_EQ(dialog.Label6.Caption(), u"ERROR: 11001 - Host not found.");
}

TEST_F(PortsChecks, A_filtered_port_shows_nothing_until_the_system_gives_up) {
  WebByName().StaySilent();
  OpenDialog();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(dialog.Label3.Caption(), u"");
}

TEST_F(PortsChecks, A_silent_server_leaves_its_label_empty) {
  WebByName();
  OpenDialog();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(dialog.Label3.Caption(), u"");
  EXPECT_EQ(dialog.Sockets()->State(std::int16_t{1}), foundation::sckConnected);
}

TEST_F(PortsChecks, An_error_after_data_replaces_the_good_news_and_the_amount) {
  WebByName();
  OpenDialog();
  Connection(WebByName()).Send("some data");
  Run();
  ASSERT_EQ(dialog.Label3.ForeColour(), 32768u);

  Connection(WebByName()).Reset();
  Run();

  EXPECT_EQ(dialog.Label3.Caption(), u"ERROR: 10054 - Connection reset by peer.");
  EXPECT_EQ(dialog.Label3.ForeColour(), 255u);
  EXPECT_EQ(dialog.Label3.Tag(), u"0");
}

TEST_F(PortsChecks, A_close_of_the_server_closes_the_socket_and_leaves_what_is_shown) {
  WebByName().Answer({"HTTP/1.0 200 OK\r\n\r\n"}).Close();

  OpenDialog();

  EXPECT_EQ(dialog.Label3.Caption(), u"OK! (0.02 KB)");
  EXPECT_EQ(dialog.Sockets()->State(std::int16_t{1}), foundation::sckClosed);
}

TEST_F(PortsChecks, A_close_without_a_byte_leaves_the_label_empty) {
  WebByName().Close();

  OpenDialog();

  EXPECT_EQ(dialog.Label3.Caption(), u"");
  EXPECT_EQ(dialog.Sockets()->State(std::int16_t{1}), foundation::sckClosed);
}

TEST_F(PortsChecks, A_second_click_drops_the_probes_under_way_and_starts_anew) {
  WebByName();
  OpenDialog();

  desktop.Click(dialog.Command1);
  Run();

  ASSERT_EQ(WebByName().Connections.size(), 2u);
  EXPECT_TRUE(WebByName().Connections[0]->Ended);
  WebByName().Connections[0]->Send("late");
  Run();
  EXPECT_EQ(dialog.Label3.Caption(), u"");
  WebByName().Connections[1]->Send("in time");
  Run();
  EXPECT_EQ(dialog.Label3.Caption(), u"OK! (0.01 KB)");
}

TEST_F(PortsChecks, A_former_result_stays_in_its_colour_until_the_new_one_comes) {
  WebByName().Refuse();
  OpenDialog();
  WebByName() = platform::simulated::SimulatedServer();

  desktop.Click(dialog.Command1);
  Run();

  EXPECT_EQ(dialog.Label3.Caption(), u"ERROR: 10061 - Connection refused.");
  EXPECT_EQ(dialog.Label3.ForeColour(), 255u);
  EXPECT_EQ(dialog.Label3.Tag(), u"0");
  Connection(WebByName()).Send("x");
  Run();
  EXPECT_EQ(dialog.Label3.ForeColour(), 32768u);
}

TEST_F(PortsChecks, The_close_button_unloads_the_dialog_and_ends_its_sockets) {
  WebByName();
  OpenDialog();

  desktop.Click(dialog.Command2);

  EXPECT_FALSE(dialog.IsLoaded());
  EXPECT_EQ(dialog.Sockets(), nullptr);
  EXPECT_TRUE(Connection(WebByName()).Ended);
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(PortsChecks, Is_closed_while_names_are_looked_up_and_connections_tried_with_nothing_left_over) {
  machine.sockets.NeverAnswer(mailName);
  OpenDialog();
  ASSERT_GT(machine.sockets.LookUpsUnderWay(), 0);

  desktop.CloseBox(dialog);
  Run();

  EXPECT_FALSE(dialog.IsLoaded());
  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 0);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
  EXPECT_EQ(Results(), std::vector<Text>(3));
}

TEST_F(PortsChecks, Is_closed_while_no_connection_is_answered_with_nothing_left_over) {
  for (auto* server : {&WebByName(), &OutgoingMail(), &IncomingMail()}) server->StaySilent();
  OpenDialog();
  ASSERT_EQ(machine.sockets.OpenSockets(), 3);

  desktop.Click(dialog.Command2);
  Run();

  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
}

TEST_F(PortsChecks, Is_closed_as_its_answers_come_and_hears_of_none) {
  WebByName();
  OutgoingMail();
  IncomingMail();
  OpenDialog();
  Connection(WebByName()).Send("x");
  Connection(OutgoingMail()).Reset();
  Connection(IncomingMail()).Close();

  desktop.Click(dialog.Command2);
  Run();

  EXPECT_EQ(Results(), std::vector<Text>(3));
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(PortsChecks, Goes_with_the_program_that_ends_while_it_stands) {
  WebByName();
  desktop.OnModal = [&](forms::Form&) {
    desktop.RunUntilIdle();
    desktop.End();
  };

  OpenDialog();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(PortsChecks, Without_any_socket_left_each_port_shows_its_error_at_once) {
  machine.sockets.Fail("socket", 10024, 6);

  OpenDialog();

  EXPECT_EQ(Results(), std::vector<Text>(3, u"ERROR: 10024 - Too many open files."));
  for (const forms::Label* label : {&dialog.Label3, &dialog.Label4, &dialog.Label6})
    EXPECT_EQ(label->ForeColour(), 255u);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(PortsChecks, A_dialog_that_was_closed_opens_afresh) {
  WebByName().Refuse();
  OpenDialog();
  desktop.Click(dialog.Command2);
  WebByName() = platform::simulated::SimulatedServer();

  desktop.Click(program.monitorPage.main_cmdChecks);
  Run();

  EXPECT_EQ(dialog.Label3.Caption(), u"");
  EXPECT_EQ(WebByName().Connections.size(), 1u);
}

} // namespace
} // namespace quendra::diagnostics
