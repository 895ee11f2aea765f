#pragma once

#include "forms/win32/boxes/BoxLines.h"
#include "forms/win32/views/ViewContext.h"

namespace quendra::forms::win32 {

/// The sign of a box.
class BoxSignControl : public Image {
 public:
  using Image::Image;
  BoxSign sign = BoxSign::None;
};

/// The text of a box, each line of which reads in its own direction. Its caption has the marks that say so.
class BoxTextControl : public Label {
 public:
  using Label::Label;
  std::vector<BoxLine> lines;
};

/// A message box as a form. Its buttons are as large as their captions, and its text goes into a field that
/// scrolls where the screen has too little room: the buttons must stay on it.
class BoxForm : public Form {
 public:
  BoxForm(const BoxContent& content, ViewContext& context, Extent screen);
  void Design() override {}

  /// A button or the close box answers; 0 for a close box that does nothing.
  void AnswerBy(int button);
  int Answer() const { return answer_; }

 private:
  void PutSign(ViewContext& context);
  void PutText(ViewContext& context, Extent screen);
  void PutButtons(ViewContext& context);
  void Place(Control& control, Area area, const Scale& scale);

  const BoxContent& content_;
  int answer_;
  BoxSignControl sign_{*this, u"sign"};
  BoxTextControl text_{*this, u"text"};
  TextBox field_{*this, u"field"};
  std::vector<std::unique_ptr<CommandButton>> buttons_;
  int textLeft_ = 0; ///< in pixels, from the leading edge
  Extent inside_{};
};

/// The height that lines take where they are wrapped at a width, and the width of the longest.
Extent MeasureLines(const std::vector<BoxLine>& lines, HFONT font, int width, int lineHeight);

} // namespace quendra::forms::win32
