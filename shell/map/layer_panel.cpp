#include "shell/map/layer_panel.h"

#include <QColorDialog>
#include <QFileDialog>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QVBoxLayout>
#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

#include "map/map_names.h"
#include "shell/map/map_settings.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr double kFarthest = 1e5;  // metres above and below
constexpr int kWhole = 100;        // percent
constexpr int kLayerRole = Qt::UserRole;
constexpr int kBackgroundRole = Qt::UserRole + 1;

constexpr int kLeastDecimals = 2;
constexpr int kMostDecimals = 6;

// By which a thousandth of the range between two limits is told.
int decimalsFor(double least, double greatest) {
  const double range = greatest - least;
  if (!(range > 0)) return kLeastDecimals;
  return static_cast<int>(
      std::clamp(std::ceil(3 - std::log10(range)), 1.0 * kLeastDecimals, 1.0 * kMostDecimals));
}

// Whether a value says no more with all decimals than with some.
bool isToldBy(double value, int decimals) {
  constexpr double kRest = 1e-3;  // of the last one of them
  const double last = value * std::pow(10, decimals);
  return std::abs(last - std::round(last)) < kRest;
}

// With a border that is seen on any ground.
QIcon swatch(const QColor& colour, const QColor& border) {
  QPixmap picture(14, 14);
  picture.fill(border);
  QPainter(&picture).fillRect(1, 1, 12, 12, colour);
  return picture;
}

}  // namespace

LayerPanel::LayerPanel(MapCanvas& canvas, QWidget* parent)
    : QWidget(parent),
      canvas_(canvas),
      layers_(new QListWidget(this)),
      opacity_(new QSlider(Qt::Horizontal, this)),
      rasters_(new QComboBox(this)),
      colours_(new QComboBox(this)),
      automatic_(new QCheckBox(tr("Scale by the data"), this)),
      land_(new QCheckBox(tr("Land in a colour"), this)),
      zeroLine_(new QCheckBox(tr("Zero line"), this)),
      hillShade_(new QCheckBox(tr("Hill shade"), this)) {
  layers_->setAccessibleName(tr("Layers"));
  layers_->setTextElideMode(Qt::ElideMiddle);
  connect(layers_, &QListWidget::itemChanged, this, [this](const QListWidgetItem* item) {
    if (!isShowing_) takeCheck(*item);
  });
  connect(layers_, &QListWidget::currentItemChanged, this, &LayerPanel::showButtons);
  opacity_->setRange(0, kWhole);
  opacity_->setAccessibleName(tr("Opacity"));
  opacity_->setToolTip(tr("Opacity of the background"));
  connect(opacity_, &QSlider::valueChanged, this, [this](int value) {
    if (isShowing_) return;
    // The list stays as it is, and so does the slider that is at work.
    isShowing_ = true;
    canvas_.backgrounds().setOpacity(chosen(), static_cast<double>(value) / kWhole);
    isShowing_ = false;
    save();
  });
  rasters_->setAccessibleName(tr("Raster in the file"));
  rasters_->setToolTip(tr("Which of the rasters in the file is shown"));
  rasters_->setMinimumContentsLength(8);
  rasters_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  connect(rasters_, &QComboBox::currentTextChanged, this, [this](const QString& name) {
    if (!isShowing_) canvas_.backgrounds().setRaster(chosen(), name);
  });
  colours_->addItems({tr("Even steps"), tr("Sea"), tr("Grey")});
  colours_->setAccessibleName(tr("Colours"));
  automatic_->setChecked(true);
  const auto makeLimit = [&](const QString& name) {
    auto* limit = new QDoubleSpinBox(this);
    limit->setRange(-kFarthest, kFarthest);
    limit->setDecimals(kLeastDecimals);
    limit->setSuffix(" m");
    limit->setAccessibleName(name);
    limit->setEnabled(false);
    connect(limit, &QDoubleSpinBox::valueChanged, this, &LayerPanel::takeStyle);
    connect(limit, &QDoubleSpinBox::editingFinished, this, &LayerPanel::fitDecimals);
    return limit;
  };
  least_ = makeLimit(tr("Least"));
  greatest_ = makeLimit(tr("Greatest"));
  auto* layout = new QVBoxLayout(this);
  layout->setContentsMargins(2, 0, 0, 0);
  layout->addWidget(layers_, 1);
  layout->addWidget(makeButtons());
  layout->addWidget(opacity_);
  layout->addWidget(rasters_);
  layout->addWidget(colours_);
  layout->addWidget(automatic_);
  auto* limits = new QHBoxLayout();
  limits->addWidget(least_);
  limits->addWidget(greatest_);
  layout->addLayout(limits);
  for (QCheckBox* check : {land_, zeroLine_, hillShade_}) {
    check->setChecked(true);
    layout->addWidget(check);
    connect(check, &QCheckBox::toggled, this, &LayerPanel::takeStyle);
  }
  connect(automatic_, &QCheckBox::toggled, this, &LayerPanel::takeStyle);
  connect(colours_, &QComboBox::currentIndexChanged, this, &LayerPanel::takeStyle);
  connect(&canvas_, &MapCanvas::scaleChanged, this, &LayerPanel::showScale);
  connect(&canvas_, &MapCanvas::sceneChanged, this, &LayerPanel::tellScene);
  connect(&canvas_.backgrounds(), &MapBackgrounds::changed, this, [this] {
    if (isShowing_) return;
    fillLayers();
    save();
  });
  fillLayers();
}

QWidget* LayerPanel::makeButtons() {
  auto* buttons = new QWidget(this);
  auto* layout = new QHBoxLayout(buttons);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->setSpacing(2);
  const auto add = [&](const QString& text, const QString& tip, const std::function<void()>& act) {
    auto* button = new QToolButton(buttons);
    button->setText(text);
    button->setToolTip(tip);
    button->setFocusPolicy(Qt::StrongFocus);
    connect(button, &QToolButton::clicked, this, act);
    layout->addWidget(button);
  };
  add(tr("Add..."), tr("A raster or vector file as a background"), [this] { askBackground(); });
  add(tr("Remove"), tr("Remove the background"), [this] { canvas_.backgrounds().remove(chosen()); });
  add(tr("Up"), tr("Nearer to the top"), [this] { canvas_.backgrounds().move(chosen(), true); });
  add(tr("Down"), tr("Nearer to the bottom"), [this] { canvas_.backgrounds().move(chosen(), false); });
  add(tr("Colour..."), tr("Colour of its points and lines"), [this] { askColour(); });
  layout->addStretch();
  return buttons;
}

QToolButton* LayerPanel::button(const QString& text) {
  for (QToolButton* each : findChildren<QToolButton*>()) {
    if (each->text() == text) return each;
  }
  return nullptr;
}

int LayerPanel::chosen() const {
  const QListWidgetItem* item = layers_->currentItem();
  return item == nullptr ? 0 : item->data(kBackgroundRole).toInt();
}

void LayerPanel::fillLayers() {
  const bool outer = std::exchange(isShowing_, true);
  const int current = chosen();
  layers_->clear();
  const MapBackgrounds& backgrounds = canvas_.backgrounds();
  const auto addItem = [this](const QColor& colour, const QString& text, bool isOn) {
    auto* item = new QListWidgetItem(swatch(colour, palette().color(QPalette::Mid)), text, layers_);
    item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsUserCheckable);
    item->setCheckState(isOn ? Qt::Checked : Qt::Unchecked);
    return item;
  };
  const auto addBackgrounds = [&](std::size_t first, std::size_t last) {
    for (std::size_t i = last; i-- > first;) {
      const MapBackground& each = backgrounds.all()[i];
      const bool isRaster = !each.picture || each.picture->isRaster;
      QListWidgetItem* item = addItem(isRaster ? palette().color(QPalette::Mid) : each.colour,
                                      QFileInfo(each.path).fileName(), each.isShown);
      const QString told = MapBackgrounds::told(each);
      item->setToolTip(told.isEmpty() ? each.path : told);
      if (!told.isEmpty()) item->setText(item->text() + tr(" (!)"));
      if (each.picture && !each.picture->fault.isEmpty()) item->setForeground(faultColour(palette()));
      item->setData(kBackgroundRole, each.id);
      if (each.id == current) layers_->setCurrentItem(item);
    }
  };
  // The topmost first, as they lie on each other.
  for (std::size_t i = kMapLayers; i-- > 0;) {
    const auto layer = static_cast<MapLayer>(i);
    if (layer == MapLayer::terrain) addBackgrounds(backgrounds.below(), backgrounds.all().size());
    addItem(layerColour(layer), layerName(layer), canvas_.drawing().layers.test(i))
        ->setData(kLayerRole, static_cast<int>(i));
  }
  addBackgrounds(0, backgrounds.below());
  isShowing_ = outer;
  tellScene();
  showButtons();
}

// How many of a layer have no place on the map, and why.
void LayerPanel::tellScene() {
  const bool outer = std::exchange(isShowing_, true);
  std::array<QStringList, kMapLayers> missing;
  const auto add = [&missing](MapLayer layer, const QString& text, const std::string& fault) {
    missing[placeOf(layer)] << text + ": " + QString::fromStdString(fault);
  };
  for (const MapArea& area : canvas_.scene().areas) {
    if (!area.isPlaced) add(MapLayer::outlines, tr("Area %1").arg(area.number), area.fault);
  }
  for (const MapFeature& feature : canvas_.scene().features) {
    if (feature.points->empty())
      add(layerOf(feature.id.kind),
          QString("%1 %2").arg(QLatin1String(kindName(feature.id.kind))).arg(feature.id.number),
          feature.fault);
  }
  constexpr qsizetype kMostTold = 10;
  for (int i = 0; i < layers_->count(); ++i) {
    QListWidgetItem* item = layers_->item(i);
    if (item->data(kBackgroundRole).toInt() > 0) continue;
    const int layer = item->data(kLayerRole).toInt();
    const QStringList& told = missing[static_cast<std::size_t>(layer)];
    const QString name = layerName(static_cast<MapLayer>(layer));
    item->setText(told.isEmpty() ? name : tr("%1 (%2 without a place)").arg(name).arg(told.size()));
    item->setToolTip(told.mid(0, kMostTold).join('\n'));
  }
  isShowing_ = outer;
}

void LayerPanel::showButtons() {
  const MapBackground* background = canvas_.backgrounds().of(chosen());
  for (const char* text : {"Remove", "Up", "Down"}) button(tr(text))->setEnabled(background != nullptr);
  button(tr("Colour..."))
      ->setEnabled(background != nullptr && background->picture && !background->picture->isRaster);
  const bool outer = std::exchange(isShowing_, true);
  rasters_->clear();
  if (background != nullptr) rasters_->addItems(background->rasters);
  rasters_->setVisible(rasters_->count() > 1);
  if (background != nullptr) rasters_->setCurrentText(background->raster);
  opacity_->setEnabled(background != nullptr);
  opacity_->setValue(background == nullptr ? kWhole
                                           : static_cast<int>(std::lround(background->opacity * kWhole)));
  isShowing_ = outer;
}

void LayerPanel::takeCheck(const QListWidgetItem& item) {
  const bool isOn = item.checkState() == Qt::Checked;
  if (const int background = item.data(kBackgroundRole).toInt(); background > 0) {
    // Not at once: it fills the list anew, which is at work.
    QMetaObject::invokeMethod(
        this, [this, background, isOn] { canvas_.backgrounds().setShown(background, isOn); },
        Qt::QueuedConnection);
    return;
  }
  canvas_.setLayer(static_cast<MapLayer>(item.data(kLayerRole).toInt()), isOn);
  save();
}

void LayerPanel::takeStyle() {
  if (isShowing_) return;
  giveStyle();
  save();
}

void LayerPanel::giveStyle() {
  TerrainStyle style;
  style.colours = static_cast<TerrainColours>(colours_->currentIndex());
  style.land = land_->isChecked();
  style.zeroLine = zeroLine_->isChecked();
  style.hillShade = hillShade_->isChecked();
  if (!automatic_->isChecked()) {
    constexpr float kLeastRange = 1e-4F;
    const auto least = static_cast<float>(least_->value());
    const float next = std::nextafter(least, std::numeric_limits<float>::infinity());
    const float greatest = std::max({static_cast<float>(greatest_->value()), least + kLeastRange, next});
    style.scale = TerrainScale{least, greatest, steepest_};
  }
  for (QDoubleSpinBox* limit : {least_, greatest_}) limit->setEnabled(!automatic_->isChecked());
  canvas_.setStyle(style);
}

void LayerPanel::showScale() {
  if (!automatic_->isChecked() || !canvas_.scale()) return;
  const bool outer = std::exchange(isShowing_, true);
  const TerrainScale& scale = *canvas_.scale();
  steepest_ = scale.steepest;
  showLimits(scale.least, scale.greatest, decimalsFor(scale.least, scale.greatest));
  isShowing_ = outer;
}

void LayerPanel::showLimits(double least, double greatest, int decimals) {
  for (QDoubleSpinBox* limit : {least_, greatest_}) limit->setDecimals(decimals);
  least_->setValue(least);
  greatest_->setValue(greatest);
}

// As many as the range asks for, and no fewer than what has been typed.
void LayerPanel::fitDecimals() {
  if (automatic_->isChecked()) return;
  const bool outer = std::exchange(isShowing_, true);
  const double least = least_->value();
  const double greatest = greatest_->value();
  int decimals = decimalsFor(least, greatest);
  while (decimals < kMostDecimals && !(isToldBy(least, decimals) && isToldBy(greatest, decimals))) ++decimals;
  showLimits(least, greatest, decimals);
  isShowing_ = outer;
}

void LayerPanel::save() {
  if (isShowing_) return;
  MapSettings settings(setup_);
  // By their names, as layers may come and go.
  QStringList hidden;
  for (std::size_t i = 0; i < kMapLayers; ++i) {
    if (!canvas_.drawing().layers.test(i)) hidden << layerName(static_cast<MapLayer>(i));
  }
  settings.setValue("hidden", hidden);
  settings.setValue("colours", colours_->currentIndex());
  settings.setValue("land", land_->isChecked());
  settings.setValue("zeroLine", zeroLine_->isChecked());
  settings.setValue("hillShade", hillShade_->isChecked());
  // A scale belongs to its terrain.
  settings.setOwn("automatic", automatic_->isChecked());
  settings.setOwn("least", least_->value());
  settings.setOwn("greatest", greatest_->value());
  settings.setOwn("steepest", steepest_);
  settings.setOwn("backgrounds", canvas_.backgrounds().saved());
}

void LayerPanel::showSetup(const QString& path) {
  setup_ = path;
  isShowing_ = true;
  const MapSettings settings(setup_);
  const QStringList hidden = settings.value("hidden", {}).toStringList();
  for (std::size_t i = 0; i < kMapLayers; ++i) {
    const auto layer = static_cast<MapLayer>(i);
    canvas_.setLayer(layer, !hidden.contains(layerName(layer)));
  }
  colours_->setCurrentIndex(std::clamp(settings.value("colours", 0).toInt(), 0, colours_->count() - 1));
  land_->setChecked(settings.value("land", true).toBool());
  zeroLine_->setChecked(settings.value("zeroLine", true).toBool());
  hillShade_->setChecked(settings.value("hillShade", true).toBool());
  const QVariant isAutomatic = settings.own("automatic");
  automatic_->setChecked(!isAutomatic.isValid() || isAutomatic.toBool());
  if (!automatic_->isChecked()) {
    showLimits(settings.own("least").toDouble(), settings.own("greatest").toDouble(), kMostDecimals);
    fitDecimals();
    const QVariant steepest = settings.own("steepest");
    steepest_ = steepest.isValid() && steepest.toFloat() > 0 ? steepest.toFloat() : TerrainScale{}.steepest;
  }
  canvas_.backgrounds().restore(settings.own("backgrounds").toList());
  isShowing_ = false;
  fillLayers();
  giveStyle();
}

void LayerPanel::nameSetup(const QString& path) {
  if (path == setup_) return;
  setup_ = path;
  save();
}

void LayerPanel::addBackground(const QString& path) {
  canvas_.backgrounds().add(path);
}

void LayerPanel::askBackground() {
  QFileDialog dialog(this, tr("Background of the map"), QFileInfo(setup_).absolutePath());
  dialog.setFileMode(QFileDialog::ExistingFiles);
  if (dialog.exec() != QDialog::Accepted) return;
  for (const QString& path : dialog.selectedFiles()) addBackground(path);
}

void LayerPanel::askColour() {
  const MapBackground* background = canvas_.backgrounds().of(chosen());
  if (background == nullptr) return;
  const int id = background->id;
  canvas_.backgrounds().setColour(id, QColorDialog::getColor(background->colour, this));
}

}  // namespace gridbay::shell
