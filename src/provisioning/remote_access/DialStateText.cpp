#include "provisioning/remote_access/DialStateText.h"

#include <algorithm>

namespace quendra::provisioning {

namespace {

struct StateText {
  std::uint32_t state;
  const char16_t* text;
};

constexpr StateText kTexts[] = {
    {0, u"פותח פורט תקשורת"},
    {1, u"פורט תקשורת נפתח בהצלחה"},
    {2, u"מתכונן לחיבור התקן"},
    {3, u"התקן חובר בהצלחה"},
    {4, u"כל ההתקנים הרלוונטיים חוברו בהצלחה"},
    {5, u"מאמת שם משתמש וסיסמא"},
    {6, u"שם משתמש וסיסמא אומתו"},
    {7, u"המשתמש ביקש ניסיון לאימות חוזר עם שם משתמש/סיסמא חדשים"},
    {8, u"השרת ביקש מספר לחזרה"},
    {9, u"המשתמש ביקש לשנות סיסמא"},
    {10, u"Projection phase is starting"},
    {11, u"תהליך חישוב מהירות החיבור התחיל"},
    {12, u"נרשם ברשת"},
    {13, u"Reauthentication (after callback) is starting"},
    {14, u"נרשם ברשת בהצלחה"},
    {15, u"עומד להתנתק ולנסות חיבור מחדש"},
    {16, u"מאתחל את המודם"},
    {17, u"Client is waiting for an incoming call from the Remote Access Server (RAS)"},
    {18, u"Projection result information is available"},
    {19, u"User authentication is being initiated or retried"},
    {20, u"Client has been called back and is about to resume authentication"},
    {21, u"Client is logging on to the network"},
    {22, u"A subentry has been connected during the dialing process"},
    {23, u"A subentry has been disconnected during the dialing process"},
    {4096, u"Terminal state reported"},
    {4097, u"Retry authentication state reported"},
    {4098, u"Callback state reported"},
    {4099, u"Change password state reported"},
    {8192, u"התחבר בהצלחה"},
    {8193, u"מנותק או לא נכשל בחיבור"},
};

} // namespace

Text DialStateText(std::uint32_t state) {
  const auto found = std::ranges::find(kTexts, state, &StateText::state);
  return found == std::end(kTexts) ? u"..." : found->text;
}

} // namespace quendra::provisioning
