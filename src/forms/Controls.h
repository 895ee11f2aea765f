#pragma once

#include "forms/Control.h"
#include "forms/Picture.h"

namespace quendra::forms {

enum class Alignment { Leading, Trailing, Centre };

/// A text. One with a Click handler or a button's face acts as a button: it takes the focus and Enter and
/// Space press it.
class Label : public Control {
 public:
  using Control::Control;
  Property<Text, Aspect::Caption> Caption{*this};
  Property<Alignment, Aspect::Look> Align{*this, Alignment::Leading};
  Property<bool, Aspect::Look> Transparent{*this, true};
  Property<bool, Aspect::Look> WordWrap{*this, false};
  /// How a label that acts as a button is drawn: as plain text, a link, or a button with a face.
  enum class Look { Plain, Link, Button };
  Property<Look, Aspect::Look> Style{*this, Look::Plain};
  bool IsButton() const { return Click || Style() == Look::Button; }
  bool TakesFocus() const override { return IsButton(); }
  /// The accessible name where the caption is empty.
  Text Description;
};

/// A group of controls with a caption on its border; without a caption and border it is a plain page.
class Frame : public Container {
 public:
  using Container::Container;
  Property<Text, Aspect::Caption> Caption{*this};
  Property<bool, Aspect::Look> Border{*this, true};
};

/// A straight line from (x1, y1) to (x2, y2), in twips in its container.
struct LineEnds {
  int x1 = 0;
  int y1 = 0;
  int x2 = 0;
  int y2 = 0;
  friend bool operator==(const LineEnds&, const LineEnds&) = default;
};

class Line : public Control {
 public:
  using Control::Control;
  Property<LineEnds, Aspect::Geometry> Ends{*this};
  Property<int, Aspect::Look> BorderWidth{*this, 1}; ///< pixels
};

/// A picture without a drawing surface, stretched to its size.
class Image : public Control {
 public:
  using Control::Control;
  Property<Picture, Aspect::Picture> Contents{*this};
};

/// A picture with a drawing surface; holds other controls too. Drawing goes through Desktop.
class PictureBox : public Container {
 public:
  using Container::Container;
  Property<Picture, Aspect::Picture> Contents{*this};
  Property<bool, Aspect::Look> Border{*this, false};
  /// 1 twips, 3 pixels: the unit of the drawing operations. Geometry stays in twips.
  int ScaleMode = 1;
  /// Where the next print goes, in the unit of ScaleMode.
  int CurrentX = 0;
  int CurrentY = 0;
};

/// Calls Tick every Interval milliseconds while it is enabled and its form is loaded. An interval of 0 never
/// ticks.
class Timer : public Control {
 public:
  Timer(Container& parent, Text name, int interval, bool enabled) : Control(parent, std::move(name)) {
    Interval = interval;
    Enabled = enabled;
  }
  Property<int, Aspect::Timer> Interval{*this, 0};
  Event<> Tick;
};

} // namespace quendra::forms
