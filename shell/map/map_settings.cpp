#include "shell/map/map_settings.h"

#include <QCryptographicHash>
#include <QFileInfo>
#include <QSettings>
#include <QStringList>

namespace gridbay::shell {
namespace {

constexpr qsizetype kMostSetups = 100;
const QString kLast = "map/last/";
const QString kSetups = "map/setups";  // whose settings are kept, the newest first

}  // namespace

MapSettings::MapSettings(const QString& setup) {
  if (setup.isEmpty()) return;
  const QByteArray path = QFileInfo(setup).absoluteFilePath().toUtf8();
  group_ = "map/" + QCryptographicHash::hash(path, QCryptographicHash::Sha1).toHex() + "/";
}

QVariant MapSettings::own(const QString& key) const {
  return group_.isEmpty() ? QVariant() : QSettings().value(group_ + key);
}

QVariant MapSettings::value(const QString& key, const QVariant& otherwise) const {
  const QVariant held = own(key);
  return held.isValid() ? held : QSettings().value(kLast + key, otherwise);
}

void MapSettings::setOwn(const QString& key, const QVariant& value) {
  if (group_.isEmpty()) return;
  QSettings settings;
  settings.setValue(group_ + key, value);
  QStringList setups = settings.value(kSetups).toStringList();
  if (setups.value(0) == group_) return;
  setups.removeAll(group_);
  setups.prepend(group_);
  while (setups.size() > kMostSetups) settings.remove(setups.takeLast());
  settings.setValue(kSetups, setups);
}

void MapSettings::setValue(const QString& key, const QVariant& value) {
  QSettings().setValue(kLast + key, value);
  setOwn(key, value);
}

}  // namespace gridbay::shell
