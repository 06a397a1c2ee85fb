#include "shell/units_menu.h"

#include <QActionGroup>
#include <QSettings>

namespace gridbay::shell {
namespace {

constexpr const char* kSystemKey = "units/system";
constexpr const char* kChosenGroup = "units/chosen";
constexpr const char* kUs = "US";

QString text(std::string_view utf8) {
  return QString::fromUtf8(utf8.data(), static_cast<qsizetype>(utf8.size()));
}

}  // namespace

UnitsMenu::UnitsMenu(QWidget* parent) : QMenu(tr("&Units"), parent) {
  QSettings settings;
  units_.setSystem(settings.value(kSystemKey) == kUs ? UnitSystem::us : UnitSystem::metric);
  settings.beginGroup(kChosenGroup);
  for (const QString& key : settings.childKeys()) {
    const QunItem* item = qunFindItem(key.toInt());
    const int unit = settings.value(key).toInt();
    if (item != nullptr && std::find(item->units.begin(), item->units.end(), unit) != item->units.end())
      units_.choose(item->code, unit);
  }
  build();
}

void UnitsMenu::build() {
  clear();
  auto* systems = new QActionGroup(this);
  const auto addSystem = [&](const QString& name, UnitSystem system) {
    QAction* action = addAction(name, this, [this, system] { chooseSystem(system); });
    action->setCheckable(true);
    action->setChecked(units_.system() == system);
    systems->addAction(action);
  };
  addSystem(tr("&Metric"), UnitSystem::metric);
  addSystem(tr("&US"), UnitSystem::us);
  addSeparator();
  for (const QunItem& item : qunItems()) {
    if (item.units.size() < 2) continue;
    QMenu* menu = addMenu(text(item.name));
    auto* group = new QActionGroup(menu);
    for (const int code : item.units) {
      const QunUnit* unit = qunFindUnit(code);
      QAction* action = menu->addAction(QString("%1 (%2)").arg(text(unit->name), text(unit->symbol)), this,
                                        [this, item = item.code, code] { choose(item, code); });
      action->setCheckable(true);
      action->setChecked(units_.unitOf(item.code) == unit);
      group->addAction(action);
    }
  }
}

void UnitsMenu::chooseSystem(UnitSystem system) {
  units_ = UnitChoices();
  units_.setSystem(system);
  QSettings settings;
  settings.setValue(kSystemKey, system == UnitSystem::us ? kUs : "metric");
  settings.remove(kChosenGroup);
  emit unitsChosen();
  QMetaObject::invokeMethod(
      this, [this] { build(); }, Qt::QueuedConnection);
}

void UnitsMenu::choose(int itemCode, int unitCode) {
  units_.choose(itemCode, unitCode);
  QSettings().setValue(QString("%1/%2").arg(kChosenGroup).arg(itemCode), unitCode);
  emit unitsChosen();
}

}  // namespace gridbay::shell
