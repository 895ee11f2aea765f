#include "app/RegistryNotice.h"

#include "foundation/Wording.h"

namespace quendra::app {

namespace {

/// A path keeps its order from left to right between Hebrew lines.
Text LeftToRight(const Text& path) { return u"\u202A" + path + u"\u202C"; }

} // namespace

void RegistryNotice::operator()(const std::string& keptAs) const {
  events_->Post([boxes = boxes_, path = FromUtf8(keptAs)] {
    boxes->MessageBox(
        u"קובץ ההגדרות של התוכנה נמצא פגום, ובמקומו נפתח קובץ חדש.\r\nהקובץ הפגום נשמר כאן:\r\n" +
            LeftToRight(path),
        forms::kHebrewBox | forms::kExclamation, foundation::kTitle);
  });
}

} // namespace quendra::app
