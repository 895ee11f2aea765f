#include "forms/headless/HeadlessDesktop.h"

namespace quendra::forms {

namespace {

std::string Quoted(const Text& text) { return " \"" + ToUtf8(text) + "\""; }

std::string PictureText(const Picture& picture) {
  if (!picture.ArtworkName().empty()) return " picture=" + picture.ArtworkName();
  return picture.IsNone() ? "" : " picture=pixels";
}

std::string ColourState(const Control& control) {
  if (control.ForeColour() == kBlack) return {};
  return " colour=" + std::to_string(control.ForeColour());
}

std::string ItemsOf(const ComboBox& combo) {
  std::string items = " [";
  for (int i = 0; i < combo.ListCount(); ++i) {
    if (i > 0) items += ", ";
    if (i == combo.ListIndex()) items += "*";
    items += ToUtf8(combo.List(i));
  }
  return items + "]";
}

std::string Described(const Control& control) {
  const std::string name = " " + ToUtf8(control.Name());
  if (const auto* label = dynamic_cast<const Label*>(&control))
    return "Label" + name + Quoted(label->Caption) + ColourState(*label);
  if (const auto* frame = dynamic_cast<const Frame*>(&control))
    return "Frame" + name + Quoted(frame->Caption);
  if (const auto* box = dynamic_cast<const PictureBox*>(&control))
    return "PictureBox" + name + PictureText(box->Contents);
  if (const auto* image = dynamic_cast<const Image*>(&control))
    return "Image" + name + PictureText(image->Contents);
  if (const auto* combo = dynamic_cast<const ComboBox*>(&control)) return "ComboBox" + name + ItemsOf(*combo);
  if (dynamic_cast<const ListView*>(&control)) return "ListView" + name;
  if (dynamic_cast<const Line*>(&control)) return "Line" + name;
  return "Control" + name;
}

bool HasNoFace(const Control& control) {
  return dynamic_cast<const Timer*>(&control) || dynamic_cast<const ImageList*>(&control);
}

std::string HeadersOf(const ListView& list) {
  std::string line;
  for (const auto& column : list.Columns()) {
    if (!line.empty()) line += " | ";
    line += column.caption.empty() ? "{" + ToUtf8(column.description) + "}" : ToUtf8(column.caption);
  }
  return line;
}

std::string CellsOf(const ListRow& row) {
  std::string line;
  for (int cell = 0; cell <= row.CellCount(); ++cell) {
    if (cell > 0) line += " | ";
    line += ToUtf8(row.CellText(cell));
  }
  return line;
}

void AppendTable(std::string& text, const ListView& list, const std::string& margin) {
  text += margin + "# " + HeadersOf(list) + "\n";
  for (int i = 1; i <= list.Count(); ++i) {
    const ListRow& row = list.Row(i);
    text += margin + (list.SelectedItem() == &row ? "> " : "- ") + CellsOf(row) + "\n";
  }
}

void AppendChildren(std::string& text, const Container& container, const std::string& margin) {
  for (const Control* child : container.Children()) {
    if (!child->Visible() || HasNoFace(*child)) continue;
    text += margin + Described(*child) + (child->Enabled() ? "" : " disabled") + "\n";
    if (const auto* list = dynamic_cast<const ListView*>(child)) AppendTable(text, *list, margin + "  ");
    if (const auto* inner = dynamic_cast<const Container*>(child))
      AppendChildren(text, *inner, margin + "  ");
  }
}

} // namespace

std::string HeadlessDesktop::Render(Form& form) const {
  std::string text = "Form " + ToUtf8(form.Name()) + Quoted(form.Caption);
  if (!form.Visible()) return text + " hidden\n";
  text += "\n";
  AppendChildren(text, form, "  ");
  return text;
}

} // namespace quendra::forms
