#pragma once

#include <QLabel>
#include <QScrollArea>
#include <functional>
#include <vector>

#include "pages/form.h"

namespace gridbay::shell {

// The one renderer of all pages: builds widgets from a form, hands what the user does to it, and shows what
// it says.
class PagePane final : public QScrollArea {
  Q_OBJECT
 public:
  explicit PagePane(QWidget* parent);

  void showForm(const QString& caption, Form& form);
  void showText(const QString& caption, const QString& text);
  // Brings the widgets in line with the form.
  void refresh();
  // The widget of the n-th control of a label; null when there is none.
  QWidget* widgetOf(const QString& label, int n = 1) const;

 private:
  struct Bound {
    Control* control;
    QWidget* widget;
    QLabel* label;
  };
  QWidget* makeWidget(Control& control, QWidget* parent);
  void changed(Control& control);

  std::vector<Bound> bound_;
  bool refreshing_ = false;
};

}  // namespace gridbay::shell
