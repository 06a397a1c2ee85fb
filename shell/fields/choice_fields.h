#pragma once

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QPushButton>

#include "shell/fields/field.h"
#include "shell/projection_search.h"

namespace gridbay::shell {

// A list that the wheel changes only where the user is, so that a page that is scrolled changes nothing.
class ChoiceList final : public QComboBox {
  Q_OBJECT
 public:
  explicit ChoiceList(QWidget* parent);

 protected:
  void wheelEvent(QWheelEvent* event) override;
};

// A list to choose from. One of map projections can be typed in: that searches all projections there are.
class DropDownField final : public Field {
  Q_OBJECT
 public:
  DropDownField(Control& control, Accelerators& keys, QWidget* parent);
  QWidget* input() const override { return list_; }
  bool commit() override;

 protected:
  void show() override;
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void makeSearchable();
  void showChoice();
  void take(int index);
  void takeProjection(const std::string& text);

  ChoiceList* list_;
  ProjectionCompleter* search_ = nullptr;  // of a list of projections
  bool hasReturned_ = false;
  std::vector<std::string> shownChoices_;
};

class RadioField final : public Field {
  Q_OBJECT
 public:
  RadioField(Control& control, Accelerators& keys, QWidget* parent);
  QWidget* input() const override { return box_; }

 protected:
  void show() override;

 private:
  void makeButtons();

  QWidget* box_;
  QButtonGroup* group_ = nullptr;
  QStringList captions_;  // with their letters
  std::vector<std::string> shownChoices_;
};

class CheckField final : public Field {
  Q_OBJECT
 public:
  CheckField(Control& control, Accelerators& keys, QWidget* parent);
  QWidget* input() const override { return box_; }

 protected:
  void show() override;
  void setCaption(const QString& text) override { box_->setText(text); }

 private:
  QCheckBox* box_;
};

class ButtonField final : public Field {
  Q_OBJECT
 public:
  ButtonField(Control& control, Accelerators& keys, QWidget* parent);
  QWidget* input() const override { return button_; }

 protected:
  void show() override {}
  void setCaption(const QString& text) override;

 private:
  QPushButton* button_;
};

// A value that is only read.
class LabelField final : public Field {
  Q_OBJECT
 public:
  LabelField(Control& control, Accelerators& keys, QWidget* parent);
  QWidget* input() const override { return value_; }

 protected:
  void show() override;

 private:
  QLabel* value_;
};

}  // namespace gridbay::shell
