#include <QApplication>
#include <QCommandLineParser>
#include <QDir>
#include <QMessageBox>
#include <QPixmap>
#include <functional>

#include "core/page_place.h"
#include "shell/appearance.h"
#include "shell/main_window.h"

using namespace gridbay::shell;
using gridbay::PageId;

namespace {

void openFiles(MainWindow& window, const QStringList& paths) {
  for (const QString& path : paths) {
    if (DataWindow::isDataFile(path)) {
      window.openData(path);
    } else {
      window.openDocument(path);
    }
  }
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
// help, and of each data file that is open.
void takeScreenshots(MainWindow& window, const QStringList& paths, const QString& other,
                     const QString& folder) {
  const auto take = [&window, &folder](const QString& name) {
    QApplication::processEvents();
    window.grab().save(QString("%1/%2.png").arg(folder, name));
  };
  QDir().mkpath(folder);
  window.show();
  take("start");
  openFiles(window, paths);
  if (window.currentDocument() == nullptr) window.newDocument(0);
  take("first-view");
  if (!other.isEmpty() && window.compareWith(other)) takeComparison(window, take);
  for (const auto& item : window.currentDocument()->editor().items()) {
    if (!item.visible || !window.currentDocument()->goToPage(item.id)) continue;
    take(QString("page-%1").arg(item.id));
  }
  takeMaps(window, take);
  if (QString error; window.help().showTopic(0, "Overview", &error)) {
    take("help");
  } else {
    qWarning("%s", qPrintable(error));
  }
  for (DataWindow* data : window.findChildren<DataWindow*>()) {
    QApplication::processEvents();
    data->grab().save(QString("%1/data-%2.png").arg(folder, data->windowTitle()));
  }
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
    takeScreenshots(window, parser.positionalArguments(), parser.value("compare"),
                    parser.value("screenshots"));
    return 0;
  }
  openFiles(window, parser.positionalArguments());
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
