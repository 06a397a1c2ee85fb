#pragma once

#include <QGroupBox>

namespace gridbay::shell {

// A frame around controls, with its title above the edge.
class Frame final : public QGroupBox {
  Q_OBJECT
 public:
  explicit Frame(QWidget* parent);
  QSize minimumSizeHint() const override;
  QSize sizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  QFont titleFont() const;
  QSize withTitle(const QSize& size) const;
};

}  // namespace gridbay::shell
