#pragma once

#include "shell/fields/field.h"
#include "shell/fields/value_edit.h"

namespace gridbay::shell {

// A text, number, count or date that is typed.
//
// What is typed is handed over with Return and when the field is left. A text that is no value stays as it
// was typed, with a mark and the reason below it. Who leaves the field with such a text comes back to it
// once; the second time he is let go. Esc brings the last value back.
class TextField final : public Field {
  Q_OBJECT
 public:
  TextField(Control& control, Accelerators& keys, QWidget* parent);

  QWidget* input() const override { return edit_; }
  bool commit() override;

 protected:
  void show() override;
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  bool isTyped() const;
  bool hasNewFault();
  void left();
  bool takeBack();

  ValueEdit* edit_;
  QString lastValue_;
  bool hasReturned_ = false;
};

}  // namespace gridbay::shell
