#include "capture/CaptureState.h"

#include "runtime/Format.h"

namespace quendra::capture {

namespace {

/// As in "14:32".
Text ClockText(std::int32_t secondOfDay) {
  return Format(secondOfDay / 3600, u"00") + u":" + Format(secondOfDay / 60 % 60, u"00");
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
