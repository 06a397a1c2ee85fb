#pragma once

#include <QString>
#include <QVariant>

namespace gridbay::shell {

// What is kept of how the map of a setup was looked at, from one start of the program to the next. A setup
// that nothing is known of begins with what was chosen last.
class MapSettings {
 public:
  // Of the setup in a file; empty for one that has none, of which nothing but the last choice is kept.
  explicit MapSettings(const QString& setup);

  // Of this setup, or what was chosen last for any.
  QVariant value(const QString& key, const QVariant& otherwise) const;
  void setValue(const QString& key, const QVariant& value);
  // Of this setup alone.
  QVariant own(const QString& key) const;
  void setOwn(const QString& key, const QVariant& value);

 private:
  QString group_;  // of the setup
};

}  // namespace gridbay::shell
