#include "forms/qt/views/WidgetView.h"

#include <QAccessibleWidget>
#include <QApplication>

namespace quendra::forms::qt {

namespace {

QAccessible::Role ToQt(forms::Role role) {
  switch (role) {
  case forms::Role::Toolkits: break;
  case forms::Role::Text: return QAccessible::StaticText;
  case forms::Role::Button: return QAccessible::Button;
  case forms::Role::Grouping: return QAccessible::Grouping;
  case forms::Role::Graphic: return QAccessible::Graphic;
  case forms::Role::Separator: return QAccessible::Separator;
  case forms::Role::Window: return QAccessible::Window;
  }
  return QAccessible::NoRole;
}

/// What assistive technology sees of a widget that the program draws itself.
class ControlInterface : public QAccessibleWidget {
 public:
  ControlInterface(QWidget* widget, WidgetView& view)
      : QAccessibleWidget(widget, ToQt(view.Role())), view_(view) {}

  // Asked each time: a label becomes a button with its handler.
  QAccessible::Role role() const override { return ToQt(view_.Role()); }

  QStringList actionNames() const override {
    QStringList names = QAccessibleWidget::actionNames();
    if (IsPressable()) names.prepend(pressAction());
    return names;
  }

  void doAction(const QString& action) override {
    if (action == pressAction() && IsPressable()) return view_.Press();
    QAccessibleWidget::doAction(action);
  }

 private:
  bool IsPressable() const { return view_.TheControl() && OffersPress(*view_.TheControl()) && !IsBlocked(); }
  // Mouse and keys don't reach a window that a box or a modal form covers; a request like this one would.
  bool IsBlocked() const {
    const QWidget* modal = QApplication::activeModalWidget();
    return modal && modal != widget()->window();
  }

  WidgetView& view_;
};

QAccessibleInterface* MakeInterface(const QString& /*className*/, QObject* object) {
  auto* view = dynamic_cast<WidgetView*>(object);
  if (!view || view->Role() == forms::Role::Toolkits) return nullptr;
  return new ControlInterface(&view->Widget(), *view);
}

} // namespace

void InstallAccessibility() {
  static const bool installed = [] {
    QAccessible::installFactory(MakeInterface);
    return true;
  }();
  static_cast<void>(installed);
}

} // namespace quendra::forms::qt
