#include "forms/win32/windows/Composition.h"

#include "forms/Form.h"

namespace quendra::forms::win32 {

namespace {

bool Meet(const Area& one, const Area& other) {
  return one.corner.left < other.Right() && other.corner.left < one.Right() &&
         one.corner.top < other.Bottom() && other.corner.top < one.Bottom();
}

// NOLINTNEXTLINE(misc-no-recursion): as deep as controls stand in one another.
void PaintChildren(const Container& container, const Drawing& drawing) {
  for (const Control* child : container.Children()) {
    auto* const view = child->Visible() ? dynamic_cast<WindowView*>(child->View()) : nullptr;
    if (!view || !Meet(view->WindowPlace(), drawing.Clip())) continue;
    Drawing within = drawing.Within(view->WindowPlace());
    view->Paint(within);
    if (const Container* inner = child->AsContainer()) PaintChildren(*inner, within);
  }
}

void PutTogether(WindowView& form, Drawing& drawing) {
  form.Paint(drawing);
  PaintChildren(*form.TheControl()->AsContainer(), drawing);
}

/// A paint of the system's, from its begin to its end.
class Painting {
 public:
  explicit Painting(HWND window) : window_(window), device_(::BeginPaint(window, &paint_)) {}
  ~Painting() { ::EndPaint(window_, &paint_); }
  Painting(const Painting&) = delete;
  Painting& operator=(const Painting&) = delete;

  HDC Device() const { return device_; }
  Area Due() const {
    const RECT& due = paint_.rcPaint;
    return {{due.left, due.top}, {due.right - due.left, due.bottom - due.top}};
  }

 private:
  HWND window_;
  PAINTSTRUCT paint_{};
  HDC device_;
};

} // namespace

void PaintWindow(const WindowView& view) {
  const Painting painting(view.Window());
  const Area due = painting.Due();
  auto* const form = dynamic_cast<WindowView*>(view.TheControl()->OwnerForm().View());
  if (!form || due.extent.width <= 0 || due.extent.height <= 0) return;
  POINT corner{};
  ::MapWindowPoints(view.Window(), form->Body(), &corner, 1);
  const Area part{{due.corner.left + static_cast<int>(corner.x), due.corner.top + static_cast<int>(corner.y)},
                  due.extent};
  RECT whole{};
  ::GetClientRect(form->Body(), &whole);
  FormPicture& picture = view.Context().state.picture;
  picture.Bring(part, {static_cast<int>(whole.right), static_cast<int>(whole.bottom)},
                [form](Drawing& drawing) { PutTogether(*form, drawing); });
  ::SetViewportOrgEx(painting.Device(), -corner.x, -corner.y, nullptr);
  picture.ShowOn(painting.Device(), part);
}

} // namespace quendra::forms::win32
