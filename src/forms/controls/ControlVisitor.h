#pragma once

namespace quendra::forms {

class ComboBox;
class Frame;
class Image;
class ImageList;
class Label;
class Line;
class ListBox;
class ListView;
class PictureBox;
class TextBox;
class Timer;

/// The kinds that nobody sees.
class UnseenVisitor {
 public:
  virtual ~UnseenVisitor() = default;
  virtual void Visit(ImageList& images) = 0;
  virtual void Visit(Timer& timer) = 0;
};

/// One operation a kind of control. A desktop that renders controls is one, so a kind that it forgets fails
/// to compile.
class ControlVisitor : public UnseenVisitor {
 public:
  using UnseenVisitor::Visit;
  virtual void Visit(ComboBox& combo) = 0;
  virtual void Visit(Frame& frame) = 0;
  virtual void Visit(Image& image) = 0;
  virtual void Visit(Label& label) = 0;
  virtual void Visit(Line& line) = 0;
  virtual void Visit(ListBox& list) = 0;
  virtual void Visit(ListView& list) = 0;
  virtual void Visit(PictureBox& box) = 0;
  virtual void Visit(TextBox& box) = 0;
};

} // namespace quendra::forms
