#pragma once

#include "forms/controls/ListView.h"
#include "runtime/Text.h"

namespace quendra::report {

/// "GET http://" host path and its headers. The blank after the version belongs to the request.
Text GetRequest(TextView host, TextView path);

/// The process table as records: seven fields in a row, "|" between them and "}" after the last.
/// In every field but the first a comma becomes "~".
Text ProcessRecords(const forms::ListView& table);

/// The report's body under its number.
Text ReportBody(TextView reportNumber, const forms::ListView& table);

/// The request that posts a body: headers, body, and two line ends that the stated length doesn't count.
/// The length counts characters: each becomes one byte.
Text PostRequest(const Text& body);

/// The report number in a reply: what follows "~~~~~~~~" and two characters of line end; without that
/// mark, what stands from the tenth character on.
Text ReportNumberIn(TextView reply);

} // namespace quendra::report
