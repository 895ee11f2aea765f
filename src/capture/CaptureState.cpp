#include "capture/CaptureState.h"

namespace quendra::capture {

Text CaptureStateText(platform::CaptureLibrary::Availability availability) {
  using Availability = platform::CaptureLibrary::Availability;
  switch (availability) {
  case Availability::NoRights: return u"התעבורה אינה נמדדת: אין הרשאה ללכוד מנות ברשת";
  case Availability::NoAdapters: return u"התעבורה אינה נמדדת: לא נמצא מתאם רשת";
  case Availability::NoLibrary: return u"התעבורה אינה נמדדת: ספריית לכידת המנות חסרה";
  case Availability::Available: break;
  }
  return {};
}

} // namespace quendra::capture
