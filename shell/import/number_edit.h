#pragma once

#include <QLineEdit>
#include <optional>

namespace gridbay::shell {

// An edit for a number, or none; a text that is no number is shown as a fault.
class NumberEdit final : public QLineEdit {
  Q_OBJECT
 public:
  explicit NumberEdit(QWidget* parent);

  // Nothing where there is no text, or no number.
  std::optional<double> number() const;
  bool isFaulty() const { return !text().trimmed().isEmpty() && !number(); }
  // With so many digits behind the point at most.
  void setNumber(double number, int digits);

 protected:
  void changeEvent(QEvent* event) override;

 private:
  void colour();
};

}  // namespace gridbay::shell
