#pragma once

#include <QDialog>
#include <QPointer>

namespace gridbay::shell {

// A modal dialog that is out of the way while its user points at a map. Meanwhile the map alone takes what he
// does, as what the dialog is about must not change; keys are the map's wherever the keyboard is. When this
// goes the dialog comes back as it was.
class DialogAside final : public QObject {
  Q_OBJECT
 public:
  DialogAside(QDialog& dialog, QWidget& map);
  ~DialogAside() override;

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  bool isFree(const QObject* target) const;

  QPointer<QDialog> dialog_;
  QWidget& map_;
  QPoint place_;
  bool isPassedOn_ = false;  // a key is on its way to the map
};

}  // namespace gridbay::shell
