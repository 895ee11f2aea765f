#include "shell/Agreement.h"

#include "foundation/Wording.h"

namespace quendra::shell {

Text AgreementText() {
  Text text;
  text += foundation::kTitle;
  text += u"\r\n";
  text += u"____________________________";
  text += u"\r\n";
  text += u"הסכם שימוש בתוכנת הניטור והעזרה:";
  text += u"\r\n";
  text += u"חברת זלמר בינלאומי בע\"מ מסירה מעצמה כל אחריות לנזקים העלולים להגרם כתוצאה משימוש בתוכנה זו.";
  text += u"\r\n";
  text += u"הסרת אחריות זו כוללת גם באם השימוש נעשה באופן תקין ואפילו ע\"י ובהדרכת תומך או כל נציג אחר מטעם "
          u"זב\"ל";
  return text;
}

} // namespace quendra::shell
