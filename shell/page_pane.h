#pragma once

#include <QLabel>
#include <QScrollArea>
#include <QVBoxLayout>
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
  // A picture in the whole pane, or a text in its middle where there is no picture.
  void showPicture(const QString& path, const QString& text);
  // Shows nothing: to be called before the form that is shown goes.
  void clear();
  // Brings the widgets in line with the form.
  void refresh();
  // Hands over what is typed and not yet entered.
  void commit();
  // The widget of the n-th control of a label; null when there is none.
  QWidget* widgetOf(const QString& label, int n = 1) const;

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  struct Bound {
    Control* control;
    QWidget* widget;
    QLabel* label;
    QString text;  // of the label, with its accelerator
  };
  QWidget* makeWidget(Control& control, QWidget* parent);
  QWidget* makeEdit(Control& control, QWidget* parent);
  QWidget* makeRadio(Control& control, QWidget* parent);
  QVBoxLayout* startPage(const QString& caption);
  QString withAccelerator(const QString& text);
  void changed(Control& control);
  void refresh(const Bound& bound);

  Form* form_ = nullptr;
  std::vector<Bound> bound_;
  QString usedKeys_;
  bool refreshing_ = false;
};

}  // namespace gridbay::shell
