#pragma once

#include "forms/controls/Colour.h"
#include "forms/controls/ControlVisitor.h"
#include "forms/controls/Event.h"
#include "forms/controls/Property.h"
#include "runtime/Text.h"

#include <vector>

namespace quendra::forms {

class Container;
class Form;

/// Distances in twips, 1440 to the inch. Left runs from the leading edge of the container: from the right
/// edge in a form that reads from right to left.
struct Geometry {
  int left = 0;
  int top = 0;
  int width = 0;
  int height = 0;
  friend bool operator==(const Geometry&, const Geometry&) = default;
};

struct Font {
  int size = 9; ///< points
  bool bold = false;
  bool underline = false;
  friend bool operator==(const Font&, const Font&) = default;
};

class Control;

/// What a view is told. A control has one view at most, a view one control; whichever goes first, the other
/// is left alone.
class ControlView {
 public:
  ControlView() = default;
  virtual ~ControlView();
  ControlView(const ControlView&) = delete;
  ControlView& operator=(const ControlView&) = delete;

  virtual void Changed(Aspect aspect) = 0;
  /// The control goes while the view is attached; it must not be touched any more.
  virtual void ControlGone() {}

 private:
  friend class Control;
  Control* control_ = nullptr;
};

enum MouseButton : int { kNoButton = 0, kLeftButton = 1, kRightButton = 2 };

/// What all controls have in common. Made with its container, which must outlive it, and with its name.
class Control {
 public:
  Control(Container& parent, Text name);
  virtual ~Control();
  Control(const Control&) = delete;
  Control& operator=(const Control&) = delete;

  const Text& Name() const { return name_; }
  /// nullptr for a form.
  Container* Parent() const { return parent_; }
  Form& OwnerForm();
  const Form& OwnerForm() const;

  Property<bool, Aspect::Visible> Visible{*this, true};
  Property<bool, Aspect::Enabled> Enabled{*this, true};
  Property<Geometry, Aspect::Geometry> Position{*this};
  Property<Text, Aspect::Tag> Tag{*this};
  Property<Colour, Aspect::Colours> ForeColour{*this, kBlack};
  Property<Colour, Aspect::Colours> BackColour{*this, kWhite};
  Property<Font, Aspect::Font> TextFont{*this};

  /// Where the Tab key finds the control: lower numbers first, equal ones as they stand in their form. Read
  /// when the form is shown.
  int TabIndex = 0;

  Event<> Click;
  Event<> DoubleClick;
  /// Button held (MouseButton), the state of Shift (1), Ctrl (2) and Alt (4), and the place in twips.
  Event<int, int, int, int> MouseMove;
  Event<int, int, int, int> MouseDown;

  /// Visible itself and with all its containers.
  bool IsShown() const;
  /// There for the user: shown and enabled, itself and with all its containers.
  bool IsUsable() const;
  /// Has the visitor's operation for this kind called.
  virtual void Accept(ControlVisitor& visitor) = 0;
  /// nullptr for a kind that holds no others.
  virtual const Container* AsContainer() const { return nullptr; }
  /// Of a kind that the keyboard works on.
  virtual bool TakesFocus() const { return false; }
  void Move(int left, int top, int width, int height) { Position = Geometry{left, top, width, height}; }
  /// In front of its siblings.
  void BringToFront();

  /// Attaching pushes the whole state: the view is told `Aspect::All` once. nullptr detaches.
  void Attach(ControlView* view);
  ControlView* View() const { return view_; }

 protected:
  explicit Control(Text name) : name_(std::move(name)) {}

 private:
  friend class ControlView;
  friend void TellChanged(Control& owner, Aspect aspect);

  Text name_;
  Container* parent_ = nullptr;
  ControlView* view_ = nullptr;
};

/// A control that holds others; Children are in drawing order, the last in front.
class Container : public Control {
 public:
  using Control::Control;
  const Container* AsContainer() const override { return this; }
  const std::vector<Control*>& Children() const { return children_; }

  /// What stands in it is placed from its left edge, in a form that reads from right to left too. Read when
  /// the form is loaded.
  bool PlacesFromLeft = false;

 private:
  friend class Control;
  std::vector<Control*> children_;
};

/// All controls in a container and in those inside it, each before what it holds.
std::vector<Control*> ControlsIn(const Container& container);

} // namespace quendra::forms
