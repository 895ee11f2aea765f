#include "forms/headless/HeadlessDesktop.h"

namespace quendra::forms::headless {

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

std::string StateOf(const TextBox& box) {
  return std::string(box.MultiLine ? " lines" : "") + (box.ReadOnly() ? " read-only" : "");
}

template <typename Kind> std::string ItemsOf(const Kind& list) {
  std::string items = " [";
  for (int i = 0; i < list.ListCount(); ++i) {
    if (i > 0) items += ", ";
    if (i == list.ListIndex()) items += "*";
    items += ToUtf8(list.List(i));
  }
  return items + "]";
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
    if (row.CellIcon(cell) != 0) line += "{" + std::to_string(row.CellIcon(cell)) + "}";
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

/// Writes a control and what it holds, each line after a margin.
class Renderer : public ControlVisitor {
 public:
  explicit Renderer(std::string& text) : text_(text) {}

  void RenderIn(const Container& container, const std::string& margin) {
    for (Control* child : container.Children()) {
      if (!child->Visible()) continue;
      margin_ = margin;
      child->Accept(*this);
      if (const Container* inner = child->AsContainer()) RenderIn(*inner, margin + "  ");
    }
  }

  void Visit(ComboBox& combo) override {
    Write("ComboBox", combo, ItemsOf(combo) + (combo.FreeText ? Quoted(combo.Value) : ""));
  }
  void Visit(Frame& frame) override { Write("Frame", frame, Quoted(frame.Caption)); }
  void Visit(Image& image) override { Write("Image", image, PictureText(image.Contents)); }
  void Visit(ImageList& /*images*/) override {}
  void Visit(Label& label) override {
    const bool isButton = dynamic_cast<const CommandButton*>(&label) != nullptr;
    Write(isButton ? "CommandButton" : "Label", label, Quoted(label.Caption) + ColourState(label));
  }
  void Visit(Line& line) override { Write("Line", line); }
  void Visit(ListBox& list) override { Write("ListBox", list, ItemsOf(list)); }
  void Visit(ListView& list) override {
    Write("ListView", list);
    AppendTable(text_, list, margin_ + "  ");
  }
  void Visit(PictureBox& box) override { Write("PictureBox", box, PictureText(box.Contents)); }
  void Visit(TextBox& box) override {
    const Text shown = box.Masked() ? Text(box.Value().size(), u'*') : box.Value();
    Write("TextBox", box, Quoted(shown) + StateOf(box));
  }
  void Visit(Timer& /*timer*/) override {}

 private:
  void Write(const char* kind, const Control& control, const std::string& state = {}) {
    text_ +=
        margin_ + kind + " " + ToUtf8(control.Name()) + state + (control.Enabled() ? "" : " disabled") + "\n";
  }

  std::string& text_;
  std::string margin_;
};

} // namespace

std::string HeadlessDesktop::Render(Form& form) const {
  std::string text = "Form " + ToUtf8(form.Name()) + Quoted(form.Caption);
  if (!form.Visible()) return text + " hidden\n";
  text += "\n";
  Renderer(text).RenderIn(form, "  ");
  return text;
}

} // namespace quendra::forms::headless
