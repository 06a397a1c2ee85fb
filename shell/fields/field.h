#pragma once

#include <QComboBox>
#include <QLabel>
#include <memory>

#include "pages/form.h"
#include "shell/fields/accelerators.h"

namespace gridbay::shell {

// One control of a form with the widgets that show it: an input, and a label before it and a unit behind it
// where it has them. The input hands over what the user does, and shows what the control says; it rewrites
// nothing that is shown already, so that a user who is at work there is not disturbed.
class Field : public QObject {
  Q_OBJECT
 public:
  Field(Control& control, Accelerators& keys) : control_(control), keys_(keys) {}

  Control& control() const { return control_; }
  virtual QWidget* input() const = 0;
  QLabel* label() const { return label_; }
  QLabel* unit() const { return unit_; }
  // A line that says what is wrong with what is typed; null before anything was.
  QLabel* explanation() const { return explanation_; }

  // Brings the widgets in line with the control.
  void refresh();
  // Hands over what is typed and not yet entered; false when it is no value.
  virtual bool commit() { return true; }

 signals:
  // The control holds what the user did.
  void changed();
  void stepped(int delta);
  // The user has left with what is no value, and is to see that first.
  void returnWanted();
  // An explanation is wanted below the input.
  void explained(QLabel* explanation);

 protected:
  virtual void show() = 0;
  // The caption with its letter, where it is on the input itself.
  virtual void setCaption(const QString&) {}

  // A letter leads to the input.
  void giveKey() { hasKey_ = true; }
  // The texts that stand with the input, to be called once the input is made.
  void makeLabel(QWidget* parent);
  void makeUnit(QWidget* parent);
  Accelerators& keys() { return keys_; }
  QString caption() const { return QString::fromStdString(control_.label).trimmed(); }

 private:
  void showCaption();
  void showFault();

  Control& control_;
  Accelerators& keys_;
  QLabel* label_ = nullptr;
  QLabel* unit_ = nullptr;
  QLabel* explanation_ = nullptr;
  bool hasKey_ = false;
  bool isCaptionShown_ = false;
  std::string shownLabel_;
  QString shownCaption_;
};

// The label of a control as a name: with no accelerator and no colon.
QString nameOf(const Control& control);

// The field of a control that is neither a frame nor a table.
std::unique_ptr<Field> makeField(Control& control, Accelerators& keys, QWidget* parent);

}  // namespace gridbay::shell
