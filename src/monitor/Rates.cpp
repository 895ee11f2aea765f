#include "monitor/Rates.h"

#include "monitor/ProcessRow.h"
#include "runtime/Format.h"
#include "runtime/Integers.h"

namespace quendra::monitor {

namespace {

/// The formats pad with zeros so that the sort by text puts the rates in order.
constexpr TextView kUploadFormat = u"###00.00";
constexpr TextView kDownloadFormat = u"##000.00";
constexpr TextView kTotalFormat = u"####0.00";

struct Direction {
  ProcessCell cell;
  ProcessCell previous;
  TextView format;
};

constexpr Direction kUpload{kUploadCell, kPreviousUploadCell, kUploadFormat};
constexpr Direction kDownload{kDownloadCell, kPreviousDownloadCell, kDownloadFormat};

double UpdateRate(forms::ListRow& row, const Direction& direction, double seconds) {
  const Variant& total = row.CellTag(direction.cell);
  const double rate = Quotient(total.Number() - row.CellTag(direction.previous).Number(), seconds);
  row.SetCellText(direction.cell, rate > 0 ? Format(rate, direction.format) : Text());
  row.CellTag(direction.previous) = total;
  return rate;
}

} // namespace

void UpdateRates(forms::ListRow& row, double seconds, TrafficSums& sums) {
  const double upload = UpdateRate(row, kUpload, seconds);
  sums.upload += upload;
  const double download = UpdateRate(row, kDownload, seconds);
  sums.download += download;
  const double total = upload + download;
  row.SetCellText(kTotalCell, total != 0 ? Format(total, kTotalFormat) : Text());
}

Text MeterText(double sum) { return sum > 0 ? Format(sum, kUploadFormat) : u"0.0"; }

} // namespace quendra::monitor
