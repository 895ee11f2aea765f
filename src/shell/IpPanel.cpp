#include "shell/IpPanel.h"

#include "shell/Wording.h"

namespace quendra::shell {

bool IpPanel::IsItsKey(int keyCode, int shift) {
  return shift == forms::kCtrl && (keyCode == u'I' || keyCode == u'i' || keyCode == u'ן');
}

void IpPanel::Show() const {
  Text text = u"נתוני IP:";
  text += u"\r\n1: " + addresses_.LocalHostAddress(true);
  text += u"\r\n2: " + addresses_.GatewayAddress();
  text += u"\r\n3: " + addresses_.LocalHostAddress(false);
  desktop_.MessageBox(text, forms::kInformation | forms::kHebrewBox, kTitle);
}

} // namespace quendra::shell
