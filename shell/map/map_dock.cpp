#include "shell/map/map_dock.h"

#include <QActionGroup>
#include <QFileDialog>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QMenu>
#include <QProgressDialog>
#include <QSplitter>
#include <QToolButton>
#include <algorithm>

#include "core/page_id.h"
#include "shell/grid_view.h"
#include "shell/map/map_export.h"

namespace gridbay::shell {
namespace {

constexpr auto kAreasPage = static_cast<std::int32_t>(PageId::bathymetry);
constexpr auto kSourcesPage = static_cast<std::int32_t>(PageId::sourceAndSink);
constexpr int kSinkColumn = 4;     // of that page, from 1
constexpr double kFarthest = 1e5;  // metres above and below

QIcon swatch(const QColor& colour) {
  QPixmap picture(14, 14);
  picture.fill(colour);
  return picture;
}

}  // namespace

MapDock::MapDock(QWidget* parent)
    : QDockWidget(tr("Map"), parent),
      tools_(new QToolBar(this)),
      canvas_(new MapCanvas(this)),
      readout_(new QLabel(this)),
      adviceStrip_(new AdviceStrip(this)) {
  setObjectName("map");
  toggleViewAction()->setShortcut(Qt::CTRL | Qt::Key_M);
  auto* content = new QWidget(this);
  auto* layout = new QVBoxLayout(content);
  layout->setContentsMargins(2, 2, 2, 2);
  layout->setSpacing(2);
  panel_ = makeLayerPanel();
  panel_->hide();
  buildTools();
  auto* split = new QSplitter(content);
  split->addWidget(canvas_);
  split->addWidget(panel_);
  split->setStretchFactor(0, 1);
  readout_->setTextInteractionFlags(Qt::TextSelectableByMouse);
  readout_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
  readout_->setAccessibleName(tr("Under the pointer"));
  readout_->setText(" ");
  layout->addWidget(tools_);
  layout->addWidget(split, 1);
  layout->addWidget(adviceStrip_);
  layout->addWidget(readout_);
  setWidget(content);

  refreshTimer_.setSingleShot(true);
  connect(&refreshTimer_, &QTimer::timeout, this, [this] {
    if (tab_ == nullptr) return;
    canvas_->refresh();
    canvas_->setMarks(marksOf(tab_->advice(), canvas_->scene()));
    followRow(tab_->currentRow());
  });
  connect(this, &QDockWidget::visibilityChanged, this, [this](bool) { follow(); });
  connect(canvas_, &MapCanvas::pointed, this,
          [this](const QString& text) { readout_->setText(text.isEmpty() ? " " : text); });
  connect(canvas_, &MapCanvas::featureChosen, this, [this](const MapFeature& feature) {
    goToRow(static_cast<PageId>(feature.id.page), feature.row, feature.column);
  });
  connect(canvas_, &MapCanvas::areaChosen, this,
          [this](int number) { goToRow(PageId::bathymetry, number, 0); });
  connect(canvas_, &MapCanvas::adviceChosen, this, [this](const std::vector<int>& advice) {
    if (tab_ != nullptr) adviceStrip_->showAdvice(tab_->advice(), advice);
  });
  connect(adviceStrip_, &AdviceStrip::chosen, this, [this](int place) {
    if (tab_ != nullptr) tab_->goToPlace(PagePlace(tab_->advice().at(static_cast<std::size_t>(place)).place));
  });
  connect(adviceStrip_, &AdviceStrip::fixWanted, this, [this](int place) {
    if (tab_ != nullptr) tab_->fixAdvice(static_cast<std::size_t>(place));
  });
  connect(canvas_, &MapCanvas::editing, this, [this] {
    if (tab_ != nullptr) tab_->commit();
  });
  connect(canvas_, &MapCanvas::edited, this, [this] {
    if (tab_ != nullptr) tab_->pane().refresh();
  });
  connect(canvas_, &MapCanvas::failed, this, [this](const QString& text) {
    readout_->setText(text);
    emit failed(text);
  });
  connect(canvas_, &MapCanvas::picked, this, &MapDock::takePick);
  connect(canvas_, &MapCanvas::nestedAreaWanted, this, &MapDock::askNestedArea);
  connect(canvas_, &MapCanvas::toolChanged, this, [this] {
    if (const auto found = toolActions_.find(canvas_->tool()); found != toolActions_.end())
      found->second->setChecked(true);
  });
  connect(canvas_, &MapCanvas::scaleChanged, this, &MapDock::showScale);
}

void MapDock::buildTools() {
  auto* group = new QActionGroup(this);
  const auto addTool = [&](MapTool tool, const QString& text, const QString& tip) {
    auto* action = new QAction(text, this);
    action->setCheckable(true);
    action->setToolTip(tip);
    group->addAction(action);
    connect(action, &QAction::triggered, this, [this, tool] {
      canvas_->setTool(tool);
      canvas_->setFocus();
    });
    toolActions_[tool] = action;
    return action;
  };
  tools_->setToolButtonStyle(Qt::ToolButtonTextOnly);
  tools_->addAction(addTool(MapTool::select, tr("Select"), tr("Choose and drag what is placed")));
  toolActions_[MapTool::select]->setChecked(true);

  auto* place = new QMenu(tr("Place"), this);
  place->addAction(addTool(MapTool::nestedArea, tr("Nested area"), tr("Draw a rectangle")));
  place->addSeparator();
  place->addAction(addTool(MapTool::source, tr("Source"), tr("Click")));
  place->addAction(addTool(MapTool::pair, tr("Source and sink"), tr("Click both")));
  place->addAction(addTool(MapTool::boundary, tr("Open boundary"), tr("Click both ends")));
  place->addAction(
      addTool(MapTool::massBudget, tr("Mass budget polygon"), tr("Click the corners, Return ends")));
  place->addSeparator();
  place->addAction(addTool(MapTool::dike, tr("Dike"), tr("Click the points, Return ends")));
  place->addAction(addTool(MapTool::weir, tr("Weir"), tr("Click the points, Return ends")));
  place->addAction(addTool(MapTool::culvert, tr("Culvert"), tr("Click the points, Return ends")));
  place->addSeparator();
  place->addAction(addTool(MapTool::outputPoint, tr("Output point"), tr("Click")));
  place->addAction(addTool(MapTool::outputLine, tr("Output line"), tr("Click both ends")));
  place->addAction(addTool(MapTool::outputArea, tr("Output area"), tr("Draw a rectangle")));
  auto* button = new QToolButton(tools_);
  button->setText(tr("Place"));
  button->setMenu(place);
  button->setPopupMode(QToolButton::InstantPopup);
  button->setFocusPolicy(Qt::StrongFocus);
  tools_->addWidget(button);

  pick_ = tools_->addAction(tr("Pick"), this, &MapDock::startPick);
  pick_->setToolTip(tr("Pick on the map what the page's current cell is to hold (Ctrl+Shift+M)"));
  pick_->setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_M);
  tools_->addSeparator();
  tools_->addAction(tr("Whole map"), canvas_, &MapCanvas::fit);
  QAction* layers = tools_->addAction(tr("Layers"));
  layers->setCheckable(true);
  connect(layers, &QAction::toggled, panel_, &QWidget::setVisible);
  tools_->addAction(tr("Export..."), this, &MapDock::askExport);
}

QWidget* MapDock::makeLayerPanel() {
  auto* panel = new QWidget(this);
  auto* layout = new QVBoxLayout(panel);
  layout->setContentsMargins(2, 0, 0, 0);
  layers_ = new QListWidget(panel);
  layers_->setAccessibleName(tr("Layers"));
  // The topmost first, as they lie on each other.
  for (std::size_t i = kMapLayers; i-- > 0;) {
    const auto layer = static_cast<MapLayer>(i);
    auto* item = new QListWidgetItem(swatch(layerColour(layer)), layerName(layer), layers_);
    item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsUserCheckable);
    item->setCheckState(Qt::Checked);
    item->setData(Qt::UserRole, static_cast<int>(i));
  }
  connect(layers_, &QListWidget::itemChanged, this, [this](const QListWidgetItem* item) {
    canvas_->setLayer(static_cast<MapLayer>(item->data(Qt::UserRole).toInt()),
                      item->checkState() == Qt::Checked);
  });
  colours_ = new QComboBox(panel);
  colours_->addItems({tr("Even steps"), tr("Sea"), tr("Grey")});
  colours_->setAccessibleName(tr("Colours"));
  automatic_ = new QCheckBox(tr("Scale by the data"), panel);
  automatic_->setChecked(true);
  const auto makeLimit = [&](const QString& name) {
    auto* limit = new QDoubleSpinBox(panel);
    limit->setRange(-kFarthest, kFarthest);
    limit->setDecimals(2);
    limit->setSuffix(" m");
    limit->setAccessibleName(name);
    limit->setEnabled(false);
    connect(limit, &QDoubleSpinBox::valueChanged, this, &MapDock::takeStyle);
    return limit;
  };
  least_ = makeLimit(tr("Least"));
  greatest_ = makeLimit(tr("Greatest"));
  land_ = new QCheckBox(tr("Land in a colour"), panel);
  zeroLine_ = new QCheckBox(tr("Zero line"), panel);
  hillShade_ = new QCheckBox(tr("Hill shade"), panel);
  layout->addWidget(layers_, 1);
  layout->addWidget(colours_);
  layout->addWidget(automatic_);
  auto* limits = new QHBoxLayout();
  limits->addWidget(least_);
  limits->addWidget(greatest_);
  layout->addLayout(limits);
  for (QCheckBox* check : {land_, zeroLine_, hillShade_}) {
    check->setChecked(true);
    layout->addWidget(check);
    connect(check, &QCheckBox::toggled, this, &MapDock::takeStyle);
  }
  connect(automatic_, &QCheckBox::toggled, this, &MapDock::takeStyle);
  connect(colours_, &QComboBox::currentIndexChanged, this, &MapDock::takeStyle);
  return panel;
}

void MapDock::takeStyle() {
  if (isShowingScale_) return;
  TerrainStyle style;
  style.colours = static_cast<TerrainColours>(colours_->currentIndex());
  style.land = land_->isChecked();
  style.zeroLine = zeroLine_->isChecked();
  style.hillShade = hillShade_->isChecked();
  if (!automatic_->isChecked()) {
    constexpr float kLeastRange = 0.01F;
    const auto least = static_cast<float>(least_->value());
    const float greatest = std::max(static_cast<float>(greatest_->value()), least + kLeastRange);
    style.scale = TerrainScale{least, greatest, canvas_->scale().value_or(TerrainScale{}).steepest};
  }
  for (QDoubleSpinBox* limit : {least_, greatest_}) limit->setEnabled(!automatic_->isChecked());
  canvas_->setStyle(style);
}

void MapDock::showScale() {
  if (!automatic_->isChecked() || !canvas_->scale()) return;
  isShowingScale_ = true;
  least_->setValue(canvas_->scale()->least);
  greatest_->setValue(canvas_->scale()->greatest);
  isShowingScale_ = false;
}

void MapDock::showDocument(DocumentTab* tab) {
  wanted_ = tab;
  follow();
}

// Shows what is wanted, while anyone can see it.
void MapDock::follow() {
  DocumentTab* tab = isVisible() ? wanted_.data() : nullptr;
  if (tab == tab_) return;
  if (tab_ != nullptr) {
    frames_[tab_] = canvas_->isFitted() ? std::nullopt : std::optional(canvas_->frame());
    disconnect(tab_, &DocumentTab::documentChanged, this, nullptr);
    disconnect(tab_, &DocumentTab::rowChosen, this, nullptr);
    disconnect(tab_, &DocumentTab::advised, this, nullptr);
  }
  tab_ = tab;
  if (tab == nullptr) {
    showAdvice();
    canvas_->setMarks({});
    return canvas_->showMap(nullptr);
  }
  connect(tab, &DocumentTab::documentChanged, this, &MapDock::refreshSoon);
  connect(tab, &DocumentTab::rowChosen, this, &MapDock::followRow);
  connect(tab, &DocumentTab::advised, this, &MapDock::showAdvice);
  if (!frames_.contains(tab)) {
    frames_.insert(tab, std::nullopt);
    connect(tab, &QObject::destroyed, this, [this](QObject* gone) {
      frames_.remove(gone);
      if (tab_ == nullptr) canvas_->showMap(nullptr);
    });
  }
  canvas_->showMap(&tab->editor().map(), frames_.value(tab));
  showAdvice();
  followRow(tab->currentRow());
}

void MapDock::refreshSoon() {
  refreshTimer_.start(0);
}

// Other advice has other places in its list, so none is chosen any more.
void MapDock::showAdvice() {
  adviceStrip_->showAdvice({}, {});
  if (tab_ != nullptr) canvas_->setMarks(marksOf(tab_->advice(), canvas_->scene()));
}

// Lights up what the row of the page tells of. What is chosen already stays so, though another row tells of
// it too.
void MapDock::followRow(int row) {
  if (tab_ == nullptr) return;
  const std::int32_t page = tab_->currentPage();
  if (page == kAreasPage && row > 0) return canvas_->selectFeature({}, row);
  const auto isOf = [&](const MapFeature& feature) {
    return feature.id.page == page && feature.row == row && row > 0;
  };
  const std::vector<MapFeature>& features = canvas_->scene().features;
  const std::optional<MapFeatureId> chosen = canvas_->drawing().selection.feature;
  const MapFeature* now = chosen ? canvas_->drawing().feature(*chosen) : nullptr;
  if (now != nullptr && now->id.page == page && (row == 0 || now->row == 0 || isOf(*now))) return;
  const auto found = std::ranges::find_if(features, isOf);
  canvas_->selectFeature(found == features.end() ? std::nullopt : std::optional(found->id));
}

// The keyboard stays on the map.
void MapDock::goToRow(PageId page, int row, int column) {
  if (tab_ == nullptr) return;
  PagePlace place{.page = page, .column = column};
  if (row > 0) place.entries = {{row}};
  tab_->goToPlace(place, DocumentTab::Keyboard::stays);
}

void MapDock::startPick() {
  if (wanted_ == nullptr) return;
  const std::optional<QModelIndex> cell = wanted_->pane().pointCell();
  if (!cell) return emit failed(tr("Choose a cell of the page that holds a point first."));
  if (!isVisible()) show();
  raise();
  follow();
  if (tab_ == nullptr) return;
  pickCell_ = *cell;
  const std::int32_t page = tab_->currentPage();
  const int row = tab_->currentRow();
  const int column = cell->column() + 1;
  // A point counts in the area that its row's feature stands on.
  pickArea_ = 1;
  for (const MapFeature& feature : canvas_->scene().features) {
    const bool isOf = feature.row > 0 ? feature.row == row : feature.column == column;
    if (feature.id.page != page || !isOf || feature.area < 1) continue;
    const bool isSink = page == kSourcesPage && column == kSinkColumn;
    pickArea_ = isSink ? feature.lastArea : feature.area;
  }
  if (const MapArea* area = canvas_->scene().area(row); page == kAreasPage && area != nullptr && row > 1)
    pickArea_ = area->enclosing;
  canvas_->setTool(MapTool::pick);
  canvas_->setFocus();
  readout_->setText(tr("Click on the point of area %1.").arg(pickArea_));
}

void MapDock::takePick(MapPoint place) {
  if (tab_ == nullptr || canvas_->editor() == nullptr || !pickCell_.isValid()) return;
  const std::optional<MapPick> pick = canvas_->editor()->pick(place, pickArea_);
  if (!pick) return emit failed(tr("There is no point of area %1.").arg(pickArea_));
  tab_->commit();
  const QModelIndex cell = pickCell_;
  pickCell_ = QPersistentModelIndex();
  if (!cell.isValid()) return;
  const_cast<QAbstractItemModel*>(cell.model())
      ->setData(cell, QString::fromStdString(pointText(pick->point)), Qt::EditRole);
  tab_->pane().refresh();
  canvas_->refresh();
}

void MapDock::askNestedArea(MapPoint corner, MapPoint opposite) {
  if (tab_ == nullptr || canvas_->editor() == nullptr) return;
  const QPointer<DocumentTab> tab = tab_;
  canvas_->setTool(MapTool::select);
  const AreaPlace place = canvas_->editor()->previewNestedArea(corner, opposite);
  const MapArea* enclosing = canvas_->scene().area(place.enclosing);
  const QString coarse = enclosing == nullptr ? QString() : QString::fromStdString(enclosing->file);
  QFileDialog open(this, tr("Raster that the area's grid is cut from"), QFileInfo(coarse).absolutePath());
  open.setFileMode(QFileDialog::ExistingFile);
  open.selectFile(coarse);
  if (open.exec() != QDialog::Accepted) return;
  QFileDialog save(this, tr("Grid file of the new area"), QFileInfo(coarse).absolutePath(),
                   tr("Grid files (*.tsb2)"));
  save.setAcceptMode(QFileDialog::AcceptSave);
  save.setDefaultSuffix("tsb2");
  if (save.exec() != QDialog::Accepted) return;
  if (tab_ == nullptr || tab_ != tab || canvas_->editor() == nullptr) return;
  tab_->commit();
  MapEditor& editor = *canvas_->editor();
  QProgressDialog progress(tr("Cutting the grid of the new area"), tr("Cancel"), 0, 100, this);
  progress.setWindowModality(Qt::WindowModal);
  const std::string fault =
      editor.addNestedArea(corner, opposite, open.selectedFiles().value(0).toStdString(),
                           save.selectedFiles().value(0).toStdString(), [&progress](double part) {
                             constexpr double kHundred = 100;
                             progress.setValue(static_cast<int>(part * kHundred));
                             return !progress.wasCanceled();
                           });
  progress.reset();
  if (!fault.empty()) emit failed(QString::fromStdString(fault));
  if (tab_ == nullptr) return;
  tab_->pane().refresh();
  canvas_->refresh();
}

QString MapDock::exportTo(const QString& path) {
  return exportMap(*canvas_, path);
}

void MapDock::askExport() {
  QFileDialog dialog(this, tr("Export the map"), {},
                     tr("Pictures (*.png);;Drawings (*.svg);;Documents (*.pdf)"));
  dialog.setAcceptMode(QFileDialog::AcceptSave);
  connect(&dialog, &QFileDialog::filterSelected, &dialog, [&dialog](const QString& filter) {
    dialog.setDefaultSuffix(filter.contains("svg") ? "svg" : filter.contains("pdf") ? "pdf" : "png");
  });
  dialog.setDefaultSuffix("png");
  if (dialog.exec() != QDialog::Accepted) return;
  if (const QString fault = exportTo(dialog.selectedFiles().value(0)); !fault.isEmpty()) emit failed(fault);
}

}  // namespace gridbay::shell
