#include "capture/CaptureState.h"

#include "runtime/Text.h"

namespace quendra::capture {

namespace {

Text TwoDigits(std::int32_t number) { return PaddedLeft(DecimalText(number), 2, u'0'); }

/// As in "14:32".
Text ClockText(std::int32_t secondOfDay) {
  const std::int32_t minutes = secondOfDay / 60;
  return TwoDigits(minutes / 60) + u":" + TwoDigits(minutes % 60);
}

Text GoneText(std::optional<std::int32_t> since) {
  return since ? u"ההתקן נותק בשעה " + ClockText(*since) : u"ההתקן אינו מחובר";
}

} // namespace

Text CaptureStateText(platform::CaptureLibrary::Availability availability,
                      std::optional<std::int32_t> goneSince) {
  using Availability = platform::CaptureLibrary::Availability;
  switch (availability) {
  case Availability::NoRights: return u"התעבורה אינה נמדדת: אין הרשאה ללכוד מנות ברשת";
  case Availability::NoAdapters: return u"התעבורה אינה נמדדת: לא נמצא מתאם רשת";
  case Availability::NoLibrary: return u"התעבורה אינה נמדדת: ספריית לכידת המנות חסרה";
  case Availability::AdapterGone: return u"התעבורה אינה נמדדת: " + GoneText(goneSince);
  case Availability::Available: break;
  }
  return {};
}

} // namespace quendra::capture
