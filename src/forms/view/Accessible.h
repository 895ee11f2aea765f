#pragma once

#include "forms/Form.h"
#include "forms/controls/ListView.h"

namespace quendra::forms {

/// What assistive technology takes a control for. A view that the toolkit describes well by itself keeps the
/// toolkit's role.
enum class Role { Toolkits, Text, Button, Grouping, Graphic, Separator, Window };

/// What assistive technology says of a control.
struct Accessible {
  Role role = Role::Toolkits;
  /// The caption, with its line breaks.
  Text name{};
  /// The control's own name, by which it can be found.
  Text description{};
};

/// A label with a handler is a button, and one without a caption has its description for a name. So is a
/// picture with a handler, named by its window. A combo box is named by the frame around it, a field or a
/// list box by its description, else by the label that stands before it, else by that frame. Asked for anew
/// each time: a label becomes a button with its handler.
Accessible AccessibleOf(Control& control);

/// The name of a column: its caption, or what stands for the icon in place of one.
Text AccessibleNameOf(const ColumnHeader& column);

/// Whether assistive technology may press a control: a button that is enabled with all its containers.
bool OffersPress(Control& control);

} // namespace quendra::forms
