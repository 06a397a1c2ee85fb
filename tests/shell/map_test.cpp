// Runs all tests of the map, or those whose names are given.

#include "tests/shell/map_test.h"

namespace gridbay::shell {

// The names of tests that this one has, among other arguments; none where all names are of others.
static QStringList ownArguments(const QObject& test, const QStringList& arguments) {
  QStringList own{arguments.front()};
  bool hasNames = false;
  bool hasOwn = false;
  for (const QString& each : arguments.mid(1)) {
    const bool isName = each.contains(QRegularExpression("^[a-z]\\w*$"));
    const bool isOwn = isName && test.metaObject()->indexOfMethod(qPrintable(each + "()")) >= 0;
    hasNames = hasNames || isName;
    hasOwn = hasOwn || isOwn;
    if (isOwn || !isName) own << each;
  }
  return hasNames && !hasOwn ? QStringList() : own;
}

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("map-test");
  int failed = 0;
  for (const auto make : gridbay::shell::mapTests()) {
    const std::unique_ptr<QObject> test = make();
    const QStringList arguments = gridbay::shell::ownArguments(*test, QCoreApplication::arguments());
    if (!arguments.isEmpty()) failed += QTest::qExec(test.get(), arguments);
  }
  return failed;
}
