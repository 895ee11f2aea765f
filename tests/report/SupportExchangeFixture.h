#pragma once

#include "report/ReportFixture.h"

namespace quendra::report::tests {

class SupportExchange : public ReportTest {
 protected:
  const std::string webHost = ToUtf8(settings::SupportServerWebHost);
  const std::string foreignHost = ToUtf8(settings::RequestHostHeader);
};

} // namespace quendra::report::tests
