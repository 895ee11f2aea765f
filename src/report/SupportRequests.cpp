#include "report/SupportRequests.h"

#include "monitor/ProcessRow.h"
#include "runtime/Settings.h"

namespace quendra::report {

namespace {

constexpr const char16_t* kLineEnd = u"\r\n";
constexpr TextView kNumberMark = u"~~~~~~~~";
constexpr std::size_t kMarkAndLineEnd = 10;

} // namespace

Text GetRequest(TextView host, TextView path) {
  return Text(u"GET http://").append(host).append(path) + u" HTTP/1.1 " + kLineEnd + u"Host: " +
         settings::RequestHostHeader + kLineEnd + u"Connection: Close" + kLineEnd + u"Accept: */*" +
         kLineEnd + kLineEnd;
}

Text ProcessRecords(const forms::ListView& table) {
  Text records;
  for (int index = 1; index <= table.Count(); ++index) {
    const forms::ListRow& row = table.Row(index);
    records += row.CellText(monitor::kApplicationCell);
    for (int cell = monitor::kNameCell; cell <= monitor::kTotalCell; ++cell)
      records.append(u"|").append(Replaced(row.CellText(cell), u",", u"~"));
    records += u"}";
  }
  return records;
}

Text ReportBody(TextView reportNumber, const forms::ListView& table) {
  return Text(u"id=").append(reportNumber).append(u"&procs=").append(ProcessRecords(table));
}

Text PostRequest(const Text& body) {
  return Text(u"POST http://") + settings::SupportServerHost + u"/procreport.asp" + u" HTTP/1.1 " + kLineEnd +
         u"Host: " + settings::SupportServerWebHost + kLineEnd +
         u"Content-Type: application/x-www-form-urlencoded" + kLineEnd + u"Content-Length: " +
         DecimalText(static_cast<std::int64_t>(body.size())) + kLineEnd + u"Connection: Close" + kLineEnd +
         u"Accept: */*" + kLineEnd + kLineEnd + body + kLineEnd + kLineEnd;
}

Text ReportNumberIn(TextView reply) {
  const auto mark = reply.find(kNumberMark);
  // Positions count from 1, and a missing mark counts as position 0.
  const std::size_t start = mark == TextView::npos ? kMarkAndLineEnd - 1 : mark + kMarkAndLineEnd;
  return start < reply.size() ? Text(reply.substr(start)) : Text();
}

} // namespace quendra::report
