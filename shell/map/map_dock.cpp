#include "shell/map/map_dock.h"

#include <QActionGroup>
#include <QCoreApplication>
#include <QDialog>
#include <QFileDialog>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QMenu>
#include <QSplitter>
#include <QToolButton>
#include <algorithm>

#include "core/page_id.h"
#include "shell/map/map_rows.h"
#include "shell/map/map_settings.h"

namespace gridbay::shell {
namespace {

constexpr auto kAreasPage = static_cast<std::int32_t>(PageId::bathymetry);
// The cell of the flow's boundary page that says what drives a boundary: in its block of rows below the
// title.
constexpr ListEntry kBoundaryDataRow{2, 5};
constexpr int kBoundaryDataColumn = 2;
const QString kPanelKey = "panel";
const QString kFrameKey = "frame";

// The part of the map that a setup was last seen with; nothing for the whole map.
std::optional<MapFrame> keptFrame(const QString& setup) {
  const QVariantList kept = MapSettings(setup).own(kFrameKey).toList();
  if (kept.size() != 3 || !(kept[2].toDouble() > 0)) return std::nullopt;
  return MapFrame{{kept[0].toDouble(), kept[1].toDouble()}, kept[2].toDouble(), {}};
}

void keepFrame(const QString& setup, const std::optional<MapFrame>& frame) {
  QVariantList kept;
  if (frame) kept = {frame->centre.east, frame->centre.north, frame->metresPerPixel};
  MapSettings(setup).setOwn(kFrameKey, kept);
}

QString setupOf(DocumentTab& tab) {
  return QString::fromStdString(tab.editor().path());
}

}  // namespace

MapDock::MapDock(QWidget* parent)
    : QDockWidget(tr("Map"), parent),
      tools_(new QToolBar(this)),
      canvas_(new MapCanvas(this)),
      hint_(new QLabel(this)),
      readout_(new QLabel(this)),
      panel_(new LayerPanel(*canvas_, this)),
      adviceStrip_(new AdviceStrip(canvas_)),
      readingStrip_(new WorkStrip(this)),
      exportStrip_(new WorkStrip(this)),
      export_(new MapExport(*canvas_)) {
  setObjectName("map");
  toggleViewAction()->setShortcut(Qt::CTRL | Qt::Key_M);
  auto* content = new QWidget(this);
  auto* layout = new QVBoxLayout(content);
  layout->setContentsMargins(2, 2, 2, 2);
  layout->setSpacing(2);
  panel_->hide();
  buildTools();
  buildStrips();
  auto* split = new QSplitter(content);
  split->addWidget(canvas_);
  split->addWidget(panel_);
  split->setStretchFactor(0, 1);
  readout_->setTextInteractionFlags(Qt::TextSelectableByMouse);
  readout_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
  readout_->setAccessibleName(tr("Under the pointer"));
  readout_->setText(" ");
  QFont bold = hint_->font();
  bold.setWeight(QFont::DemiBold);
  hint_->setFont(bold);
  hint_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
  hint_->setAccessibleName(tr("What the next click does"));
  hint_->setText(canvas_->hint());
  // On the map, which stays as it is when the strip comes and goes.
  auto* over = new QVBoxLayout(canvas_);
  over->addStretch();
  over->addWidget(adviceStrip_);
  adviceStrip_->setAutoFillBackground(true);
  adviceStrip_->setCursor(Qt::ArrowCursor);
  layout->addWidget(tools_);
  layout->addWidget(split, 1);
  layout->addWidget(readingStrip_);
  layout->addWidget(exportStrip_);
  layout->addWidget(hint_);
  layout->addWidget(readout_);
  setWidget(content);

  refreshTimer_.setSingleShot(true);
  connect(&refreshTimer_, &QTimer::timeout, this, [this] {
    if (tab_ == nullptr) return;
    pickPlace_.reset();  // what it is to hold may be another thing now
    followSetup();
    canvas_->refresh();
    canvas_->setMarks(marksOf(tab_->advice(), canvas_->scene()));
    followCell();
  });
  // One behind another dock counts as visible, and only the signal tells.
  connect(this, &QDockWidget::visibilityChanged, this, [this](bool isShown) {
    if (!isShown && window()->isMinimized()) return;
    isShown_ = isShown;
    follow();
  });
  connect(canvas_, &MapCanvas::pointed, this,
          [this](const QString& text) { readout_->setText(text.isEmpty() ? " " : text); });
  connect(canvas_, &MapCanvas::featureChosen, this, &MapDock::showFeature);
  connect(canvas_, &MapCanvas::areaChosen, this, [this](int number) { goToRow(kAreasPage, number, 0); });
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
  connect(canvas_, &MapCanvas::featureMade, this, &MapDock::showMade);
  connect(canvas_, &MapCanvas::toolChanged, this, &MapDock::showTool);
}

void MapDock::buildTools() {
  auto* group = new QActionGroup(this);
  // Keys of one letter are those of the map, while it has the keyboard.
  const auto giveKey = [this](QAction* action, const QKeySequence& key, const QString& tip) {
    action->setShortcut(key);
    action->setShortcutContext(Qt::WidgetShortcut);
    action->setToolTip(QString("%1 (%2)").arg(tip, key.toString(QKeySequence::NativeText)));
    canvas_->addAction(action);
  };
  const auto addTool = [&](MapTool tool, const QKeySequence& key, const QString& text, const QString& tip) {
    auto* action = new QAction(text, this);
    action->setCheckable(true);
    giveKey(action, key, tip);
    group->addAction(action);
    connect(action, &QAction::triggered, this, [this, tool] {
      canvas_->setTool(tool);
      canvas_->setFocus();
    });
    toolActions_[tool] = action;
    return action;
  };
  tools_->setToolButtonStyle(Qt::ToolButtonTextOnly);
  tools_->addAction(addTool(MapTool::select, Qt::Key_S, tr("Select"), tr("Choose and drag what is placed")));
  toolActions_[MapTool::select]->setChecked(true);

  auto* place = new QMenu(tr("Place"), this);
  place->setToolTipsVisible(true);
  for (const PlacingTool& tool : placingTools()) {
    place->addAction(addTool(tool.tool, QString(tool.key), QCoreApplication::translate("Map", tool.name),
                             hintOf(tool, 0)));
    if (tool.endsGroup) place->addSeparator();
  }
  connect(canvas_, &MapCanvas::sceneChanged, this, &MapDock::showTools);
  place_ = new QToolButton(tools_);
  place_->setText(tr("Place"));
  place_->setMenu(place);
  place_->setPopupMode(QToolButton::InstantPopup);
  place_->setFocusPolicy(Qt::StrongFocus);
  place_->setCheckable(true);
  connect(place_, &QToolButton::clicked, this, &MapDock::showTool);  // the keyboard's has changed it
  tools_->addWidget(place_);

  pick_ = tools_->addAction(tr("Pick"), this, &MapDock::startPick);
  pick_->setToolTip(tr("Pick on the map what the page's current cell is to hold (Ctrl+Shift+M)"));
  pick_->setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_M);
  if (parentWidget() != nullptr) parentWidget()->addAction(pick_);  // also where the map is not shown
  pick_->setCheckable(true);
  tools_->addSeparator();
  QAction* whole = tools_->addAction(tr("Whole map"), canvas_, &MapCanvas::fit);
  whole->setToolTip(tr("Whole map (Home)"));
  QAction* layers = tools_->addAction(tr("Layers"));
  layers->setCheckable(true);
  giveKey(layers, Qt::Key_Y, tr("What is shown, and how"));
  connect(layers, &QAction::toggled, this, [this](bool isOpen) {
    panel_->setVisible(isOpen);
    MapSettings({}).setValue(kPanelKey, isOpen);
  });
  layers->setChecked(MapSettings({}).value(kPanelKey, false).toBool());
  giveKey(tools_->addAction(tr("Export..."), this, &MapDock::askExport), Qt::Key_E,
          tr("Write the map to a file"));
  for (auto* each : tools_->findChildren<QToolButton*>()) each->setFocusPolicy(Qt::StrongFocus);
}

// The tool in hand is named on the button that it came from.
void MapDock::showTool() {
  const PlacingTool* placing = placingTool(canvas_->tool());
  if (const auto found = toolActions_.find(canvas_->tool()); found != toolActions_.end()) {
    found->second->setChecked(true);
  } else if (QAction* checked = toolActions_[MapTool::select]->actionGroup()->checkedAction()) {
    checked->setChecked(false);
  }
  place_->setChecked(placing != nullptr);
  place_->setText(placing == nullptr
                      ? tr("Place")
                      : tr("Place: %1").arg(QCoreApplication::translate("Map", placing->name)));
  pick_->setChecked(canvas_->tool() == MapTool::pick);
  if (canvas_->tool() != MapTool::pick) aside_.reset();
  const QString hint = canvas_->hint();
  hint_->setText(hint);
  hint_->setToolTip(hint);
}

// What the module that is chosen has none of can't be drawn.
void MapDock::showTools() {
  const MapScene& scene = canvas_->scene();
  for (const MapTool tool :
       {MapTool::moduleOutputPoint, MapTool::moduleOutputLine, MapTool::moduleOutputArea})
    toolActions_[tool]->setEnabled(scene.moduleOutputs != 0);
  toolActions_[MapTool::discharge]->setEnabled(scene.moduleLines != 0);
  toolActions_[MapTool::box]->setEnabled(scene.moduleBoxes != 0);
}

void MapDock::showDocument(DocumentTab* tab) {
  if (tab != wanted_) {
    disconnect(pickLink_);
    if (tab != nullptr) pickLink_ = connect(tab, &DocumentTab::pickWanted, this, &MapDock::pickFor);
  }
  wanted_ = tab;
  follow();
}

// Shows what is wanted, while anyone can see it.
void MapDock::follow() {
  // An export goes on behind another dock.
  const bool isKept = isShown_ || (export_->isRunning() && wanted_ == tab_);
  DocumentTab* tab = isKept ? wanted_.data() : nullptr;
  if (tab == tab_) return;
  if (tab_ != nullptr) {
    if (export_->isRunning()) emit failed(tr("The export was stopped; nothing is written."));
    frames_[tab_] = canvas_->isFitted() ? std::nullopt : std::optional(canvas_->frame());
    keepFrame(setupOf(*tab_), frames_[tab_]);
    export_->cancel();
    exportStrip_->hide();
    for (const auto& signal : links_) disconnect(signal);
    links_.clear();
  }
  tab_ = tab;
  if (tab == nullptr) {
    showAdvice();
    canvas_->setMarks({});
    panel_->showSetup({});
    return canvas_->showMap(nullptr);
  }
  panel_->showSetup(setupOf(*tab));
  links_ = {connect(tab, &DocumentTab::documentChanged, this, &MapDock::refreshSoon),
            connect(tab, &DocumentTab::cellChosen, this, &MapDock::followCell),
            connect(tab, &DocumentTab::advised, this, &MapDock::showAdvice),
            connect(tab, &DocumentTab::saved, this, [this] { panel_->nameSetup(setupOf(*tab_)); })};
  if (!frames_.contains(tab)) {
    frames_.insert(tab, keptFrame(setupOf(*tab)));
    connect(tab, &QObject::destroyed, this, [this](QObject* gone) {
      frames_.remove(gone);
      if (tab_ == nullptr) canvas_->showMap(nullptr);
    });
  }
  canvas_->showMap(&tab->editor().map(), frames_.value(tab));
  showAdvice();
  followCell();
}

// A tab may be there before the setup that is opened in it.
void MapDock::followSetup() {
  const QString setup = setupOf(*tab_);
  if (setup == panel_->setup()) return;
  panel_->showSetup(setup);
  if (const std::optional<MapFrame> frame = keptFrame(setup)) canvas_->setFrame(*frame);
}

void MapDock::refreshSoon() {
  refreshTimer_.start(0);
}

// Other advice has other places in its list, so none is chosen any more.
void MapDock::showAdvice() {
  adviceStrip_->showAdvice({}, {});
  if (tab_ != nullptr) canvas_->setMarks(marksOf(tab_->advice(), canvas_->scene()));
}

// Lights up what the cell of the page tells of. What is chosen already stays so, though the cell tells of
// another one too, or the page has just been opened.
void MapDock::followCell() {
  if (tab_ == nullptr) return;
  followPick();
  const std::int32_t page = tab_->currentPage();
  const PagePane::Cell cell = tab_->pane().currentCell();
  if (page == kAreasPage && cell.row > 0) return canvas_->selectFeature({}, cell.row);
  const MapScene& scene = canvas_->scene();
  const auto isOf = [&](const MapFeature& feature) { return tellsOf(scene, page, cell, feature); };
  const std::optional<MapFeatureId> chosen = canvas_->drawing().selection.feature;
  const MapFeature* now = chosen ? canvas_->drawing().feature(*chosen) : nullptr;
  const bool isOfPage = now != nullptr && (now->id.page == page || isFurtherPageOf(now->id.kind, page));
  if (isOfPage && (cell.row == 0 || isOf(*now))) return;
  const auto found = std::ranges::find_if(scene.features, isOf);
  canvas_->selectFeature(found == scene.features.end() ? std::nullopt : std::optional(found->id));
}

// Stays on a page that says more of it.
void MapDock::showFeature(const MapFeature& feature) {
  if (tab_ == nullptr) return;
  if (isFurtherPageOf(feature.id.kind, tab_->currentPage())) {
    tab_->goToPlace({.page = static_cast<PageId>(tab_->currentPage()),
                     .entries = {{feature.id.number, countOf(canvas_->scene(), feature.id.kind)}}},
                    DocumentTab::Keyboard::stays);
  } else {
    goToRow(feature.id.page, feature.row, feature.column);
  }
}

// The keyboard stays on the map.
void MapDock::goToRow(std::int32_t page, int row, int column) {
  if (tab_ == nullptr) return;
  PagePlace place{.page = static_cast<PageId>(page), .column = column};
  if (row > 0) place.entries = {{row}};
  tab_->goToPlace(place, DocumentTab::Keyboard::stays);
}

void MapDock::startPick() {
  showTool();  // the press of the button has not changed it
  if (wanted_ != nullptr) pickFor(&wanted_->pane());
}

void MapDock::pickFor(PagePane* pane) {
  const std::optional<PagePane::PointPlace> place = pane->pointPlace();
  if (!place) return emit failed(tr("Choose a cell of the page that holds a point first."));
  show();
  raise();
  if (tab_ == nullptr) return;
  // What is typed there is entered first, and may be what it is about.
  pickPane_ = pane;
  pane->commit();
  if (pickPane_ == nullptr || !pane->pick(*place)) return;
  aim(*place);
  if (auto* dialog = qobject_cast<QDialog*>(pane->window())) {
    adviceStrip_->showAdvice({}, {});  // no fix of the model meanwhile
    aside_ = std::make_unique<DialogAside>(*dialog, *canvas_);
  }
  canvas_->window()->activateWindow();
  canvas_->setFocus();
}

void MapDock::aim(const PagePane::PointPlace& place) {
  pickPlace_ = place;
  if (const auto pick = pickPane_->pick(place)) canvas_->startPick(*pick);
}

// A pick goes on with another cell that is chosen, and ends with the page.
void MapDock::followPick() {
  if (canvas_->tool() != MapTool::pick) return;
  const auto place = pickPane_ == nullptr ? std::nullopt : pickPane_->pointPlace();
  if (!place) {
    canvas_->setTool(MapTool::select);
  } else if (pickPlace_ != *place) {
    aim(*place);
  }
}

void MapDock::takePick(const std::vector<PickedPlace>& places) {
  const auto place = std::exchange(pickPlace_, std::nullopt);
  if (tab_ == nullptr || pickPane_ == nullptr || !place || !pickPane_->pick(*place)) return;
  if (!pickPane_->storePick(*place, places)) emit failed(tr("The cell does not take this."));
}

// What drives a new boundary is a level of 0 until its page says otherwise.
void MapDock::showMade(const MapFeature& feature) {
  if (tab_ == nullptr || feature.id.kind != MapKind::boundary) return showFeature(feature);
  canvas_->setTool(MapTool::select);
  const int count = countOf(canvas_->scene(), MapKind::boundary);
  tab_->goToPlace({.page = PageId::hdBoundary,
                   .entries = {{feature.id.number, count}, kBoundaryDataRow},
                   .column = kBoundaryDataColumn});
  readout_->setText(tr("Say on the page what drives boundary %1.").arg(feature.id.number));
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
  const std::string fault =
      canvas_->editor()->addNestedArea(corner, opposite, open.selectedFiles().value(0).toStdString(),
                                       save.selectedFiles().value(0).toStdString());
  if (!fault.empty()) emit failed(QString::fromStdString(fault));
  if (tab_ == nullptr) return;
  tab_->pane().refresh();
  canvas_->refresh();
}

void MapDock::exportTo(const QString& path) {
  export_->begin(path);
}

void MapDock::buildStrips() {
  MapBackgrounds& backgrounds = canvas_->backgrounds();
  connect(&backgrounds, &MapBackgrounds::reading, this, [this](const QString& path, double done) {
    readingStrip_->showWork(tr("Reading %1").arg(QFileInfo(path).fileName()), done);
  });
  connect(&backgrounds, &MapBackgrounds::readingEnded, readingStrip_, &QWidget::hide);
  connect(readingStrip_, &WorkStrip::cancelled, &backgrounds, &MapBackgrounds::stopReading);
  connect(export_, &MapExport::progressed, this, [this](const QString& path, double done) {
    exportStrip_->showWork(tr("Exporting %1").arg(QFileInfo(path).fileName()), done);
  });
  connect(export_, &MapExport::ended, this, [this](const QString& path, const QString& fault) {
    exportStrip_->hide();
    if (fault.isEmpty()) readout_->setText(tr("\"%1\" is written.").arg(path));
    if (!fault.isEmpty()) emit failed(fault);
    emit exported(path, fault);
    follow();
  });
  connect(exportStrip_, &WorkStrip::cancelled, this, [this] {
    export_->cancel();
    exportStrip_->hide();
    readout_->setText(tr("The export was stopped; nothing is written."));
    follow();
  });
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
  exportTo(dialog.selectedFiles().value(0));
}

}  // namespace gridbay::shell
