#pragma once

#include "diagnostics/LocalChecks.h"
#include "diagnostics/ProbeTexts.h"
#include "runtime/Settings.h"

#include <array>

namespace quendra::diagnostics {

/// A check that is a network exchange: whom it connects to and what it says there. Any first bytes from the
/// server are a pass.
struct Exchange {
  const char16_t* host = nullptr;
  std::int16_t port = 0;
  const char16_t* request = nullptr;
};

/// A surf check: either an exchange or, with `run`, a local one.
struct Check {
  const char16_t* caption;
  const char16_t* captionKey;
  Exchange exchange{};
  Outcome (*run)(LocalChecks& checks, CheckRows& rows) = nullptr;
};

/// In the order in which they run. The first one goes to a name and the second one to an address on purpose:
/// the first fails where name service is down, the second doesn't depend on it.
inline constexpr std::array kCheckTable{
    Check{u"DNS תקשורת עם שרת", u"b0", {settings::ProbeWebHost, kWebPort, kWebRequest}},
    Check{u"Web תקשורת עם שרת", u"b0", {settings::ProbeWebAddress, kWebPort, kWebRequest}},
    Check{
        u"תקשורת עם שרת דואר נכנס", u"b0", {settings::IspMailHost, kIncomingMailPort, kIncomingMailRequest}},
    Check{
        u"תקשורת עם שרת דואר יוצא", u"b0", {settings::IspMailHost, kOutgoingMailPort, kOutgoingMailRequest}},
    Check{u"מחיקת קבצי אינטרנט זמניים",
          u"",
          {},
          [](LocalChecks& checks, CheckRows& rows) { return checks.cache.Run(rows); }},
    Check{u"ניצולת מעבד",
          u"",
          {},
          [](LocalChecks& checks, CheckRows& rows) { return checks.processor.Run(rows); }},
    Check{u"ניצולת רשת", u"", {}, [](LocalChecks& checks, CheckRows& rows) { return checks.line.Run(rows); }},
    Check{u"תוכנות שיתוף קבצים",
          u"",
          {},
          [](LocalChecks& checks, CheckRows& rows) { return checks.sharing.Run(rows); }},
};

inline constexpr std::size_t kCheckCount = kCheckTable.size();

} // namespace quendra::diagnostics
