#pragma once

#include <QMenu>

#include "platform/units/edit_style.h"

namespace gridbay::shell {

// The units that quantities are shown in: metric or US for all, and each one by itself. The choice is kept
// for the next start.
class UnitsMenu final : public QMenu {
  Q_OBJECT
 public:
  explicit UnitsMenu(QWidget* parent);

  const UnitChoices& units() const { return units_; }

 signals:
  void unitsChosen();

 private:
  void build();
  void chooseSystem(UnitSystem system);
  void choose(int itemCode, int unitCode);

  UnitChoices units_;
};

}  // namespace gridbay::shell
