#include "shell/IpPanel.h"

#include "forms/Form.h"
#include "foundation/Wording.h"

namespace quendra::shell {

bool IpPanel::IsItsKey(int keyCode, int shift) {
  return shift == forms::kCtrl && (keyCode == u'I' || keyCode == u'i' || keyCode == u'ן');
}

void IpPanel::Show() const {
  Text text = u"נתוני IP:";
  text += u"\r\n1: " + addresses_.LocalHostAddress(capture::HostAddress::Last);
  text += u"\r\n2: " + addresses_.GatewayAddress();
  text += u"\r\n3: " + addresses_.LocalHostAddress(capture::HostAddress::BeforeLast);
  loop_.MessageBox(text, forms::kInformation | forms::kHebrewBox, foundation::kTitle);
}

} // namespace quendra::shell
