#include "provisioning/remote_access/DialStateText.h"

#include <gtest/gtest.h>

#include <set>

namespace quendra::provisioning {
namespace {

struct NamedState {
  std::uint32_t state;
  const char16_t* text;
};

struct DialStates : testing::TestWithParam<NamedState> {};

TEST_P(DialStates, Have_a_text_each) { EXPECT_EQ(DialStateText(GetParam().state), GetParam().text); }

INSTANTIATE_TEST_SUITE_P(
    Named, DialStates,
    testing::Values(
        NamedState{0, u"פותח פורט תקשורת"}, NamedState{1, u"פורט תקשורת נפתח בהצלחה"},
        NamedState{2, u"מתכונן לחיבור התקן"}, NamedState{3, u"התקן חובר בהצלחה"},
        NamedState{4, u"כל ההתקנים הרלוונטיים חוברו בהצלחה"}, NamedState{5, u"מאמת שם משתמש וסיסמא"},
        NamedState{6, u"שם משתמש וסיסמא אומתו"},
        NamedState{7, u"המשתמש ביקש ניסיון לאימות חוזר עם שם משתמש/סיסמא חדשים"},
        NamedState{8, u"השרת ביקש מספר לחזרה"}, NamedState{9, u"המשתמש ביקש לשנות סיסמא"},
        NamedState{10, u"Projection phase is starting"}, NamedState{11, u"תהליך חישוב מהירות החיבור התחיל"},
        NamedState{12, u"נרשם ברשת"}, NamedState{13, u"Reauthentication (after callback) is starting"},
        NamedState{14, u"נרשם ברשת בהצלחה"}, NamedState{15, u"עומד להתנתק ולנסות חיבור מחדש"},
        NamedState{16, u"מאתחל את המודם"},
        NamedState{17, u"Client is waiting for an incoming call from the Remote Access Server (RAS)"},
        NamedState{18, u"Projection result information is available"},
        NamedState{19, u"User authentication is being initiated or retried"},
        NamedState{20, u"Client has been called back and is about to resume authentication"},
        NamedState{21, u"Client is logging on to the network"},
        NamedState{22, u"A subentry has been connected during the dialing process"},
        NamedState{23, u"A subentry has been disconnected during the dialing process"},
        NamedState{4096, u"Terminal state reported"},
        NamedState{4097, u"Retry authentication state reported"},
        NamedState{4098, u"Callback state reported"}, NamedState{4099, u"Change password state reported"},
        NamedState{8192, u"התחבר בהצלחה"}, NamedState{8193, u"מנותק או לא נכשל בחיבור"}),
    [](const auto& tested) { return "State" + std::to_string(tested.param.state); });

TEST(DialStateText, Every_other_state_gives_three_dots) {
  for (const std::uint32_t state : {24U, 25U, 4095U, 4100U, 8191U, 8194U, 0x80000000U, 0xFFFFFFFFU})
    EXPECT_EQ(DialStateText(state), u"...") << state;
}

TEST(DialStateText, Thirty_states_have_a_text) {
  std::set<Text> texts;
  for (std::uint32_t state = 0; state < 10'000; ++state)
    if (const Text text = DialStateText(state); text != u"...") texts.insert(text);
  EXPECT_EQ(texts.size(), 30U);
}

} // namespace
} // namespace quendra::provisioning
