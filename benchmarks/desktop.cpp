// The desktop, offscreen, on the shipped example: the plug-in, the window and the pages as a user has them.

#include <benchmark/benchmark.h>
#include <unistd.h>

#include <QApplication>
#include <QFile>
#include <QProcess>
#include <QScrollBar>
#include <QTemporaryDir>
#include <QTextStream>

#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "shell/grid_view.h"
#include "shell/main_window.h"

namespace gridbay::shell {
namespace {

constexpr int kValidate = 46019;

// The shipped example, made anew by the programs beside this one.
class Example {
 public:
  Example() {
    run("make_estuary", {folder_.path()});
    for (const char* name : {"estuary", "inlet"}) {
      run("v27setup", {"convert", "raster", QString(name) + ".asc", QString(name) + ".tsb2", "--land", "5",
                       "--crs", "UTM-32"});
    }
    run("v27setup", {"new", "s.v27", "--area", "estuary.tsb2", "--area", "inlet.tsb2@36,33"});
  }
  QString setup() const { return folder_.filePath("s.v27"); }

  // A setup of advection-dispersion with 16 components in 9 areas, and deposition on.
  QString manyComponents() const {
    std::string text =
        "VANE27_NESTED_MODEL {\nNESTED_MODEL_GLOBALS {\nMODULE_SELECTION { Simulation_Type 2 }\n"
        "BATHYMETRY_SELECTION {\nNo_Of_Areas 9\n";
    for (int area = 1; area <= 9; ++area) text += "AREA_" + std::to_string(area) + " {}\n";
    text += "}\n}\nADVECTION_DISPERSION_MODULE {\nCOMPONENT_SPECIFICATIONS {\nNo_Of_Components 16\n";
    for (int component = 1; component <= 16; ++component)
      text += "COMPONENT_" + std::to_string(component) + " {}\n";
    text +=
        "}\nDEPOSITION_CONCENTRATIONS { IncludeSurfaceDeposition #true; IncludeSoilDeposition #true "
        "}\n}\n}\n";
    QFile file(folder_.filePath("components.v27"));
    if (!file.open(QIODevice::WriteOnly) || file.write(text.data(), static_cast<qint64>(text.size())) < 0)
      qFatal("the setup cannot be written");
    return file.fileName();
  }

 private:
  void run(const QString& program, const QStringList& arguments) {
    QProcess process;
    process.setWorkingDirectory(folder_.path());
    process.start(QCoreApplication::applicationDirPath() + "/" + program, arguments);
    process.waitForFinished();
    if (process.exitCode() != 0)
      qFatal("%s failed: %s", qPrintable(program), process.readAllStandardError().data());
  }
  QTemporaryDir folder_;
};

const Example& example() {
  static const Example made;
  return made;
}

std::vector<std::unique_ptr<EditorLibrary>> libraries() {
  QString error;
  std::vector<std::unique_ptr<EditorLibrary>> found;
  found.push_back(EditorLibrary::load("v27nested", &error));
  if (found.back() == nullptr) qFatal("%s", qPrintable(error));
  return found;
}

class Window {
 public:
  explicit Window(const QString& setup = example().setup()) : window_(libraries()) {
    window_.show();
    window_.openDocument(setup);
    QApplication::processEvents();
  }
  DocumentTab& tab() { return *window_.currentDocument(); }

 private:
  MainWindow window_;
};

// A whole process: from its start until the window with the setup has been painted.
void firstWindow(benchmark::State& state) {
  const QString setup = example().setup();
  QTemporaryDir pictures;
  for (auto _ : state) {
    QProcess shell;
    shell.setStandardErrorFile(QProcess::nullDevice());
    shell.start(QCoreApplication::applicationDirPath() + "/vanedeck-shell", {"--exit-when-shown", setup});
    shell.waitForFinished();
    if (shell.exitCode() != 0) state.SkipWithError("the shell failed");
  }
}

void pageSwitch(benchmark::State& state) {
  Window window;
  const int pages[] = {27, 39, 28, 40, 26, 29, 35, 43};
  std::size_t next = 0;
  for (auto _ : state) {
    window.tab().goToPage(pages[next++ % std::size(pages)]);
    QApplication::processEvents();
  }
}

// Two grids with a band for each component and a row for each area.
void pageOfManyComponents(benchmark::State& state) {
  constexpr int kDeposition = 13;
  constexpr int kFloodAndDry = 26;
  Window window(example().manyComponents());
  for (auto _ : state) {
    state.PauseTiming();
    window.tab().goToPage(kFloodAndDry);
    QApplication::processEvents();
    state.ResumeTiming();
    window.tab().goToPage(kDeposition);
    QApplication::processEvents();
  }
  const auto* view = window.tab().pane().findChild<GridView*>();
  if (view == nullptr || view->model()->rowCount() != 160)
    state.SkipWithError("the page is not the one meant");
}

void validate(benchmark::State& state) {
  Window window;
  for (auto _ : state) window.tab().editor().command(kValidate);
}

void treeRules(benchmark::State& state) {
  Window window;
  SetupEditor& editor = window.tab().editor();
  for (auto _ : state) editor.applyRules();
}

void scrollGrid(benchmark::State& state) {
  Window window;
  window.tab().goToPage(40);
  auto* edit = qobject_cast<QLineEdit*>(window.tab().pane().widgetOf("Number of source sink pairs"));
  if (edit == nullptr) return state.SkipWithError("the count is not there");
  edit->setText("256");
  emit edit->editingFinished();
  auto* view = window.tab().pane().findChild<GridView*>();
  QScrollBar* bar = view->verticalScrollBar();
  QApplication::processEvents();
  if (bar->maximum() < 200) state.SkipWithError("the grid has no rows");
  for (auto _ : state) {
    bar->setValue((bar->value() + 7) % bar->maximum());
    view->viewport()->repaint();
  }
}

// The page of 1,000 dikes, the first of them, which is selected, with 100,000 points.
class DikePage {
 public:
  DikePage() : window_(makeSetup()) {
    window_.tab().goToPage(31);
    const QList<GridView*> grids = window_.tab().pane().findChildren<GridView*>();
    grids[0]->setCurrentIndex(grids[0]->cells().index(0, 0));
    points_ = grids[1];
    QApplication::processEvents();
    if (points_->cells().rowCount() != kPoints) qFatal("the points are not shown");
  }
  GridView& points() { return *points_; }

 private:
  static constexpr int kDikes = 1000;
  static constexpr int kPoints = 100'000;

  QString makeSetup() {
    const QString path = folder_.filePath("dikes.v27");
    QFile file(path);
    if (!file.open(QFile::WriteOnly)) qFatal("the setup cannot be written");
    QTextStream text(&file);
    text << "VANE27_NESTED_MODEL {\nHYDRODYNAMIC_MODULE {\nSTRUCTURES {\nDIKES {\n";
    for (int dike = 1; dike <= kDikes; ++dike) {
      text << "DIKE_" << dike << " {\n";
      for (int n = 1; dike == 1 && n <= kPoints; ++n)
        text << "POINT_" << n << " {\nx " << n << ".25\ny " << n << ".5\n}\n";
      text << "}\n";
    }
    text << "}\n}\n}\n}\n";
    return path;
  }

  QTemporaryDir folder_;
  Window window_;
  GridView* points_ = nullptr;
};

void scrollPoints(benchmark::State& state) {
  DikePage page;
  QScrollBar* bar = page.points().verticalScrollBar();
  for (auto _ : state) {
    bar->setValue((bar->value() + 7919) % bar->maximum());
    page.points().viewport()->repaint();
  }
}

void editPoint(benchmark::State& state) {
  DikePage page;
  GridModel& cells = page.points().cells();
  int value = 0;
  for (auto _ : state) {
    if (!cells.setData(cells.index(50'000, 0), QString::number(++value), Qt::EditRole))
      state.SkipWithError("the edit was not taken");
    QApplication::processEvents();
  }
}

// A map of 10,000 x 10,000 points, from the file to the painted window.
void openBigMap(benchmark::State& state) {
  constexpr std::size_t kPoints = 10000;
  QTemporaryDir folder;
  const QString path = folder.filePath("big.tsb2");
  TsbDefinition definition;
  definition.axes = {{.points = kPoints, .spacing = 10}, {.points = kPoints, .spacing = 10}};
  definition.items = {{.name = "Bathymetry", .type = item::kBathymetry, .unit = "m"}};
  Result<TsbWriter> writer = TsbWriter::create(path.toStdString(), definition);
  std::vector<float> row(kPoints);
  for (std::size_t k = 0; k < kPoints; ++k) {
    for (std::size_t j = 0; j < kPoints; ++j) row[j] = -static_cast<float>((j + k) % 977);
    if (!writer || !writer->writeRows(1, 0, k, row))
      return state.SkipWithError("the map could not be written");
  }
  if (!writer->commit()) return state.SkipWithError("the map could not be written");
  for (auto _ : state) {
    QString error;
    const std::unique_ptr<DataWindow> window(DataWindow::open(path, nullptr, &error));
    window->show();
    QApplication::processEvents();
    if (window->grab().isNull()) state.SkipWithError("nothing was painted");
  }
}

BENCHMARK(openBigMap)->Unit(benchmark::kMillisecond);
BENCHMARK(firstWindow)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(pageSwitch)->Unit(benchmark::kMillisecond);
BENCHMARK(pageOfManyComponents)->Unit(benchmark::kMillisecond);
BENCHMARK(validate)->Unit(benchmark::kMillisecond);
BENCHMARK(treeRules)->Unit(benchmark::kMicrosecond);
BENCHMARK(scrollGrid)->Unit(benchmark::kMillisecond);
BENCHMARK(scrollPoints)->Unit(benchmark::kMillisecond);
BENCHMARK(editPoint)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay::shell

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  QTemporaryDir home;
  for (const char* variable : {"XDG_DATA_HOME", "XDG_CONFIG_HOME"}) qputenv(variable, home.path().toUtf8());
  QApplication application(argc, argv);
  benchmark::Initialize(&argc, argv);
  benchmark::RunSpecifiedBenchmarks();
  return 0;
}
