#include "shell/viewers/data_window.h"

#include <QDockWidget>
#include <QFileDialog>
#include <QFileInfo>
#include <QLabel>
#include <QMenuBar>
#include <QMessageBox>
#include <QStatusBar>
#include <QToolBar>

#include "shell/viewers/map_plot.h"
#include "shell/viewers/series_plot.h"

namespace gridbay::shell {
namespace {

constexpr QSize kSize(900, 640);

}  // namespace

bool DataWindow::isDataFile(const QString& path) {
  const QString kind = QFileInfo(path).suffix().toLower();
  return kind == "tsb0" || kind == "tsb1" || kind == "tsb2";
}

DataWindow* DataWindow::open(const QString& path, QWidget* parent, QString* error) {
  Result<TsbFile> file = TsbFile::open(path.toStdString());
  if (file && file->definition().pointCount() > 0 && file->definition().time.count > 0)
    return new DataWindow(std::move(*file), parent);
  *error = file ? tr("%1 has no values to show.").arg(path) : QString::fromStdString(file.error());
  return nullptr;
}

DataWindow::DataWindow(TsbFile file, QWidget* parent) : QMainWindow(parent), file_(std::move(file)) {
  setAttribute(Qt::WA_DeleteOnClose);
  setWindowTitle(QFileInfo(QString::fromStdString(file_.path())).fileName());
  resize(kSize);
  const bool isMap = file_.definition().axes.size() == 2;
  plot_ = isMap ? static_cast<PlotWidget*>(new MapPlot(file_, this)) : new SeriesPlot(file_, this);
  setCentralWidget(plot_);
  buildBars();
  auto* pointed = new QLabel(this);
  statusBar()->addWidget(pointed, 1);
  connect(plot_, &PlotWidget::pointed, pointed, &QLabel::setText);
  connect(plot_, &PlotWidget::failed, this, [this](const QString& text) { showFailure(text); });
  showValues();
  plot_->setMapCoordinates(isMap && file_.definition().geography.has_value());
  plot_->fit();
  plot_->setFocus();
}

void DataWindow::buildBars() {
  const TsbDefinition& definition = file_.definition();
  QMenu* menu = menuBar()->addMenu(tr("&File"));
  QAction* save = menu->addAction(tr("&Export picture..."), QKeySequence(Qt::CTRL | Qt::Key_E), this, [this] {
    const QString path =
        QFileDialog::getSaveFileName(this, {}, windowTitle() + ".png", tr("Pictures (*.png)"));
    if (!path.isEmpty()) exportPng(path);
  });
  menu->addAction(tr("&Close"), QKeySequence::Close, this, &QWidget::close);
  QMenu* view = menuBar()->addMenu(tr("&View"));
  QAction* fit =
      view->addAction(tr("&All"), QKeySequence(Qt::CTRL | Qt::Key_0), this, [this] { plot_->fit(); });

  QToolBar* bar = addToolBar(tr("View"));
  bar->setObjectName("view");
  bar->addAction(save);
  bar->addAction(fit);
  if (definition.axes.size() == 2) {
    QAction* coordinates = view->addAction(tr("&Map coordinates"));
    coordinates->setCheckable(true);
    coordinates->setChecked(definition.geography.has_value());
    connect(coordinates, &QAction::toggled, this, [this](bool on) { plot_->setMapCoordinates(on); });
    bar->addAction(coordinates);
    items_ = new QComboBox(this);
    for (const TsbItem& item : definition.items) items_->addItem(itemTitle(item));
    items_->setAccessibleName(tr("Item"));
    bar->addWidget(items_);
    connect(items_, &QComboBox::currentIndexChanged, this, [this] { showValues(); });
  } else {
    curves_ = new QListWidget(this);
    curves_->setAccessibleName(tr("Items"));
    for (const TsbItem& item : definition.items) {
      auto* entry = new QListWidgetItem(itemTitle(item), curves_);
      entry->setCheckState(curves_->count() == 1 ? Qt::Checked : Qt::Unchecked);
    }
    auto* dock = new QDockWidget(tr("Items"), this);
    dock->setObjectName("items");
    dock->setWidget(curves_);
    addDockWidget(Qt::RightDockWidgetArea, dock);
    dock->setVisible(definition.items.size() > 1);
    connect(curves_, &QListWidget::itemChanged, this, [this] { showValues(); });
  }
  const bool hasSteps = !definition.axes.empty() && definition.time.count > 1;
  if (!hasSteps) return;
  bar->addSeparator();
  steps_ = new QSlider(Qt::Horizontal, this);
  steps_->setRange(0, static_cast<int>(definition.time.count) - 1);
  steps_->setAccessibleName(tr("Time step"));
  time_ = new QLabel(this);
  bar->addWidget(steps_);
  bar->addWidget(time_);
  connect(steps_, &QSlider::valueChanged, this, [this] { showValues(); });
}

void DataWindow::showValues() {
  const auto step = static_cast<std::size_t>(steps_ == nullptr ? 0 : steps_->value());
  if (time_ != nullptr) time_->setText(stepText(file_.definition().time, step));
  if (items_ != nullptr) {
    plot_->showValues(static_cast<std::size_t>(items_->currentIndex()) + 1, step);
    return;
  }
  std::set<std::size_t> chosen;
  for (int i = 0; i < curves_->count(); ++i) {
    if (curves_->item(i)->checkState() == Qt::Checked) chosen.insert(static_cast<std::size_t>(i) + 1);
  }
  if (!chosen.empty()) plot_->showValues(*chosen.begin(), step);
  static_cast<SeriesPlot*>(plot_)->setItems(chosen);
}

void DataWindow::showItem(int item) {
  if (item < 1 || item > static_cast<int>(file_.definition().items.size())) return;
  if (items_ != nullptr) return items_->setCurrentIndex(item - 1);
  for (int i = 0; i < curves_->count(); ++i)
    curves_->item(i)->setCheckState(i == item - 1 ? Qt::Checked : Qt::Unchecked);
}

bool DataWindow::exportPng(const QString& path) {
  if (plot_->savePng(path, 0, 0, 2)) return true;
  showFailure(tr("The picture %1 could not be written.").arg(path));
  return false;
}

void DataWindow::showFailure(const QString& text) {
  statusBar()->showMessage(text, 10000);
}

}  // namespace gridbay::shell
