#include "app/RegistryNotice.h"

#include "foundation/Wording.h"

namespace quendra::app {

void RegistryNotice::operator()(const std::string& keptAs) const {
  events_->Post([boxes = boxes_, path = FromUtf8(keptAs)] {
    boxes->MessageBox(
        u"קובץ ההגדרות של התוכנה נמצא פגום, ובמקומו נפתח קובץ חדש.\r\nהקובץ הפגום נשמר כאן:\r\n" + path,
        forms::kHebrewBox | forms::kExclamation, foundation::kTitle);
  });
}

} // namespace quendra::app
