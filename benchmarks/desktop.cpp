// The desktop, offscreen, on the shipped example: the plug-in, the window and the pages as a user has them.

#include <benchmark/benchmark.h>
#include <unistd.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QScrollBar>
#include <QTemporaryDir>
#include <QTextStream>
#include <cmath>

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
  MapDock& map() { return window_.map(); }

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

// Nine areas of 10,000 x 10,000 points, each a third of the one around it in spacing and extent, on one file.
class NinePlaces {
 public:
  static constexpr std::size_t kPoints = 10000;
  static constexpr int kAreas = 9;

  // A step of the enclosing grid is three of the nested one's.
  static NinePlaces& instance() {
    static NinePlaces made;
    return made;
  }
  QString setup() const { return folder_.filePath("nine.v27"); }
  std::string grid(int area) const {
    return folder_.filePath(QString("grid%1.tsb2").arg(area)).toStdString();
  }

 private:
  NinePlaces() {
    for (int area = 1; area <= kAreas; ++area) {
      const double spacing = 6561 / std::pow(3, area - 1);
      TsbDefinition definition;
      definition.axes = {{.points = kPoints, .spacing = spacing}, {.points = kPoints, .spacing = spacing}};
      definition.items = {{.name = "Bathymetry", .type = item::kBathymetry, .unit = "m"}};
      definition.customBlocks = {{"V27_Misc", {0, 0, 0, 10, 0, 0, 0}}};
      Result<TsbWriter> writer = TsbWriter::create(grid(area), definition);
      constexpr std::size_t kRows = 100;
      std::vector<float> rows(kPoints * kRows);
      for (std::size_t k = 0; k < kPoints; k += kRows) {
        for (std::size_t i = 0; i < rows.size(); ++i)
          rows[i] = -20.0F * static_cast<float>(std::sin(static_cast<double>(i % kPoints) / 900) +
                                                std::cos(static_cast<double>(k + i / kPoints) / 700));
        if (!writer || !writer->writeRows(1, 0, k, rows)) qFatal("the grid could not be written");
      }
      if (!writer->commit()) qFatal("the grid could not be written");
    }
    QStringList arguments{"new", setup()};
    for (int area = 1; area <= kAreas; ++area)
      arguments << "--area" << QString::fromStdString(grid(area)) + (area > 1 ? "@3300,3300" : "");
    if (QProcess::execute(QCoreApplication::applicationDirPath() + "/v27setup", arguments) != 0)
      qFatal("the setup cannot be made");
  }
  QTemporaryDir folder_;
};

void waitFor(const MapCanvas& canvas) {
  while (!canvas.isSettled()) QApplication::processEvents(QEventLoop::AllEvents, 1);
}

// From the setup that is open until the whole map of its nine areas has been painted in full. "first" is the
// first time of all, with all files to be looked at (milliseconds).
void mapFirstPicture(benchmark::State& state) {
  Window window(NinePlaces::instance().setup());
  MapEditor& editor = window.tab().editor().map();
  double first = 0;
  for (auto _ : state) {
    QElapsedTimer timer;
    timer.start();
    MapCanvas canvas(nullptr);
    canvas.resize(700, 600);
    canvas.show();
    canvas.showMap(&editor);
    waitFor(canvas);
    if (canvas.grab().isNull()) state.SkipWithError("nothing was painted");
    if (canvas.terrain().size() != NinePlaces::kAreas) state.SkipWithError("the areas are not all there");
    if (first == 0) first = static_cast<double>(timer.nsecsElapsed()) * 1e-6;
  }
  state.counters["first"] = first;
}

// As many values of the same grids as the picture above has read, and no more.
void mapPlainRead(benchmark::State& state) {
  const QSize picture(700, 600);
  for (auto _ : state) {
    float sum = 0;
    for (int area = 1; area <= NinePlaces::kAreas; ++area) {
      const Result<StoredGrid> grid = StoredGrid::open(NinePlaces::instance().grid(area), 1);
      const auto rows = static_cast<std::size_t>(picture.height() / std::pow(3, area - 1)) + 1;
      std::vector<float> row(NinePlaces::kPoints);
      for (std::size_t r = 0; r < rows; ++r) {
        if (!grid || !grid->read(r * (NinePlaces::kPoints - 1) / rows, 0, row))
          state.SkipWithError("not read");
        sum += row[r];
      }
    }
    benchmark::DoNotOptimize(sum);
  }
}

// One frame of a pan and of a zoom, painted, while the finer picture is made beside it.
void mapFrames(benchmark::State& state, const std::function<void(MapFrame& frame, int step)>& change) {
  Window window(NinePlaces::instance().setup());
  MapCanvas& canvas = window.map().canvas();
  window.map().show();
  waitFor(canvas);
  int step = 0;
  for (auto _ : state) {
    MapFrame frame = canvas.frame();
    change(frame, step++);
    canvas.setFrame(frame);
    canvas.repaint();
    QApplication::processEvents();
  }
}

void mapPan(benchmark::State& state) {
  mapFrames(state, [](MapFrame& frame, int step) {
    frame.pan(QPointF(step / 40 % 2 == 0 ? 7 : -7, step / 80 % 2 == 0 ? 3 : -3));
  });
}

void mapZoom(benchmark::State& state) {
  mapFrames(state, [](MapFrame& frame, int step) {
    frame.zoom(step / 60 % 2 == 0 ? 1.05 : 1 / 1.05, {300, 260});
  });
}

// A frame with 1,000 dikes, weirs and culverts in view.
void mapOfStructures(benchmark::State& state) {
  Window window;
  MapDock& map = window.map();
  map.show();
  MapEditor& editor = window.tab().editor().map();
  const MapArea& area = *editor.scene().area(1);
  const MapGrid grid = area.grid;
  for (int i = 0; i < 1000; ++i) {
    std::vector<MapPoint> points;
    for (int n = 0; n < 20; ++n)
      points.push_back(grid.at(5 + i % 40 * 2.5 + n * 0.1, 5 + i / 40 * 3 + n % 3));
    const MapKind kind = i % 3 == 0 ? MapKind::dike : i % 3 == 1 ? MapKind::weir : MapKind::culvert;
    if (!editor.addFeature(kind, points).empty()) state.SkipWithError("no place for a structure");
  }
  map.canvas().refresh();
  waitFor(map.canvas());
  int step = 0;
  for (auto _ : state) {
    MapFrame frame = map.canvas().frame();
    frame.pan(QPointF(step++ / 40 % 2 == 0 ? 3 : -3, 0));
    map.canvas().setFrame(frame);
    map.canvas().repaint();
  }
}

BENCHMARK(mapFirstPicture)->Unit(benchmark::kMillisecond)->MeasureProcessCPUTime()->UseRealTime();
BENCHMARK(mapPlainRead)->Unit(benchmark::kMillisecond)->MeasureProcessCPUTime()->UseRealTime();
BENCHMARK(mapPan)->Unit(benchmark::kMillisecond)->MeasureProcessCPUTime()->UseRealTime();
BENCHMARK(mapZoom)->Unit(benchmark::kMillisecond)->MeasureProcessCPUTime()->UseRealTime();
BENCHMARK(mapOfStructures)->Unit(benchmark::kMillisecond)->MeasureProcessCPUTime()->UseRealTime();
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
