#include "report/live/LiveFixture.h"

namespace quendra::report {
namespace {

/// Web servers from the distribution, which read the requests by their own rules.
class WebServers : public LiveReportTest {
 protected:
  static constexpr const char* kMissing = "isn't installed; scripts/setup installs it";
};

class Nginx : public WebServers {
 protected:
  std::unique_ptr<Peer> Start() {
    const std::string config =
        Write("nginx.conf", "daemon off; user root; worker_processes 1;\n"
                            "pid " +
                                folder + "/pid; error_log " + folder +
                                "/log;\n"
                                "events { worker_connections 64; }\n"
                                "http { access_log off; default_type text/plain;\n"
                                "  client_body_temp_path " +
                                folder +
                                "/bodies;\n"
                                "  proxy_temp_path " +
                                folder +
                                "/proxy;\n"
                                "  server { listen 127.0.0.1:80;\n"
                                "    location = /getid.asp { return 200 \"~~~~~~~~\\r\\n4711\"; }\n"
                                "    location = /procreport.asp {\n"
                                "      client_body_in_file_only on; proxy_pass http://127.0.0.1:8081/; } }\n"
                                "  server { listen 127.0.0.1:8081; location / { return 200 \"~OK\"; } } }\n");
    auto peer =
        std::make_unique<Peer>(std::vector<std::string>{"nginx", "-e", folder + "/log", "-c", config});
    peer->AwaitPort(80);
    return peer;
  }
};

TEST_F(Nginx, Answers_the_GET_and_takes_the_POST_as_they_are_sent) {
  if (PathOfProgram("nginx").empty()) GTEST_SKIP() << "nginx " << kMissing;
  const auto server = Start();
  OpenPage();

  ASSERT_TRUE(ClickAndAwaitBoxes(2));

  EXPECT_EQ(desktop.Boxes[0].text, kNumberIs + u"4711");
  EXPECT_EQ(program->supportExchange.ReportReply.substr(0, 17), u"HTTP/1.1 200 OK\r\n");
  EXPECT_EQ(desktop.Boxes[1].text, kSuccess);
  EXPECT_EQ(ContentOfOnlyFileIn(folder + "/bodies"), bodySent);
}

class Apache : public WebServers {
 protected:
  std::unique_ptr<Peer> Start(const std::string& options) {
    Write("pages/getid.asp", "~~~~~~~~\r\n4712");
    Write("kept/folder", "");
    const std::string script = Write("scripts/report.sh",
                                     "#!/bin/sh\ncat > " + folder +
                                         "/kept/body\n"
                                         "printf 'Content-Type: text/plain\\r\\n\\r\\n~OK'\n",
                                     true);
    std::string modules;
    for (const char* module : {"mpm_prefork", "authz_core", "alias", "cgi"})
      modules +=
          std::string("LoadModule ") + module + "_module /usr/lib/apache2/modules/mod_" + module + ".so\n";
    const std::string config = Write(
        "apache.conf", "ServerRoot " + folder + "\nServerName localhost\nListen 127.0.0.1:80\n" + modules +
                           "PidFile " + folder + "/pid\nErrorLog " + folder + "/log\nUser nobody\n" +
                           "Group nogroup\nStartServers 2\nDocumentRoot " + folder + "/pages\n" +
                           "ScriptAlias /procreport.asp " + script + "\n" + options);
    auto peer = std::make_unique<Peer>(std::vector<std::string>{"apache2", "-DFOREGROUND", "-f", config});
    peer->AwaitPort(80);
    return peer;
  }
};

TEST_F(Apache, Refuses_the_blank_behind_the_version_while_it_is_strict) {
  if (PathOfProgram("apache2").empty()) GTEST_SKIP() << "apache2 " << kMissing;
  const auto server = Start("HttpProtocolOptions Strict\n");
  OpenPage();

  ASSERT_TRUE(ClickAndAwaitBoxes(2));

  // Its refusal has no mark, so it counts as a number from its tenth character on.
  EXPECT_EQ(desktop.Boxes[0].text.substr(0, kNumberIs.size() + 17), kNumberIs + u"400 Bad Request\r\n");
  EXPECT_EQ(program->supportExchange.ReportReply.substr(0, 26), u"HTTP/1.1 400 Bad Request\r\n");
  EXPECT_EQ(desktop.Boxes[1].text, kFailure);
  EXPECT_FALSE(std::filesystem::exists(folder + "/kept/body"));
}

TEST_F(Apache, Answers_the_GET_and_takes_the_POST_when_it_is_not_strict) {
  if (PathOfProgram("apache2").empty()) GTEST_SKIP() << "apache2 " << kMissing;
  const auto server = Start("HttpProtocolOptions Unsafe\n");
  OpenPage();

  ASSERT_TRUE(ClickAndAwaitBoxes(2));

  EXPECT_EQ(desktop.Boxes[0].text, kNumberIs + u"4712");
  EXPECT_EQ(program->supportExchange.ReportReply.substr(0, 17), u"HTTP/1.1 200 OK\r\n");
  EXPECT_EQ(desktop.Boxes[1].text, kSuccess);
  EXPECT_EQ(ContentOf(folder + "/kept/body"), bodySent);
}

} // namespace
} // namespace quendra::report
