#include <QApplication>
#include <QCommandLineParser>
#include <QDir>
#include <QMessageBox>
#include <QPixmap>
#include <QTextStream>
#include <functional>

#include "core/page_place.h"
#include "shell/appearance.h"
#include "shell/main_window.h"

using namespace gridbay::shell;
using gridbay::PageId;

namespace {

void tellOutside(const QString& text) {
  QTextStream(stderr) << text << '\n';
}

// Where no one is there to answer, what a box says is told outside, and the box is left.
class Unattended final : public QObject {
 public:
  using QObject::QObject;
  bool eventFilter(QObject* watched, QEvent* event) override {
    auto* box = event->type() == QEvent::Show ? qobject_cast<QMessageBox*>(watched) : nullptr;
    if (box != nullptr) {
      tellOutside(box->text());
      QMetaObject::invokeMethod(box, &QDialog::reject, Qt::QueuedConnection);
    }
    return QObject::eventFilter(watched, event);
  }
};

// False where one can't be opened.
bool openFiles(MainWindow& window, const QStringList& paths) {
  bool isOpen = true;
  for (const QString& path : paths) {
    const bool isOne = DataWindow::isDataFile(path) ? window.openData(path) != nullptr
                                                    : window.openDocument(path) != nullptr;
    isOpen = isOpen && isOne;
  }
  return isOpen;
}

// Pictures of the map beside the page of its areas, and of the innermost area with its cells.
void takeMaps(MainWindow& window, const std::function<void(const QString&)>& take) {
  constexpr int kWidth = 760;
  constexpr int kInView = 40;  // cells
  MapCanvas& canvas = window.map().canvas();
  const auto settle = [&canvas] {
    do {
      QApplication::processEvents(QEventLoop::AllEvents, 10);
    } while (!canvas.isSettled());
  };
  const QSize before = window.size();
  window.resize(1500, 860);
  window.map().show();
  window.resizeDocks({&window.map()}, {kWidth}, Qt::Horizontal);
  window.currentDocument()->goToPlace({.page = PageId::bathymetry, .entries = {{2}}});
  settle();
  canvas.fit();
  settle();
  take("map");
  const std::vector<gridbay::MapArea>& areas = canvas.scene().areas;
  if (!areas.empty() && areas.back().isPlaced) {
    const gridbay::MapArea& area = areas.back();
    canvas.setFrame({area.grid.at(area.nx / 3.0, area.ny / 2.0), area.dx * kInView / canvas.width(), {}});
    settle();
    take("map-cells");
  }
  window.map().hide();
  window.resize(before);
}

// A picture of the first difference from the setup beside the document.
void takeComparison(MainWindow& window, const std::function<void(const QString&)>& take) {
  TabComparison* comparison = TabComparison::of(window.currentDocument());
  if (comparison == nullptr || !comparison->finish()) return;
  const QSize before = window.size();
  window.resize(1500, 860);
  QApplication::processEvents();
  comparison->goTo(0, true);
  take("compare");
  comparison->end();
  window.differences().hide();
  window.resize(before);
}

// Pictures of the start view, of a setup's first view and each page that its tree shows, of the map, of the
// help, and of each data file that is open. False where a file can't be opened, or a picture written.
bool takeScreenshots(MainWindow& window, const QStringList& paths, const QString& other,
                     const QString& folder) {
  bool isDone = true;
  const auto keep = [&](QWidget& shown, const QString& name) {
    QApplication::processEvents();
    const QString path = QString("%1/%2.png").arg(folder, name);
    if (!isDone || shown.grab().save(path)) return;
    tellOutside(QString("Cannot write %1").arg(path));
    isDone = false;
  };
  const auto take = [&](const QString& name) { keep(window, name); };
  QDir().mkpath(folder);
  window.show();
  take("start");
  if (!isDone || !openFiles(window, paths)) return false;
  if (window.currentDocument() == nullptr) window.newDocument(0);
  take("first-view");
  if (!other.isEmpty()) {
    if (!window.compareWith(other)) return false;
    takeComparison(window, take);
  }
  for (const auto& item : window.currentDocument()->editor().items()) {
    if (!item.visible || !window.currentDocument()->goToPage(item.id)) continue;
    take(QString("page-%1").arg(item.id));
  }
  takeMaps(window, take);
  if (QString error; window.help().showTopic(0, "Overview", &error)) {
    take("help");
  } else {
    tellOutside(error);
  }
  for (DataWindow* data : window.findChildren<DataWindow*>())
    keep(*data, QString("data-%1").arg(data->windowTitle()));
  return isDone;
}

}  // namespace

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QApplication::setApplicationDisplayName("VaneDeck");
  QApplication::setOrganizationName("VaneDeck");
  QApplication::setApplicationName("vanedeck-shell");
  QApplication::setApplicationVersion(GRIDBAY_VERSION);
  // By these a desktop knows the window as that of its entry.
  QApplication::setDesktopFileName("vanedeck-shell");
  QApplication::setWindowIcon(QIcon::fromTheme("vanedeck-shell"));
  QCommandLineParser parser;
  parser.setApplicationDescription("Opens setups in their editor.");
  parser.addHelpOption();
  parser.addVersionOption();
  parser.addOption({"edition", "The editor of new documents: v27 or wsk.", "edition", "v27"});
  parser.addOption({"new", "Begins with a new document where no setup is given."});
  parser.addOption({"compare", "Puts another setup beside the last one that is opened.", "setup"});
  parser.addOption({"screenshots", "Writes a picture of each page to a folder, and ends.", "folder"});
  parser.addOption({"exit-when-shown", "Ends once the window has been painted, as a benchmark wants it."});
  parser.addOption({"appearance", "Colours for this time: light or dark.", "colours"});
  parser.addPositionalArgument("file", "Setups and data files to open.");
  parser.process(application);
  const bool isUnattended = parser.isSet("screenshots") || parser.isSet("exit-when-shown");
  if (isUnattended) application.installEventFilter(new Unattended(&application));

  std::vector<std::unique_ptr<EditorLibrary>> libraries;
  QStringList names{"v27nested", "v27nestedwsk"};
  if (parser.value("edition") == "wsk") std::swap(names[0], names[1]);
  for (const QString& name : names) {
    QString error;
    if (auto library = EditorLibrary::load(name, &error)) {
      libraries.push_back(std::move(library));
    } else {
      QMessageBox::critical(nullptr, "VaneDeck", error);
    }
  }
  if (libraries.empty()) return 2;
  MainWindow window(std::move(libraries));
  if (parser.isSet("appearance"))
    setAppearance(parser.value("appearance") == "dark" ? Appearance::dark : Appearance::light);
  if (parser.isSet("screenshots")) {
    const bool isDone = takeScreenshots(window, parser.positionalArguments(), parser.value("compare"),
                                        parser.value("screenshots"));
    return isDone ? 0 : 2;
  }
  if (!openFiles(window, parser.positionalArguments()) && isUnattended) return 2;
  if (parser.isSet("compare")) window.compareWith(parser.value("compare"));
  if (parser.isSet("new") && window.currentDocument() == nullptr) window.newDocument(0);
  window.show();
  if (parser.isSet("exit-when-shown")) {
    QApplication::processEvents();
    return window.grab().isNull() ? 1 : 0;
  }
  window.offerRecovery();
  return QApplication::exec();
}
