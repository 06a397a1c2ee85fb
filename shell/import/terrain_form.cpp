#include "shell/import/terrain_form.h"

#include <QCompleter>
#include <QFileDialog>
#include <QFileInfo>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QSignalBlocker>
#include <QVBoxLayout>
#include <cmath>
#include <utility>

#include "conversion/item_types.h"
#include "platform/units/units.h"
#include "shell/import/terrain_plan.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr int kDigits = 3;  // behind the point, of coordinates in metres

// In the order of the enumerations.
QStringList resamplings() {
  return {QObject::tr("Bilinear"), QObject::tr("Nearest"), QObject::tr("Cubic"),
          QObject::tr("Mean"),     QObject::tr("Least"),   QObject::tr("Greatest")};
}
QStringList griddings() {
  return {QObject::tr("Linear between points"), QObject::tr("Nearest point"),
          QObject::tr("Inverse distance")};
}

// A number of two digits that count.
double roundNumber(double number) {
  const double unit = std::pow(10, std::floor(std::log10(number)) - 1);
  return std::round(number / unit) * unit;
}

}  // namespace

TerrainForm::TerrainForm(QWidget* parent)
    : QWidget(parent),
      file_(new QLineEdit(this)),
      raster_(new QComboBox(this)),
      band_(new QComboBox(this)),
      gridding_(new QComboBox(this)),
      crs_(new ProjectionSearch(this)),
      reproject_(new ProjectionSearch(this)),
      spacing_(makeNumber("spacing", &TerrainForm::sourceChanged)),
      spacingWanted_(new QLabel(this)),
      resampling_(new QComboBox(this)),
      west_(makeNumber("west", &TerrainForm::planChanged)),
      south_(makeNumber("south", &TerrainForm::planChanged)),
      east_(makeNumber("east", &TerrainForm::planChanged)),
      north_(makeNumber("north", &TerrainForm::planChanged)),
      itemType_(new QComboBox(this)),
      land_(makeNumber("land", &TerrainForm::planChanged)),
      missing_(makeNumber("missing", &TerrainForm::planChanged)),
      target_(new QLineEdit(this)) {
  auto* layout = new QVBoxLayout(this);
  layout->setContentsMargins({});
  for (QWidget* group : {makeSourceGroup(), makePlaceGroup(), makeWindowGroup(), makeValuesGroup()})
    layout->addWidget(group);
  layout->addStretch();
}

NumberEdit* TerrainForm::makeNumber(const char* name, void (TerrainForm::*changed)()) {
  auto* edit = new NumberEdit(this);
  edit->setObjectName(name);
  connect(edit, &QLineEdit::textChanged, this, changed);
  return edit;
}

QWidget* TerrainForm::withBrowse(QLineEdit* edit, void (TerrainForm::*browse)()) {
  auto* row = new QWidget(this);
  auto* layout = new QHBoxLayout(row);
  layout->setContentsMargins({});
  auto* button = new QPushButton("...", row);
  button->setAutoDefault(false);
  button->setAccessibleName(tr("Browse"));
  button->setMaximumWidth(button->fontMetrics().horizontalAdvance("......"));
  connect(button, &QPushButton::clicked, this, browse);
  layout->addWidget(edit);
  layout->addWidget(button);
  row->setFocusProxy(edit);
  return row;
}

QWidget* TerrainForm::makeSourceGroup() {
  auto* group = new QGroupBox(tr("Terrain"), this);
  source_ = new QFormLayout(group);
  file_->setObjectName("file");
  source_->addRow(tr("&File:"), withBrowse(file_, &TerrainForm::browseFile));
  source_->addRow(tr("&Raster:"), raster_);
  source_->addRow(tr("&Band:"), band_);
  source_->addRow(tr("&Gridding:"), gridding_);
  gridding_->addItems(griddings());
  raster_->setObjectName("raster");
  band_->setObjectName("band");
  gridding_->setObjectName("gridding");
  for (QComboBox* box : {raster_, band_, gridding_}) {
    box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    source_->setRowVisible(box, false);
    connect(box, &QComboBox::currentIndexChanged, this, [this, box] {
      if (box == raster_) band_->clear();
      emit sourceChanged();
    });
  }
  connect(file_, &QLineEdit::editingFinished, this, [this] { setFile(file_->text()); });
  return group;
}

QWidget* TerrainForm::makePlaceGroup() {
  auto* group = new QGroupBox(tr("Projection and spacing"), this);
  auto* form = new QFormLayout(group);
  crs_->setObjectName("crs");
  reproject_->setObjectName("reproject");
  resampling_->setObjectName("resampling");
  resampling_->addItems(resamplings());
  form->addRow(tr("&Projection of the file:"), crs_);
  form->addRow(tr("Bring &to:"), reproject_);
  form->addRow(tr("&Spacing [m]:"), spacing_);
  form->addRow(QString(), spacingWanted_);
  spacingWanted_->setObjectName("spacingWanted");
  spacingWanted_->setWordWrap(true);
  spacingWanted_->hide();
  connect(spacing_, &QLineEdit::textChanged, this, &TerrainForm::showSpacingWanted);
  form->addRow(tr("Resamp&ling:"), resampling_);
  reproject_->edit().setPlaceholderText(tr("as it is"));
  spacing_->setPlaceholderText(tr("as it is"));
  connect(crs_, &ProjectionSearch::chosen, this, &TerrainForm::sourceChanged);
  connect(reproject_, &ProjectionSearch::chosen, this, &TerrainForm::sourceChanged);
  connect(resampling_, &QComboBox::currentIndexChanged, this, &TerrainForm::sourceChanged);
  return group;
}

QWidget* TerrainForm::makeWindowGroup() {
  auto* group = new QGroupBox(tr("Window (or draw it on the picture)"), this);
  auto* grid = new QGridLayout(group);
  const auto add = [&](const QString& label, QWidget* edit, int row, int column) {
    auto* text = new QLabel(label, group);
    text->setBuddy(edit);
    grid->addWidget(text, row, column);
    grid->addWidget(edit, row, column + 1);
  };
  add(tr("&West:"), west_, 0, 0);
  add(tr("&East:"), east_, 0, 2);
  add(tr("So&uth:"), south_, 1, 0);
  add(tr("&North:"), north_, 1, 2);
  auto* whole = new QPushButton(tr("W&hole"), group);
  whole->setObjectName("whole");
  whole->setAutoDefault(false);
  connect(whole, &QPushButton::clicked, this, [this] { setWindow(whole_); });
  grid->addWidget(whole, 0, 4, 2, 1);
  QWidget* last = west_;
  for (QWidget* next : {static_cast<QWidget*>(east_), static_cast<QWidget*>(south_),
                        static_cast<QWidget*>(north_), static_cast<QWidget*>(whole)}) {
    setTabOrder(last, next);
    last = next;
  }
  return group;
}

QWidget* TerrainForm::makeValuesGroup() {
  auto* group = new QGroupBox(tr("Map"), this);
  auto* form = new QFormLayout(group);
  itemType_->setObjectName("itemType");
  itemType_->setEditable(true);
  itemType_->setInsertPolicy(QComboBox::NoInsert);
  itemType_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  for (const QunItem& quantity : qunItems())
    itemType_->addItem(QString::fromUtf8(quantity.name.data(), static_cast<qsizetype>(quantity.name.size())));
  itemType_->completer()->setCompletionMode(QCompleter::PopupCompletion);
  itemType_->completer()->setFilterMode(Qt::MatchContains);
  itemType_->setCurrentText(QString::fromUtf8(qunFindItem(item::kBathymetry)->name.data()));
  form->addRow(tr("&Item type:"), itemType_);
  form->addRow(tr("Land &value:"), land_);
  form->addRow(tr("&Missing values:"), missing_);
  missing_->setPlaceholderText(tr("the land value"));
  target_->setObjectName("target");
  form->addRow(tr("Write &as:"), withBrowse(target_, &TerrainForm::browseTarget));
  connect(itemType_, &QComboBox::currentTextChanged, this, &TerrainForm::planChanged);
  connect(target_, &QLineEdit::textChanged, this, &TerrainForm::planChanged);
  return group;
}

void TerrainForm::browseFile() {
  const QString path =
      QFileDialog::getOpenFileName(this, tr("Terrain"), file_->text(),
                                   tr("Rasters and points (*.tif *.tiff *.asc *.nc *.vrt *.img *.hgt *.dem "
                                      "*.bil *.flt *.grd *.xyz *.csv *.txt "
                                      "*.tsb2);;All files (*)"));
  if (!path.isEmpty()) setFile(path);
}

void TerrainForm::browseTarget() {
  const QString path = QFileDialog::getSaveFileName(
      this, tr("Write as"), target_->text(), tr("Maps (*.tsb2)"), nullptr, QFileDialog::DontConfirmOverwrite);
  if (path.isEmpty()) return;
  target_->setText(QFileInfo(path).suffix().isEmpty() ? path + ".tsb2" : path);
}

void TerrainForm::setFile(const QString& path) {
  if (path == taken_) return;
  taken_ = path;
  {
    const QSignalBlocker quiet(this);
    file_->setText(path);
    for (QComboBox* box : {raster_, band_}) box->clear();
    for (QComboBox* box : {raster_, band_, gridding_}) source_->setRowVisible(box, false);
    gridding_->setCurrentIndex(0);
    crs_->setText({});
    crs_->edit().setPlaceholderText({});
    reproject_->setText({});
    for (NumberEdit* edit : {spacing_, west_, south_, east_, north_, land_, missing_}) edit->clear();
    // Never over the file itself.
    const QFileInfo info(path);
    const QString name = info.completeBaseName() + (info.suffix() == "tsb2" ? "_new.tsb2" : ".tsb2");
    target_->setText(path.isEmpty() ? QString() : info.dir().filePath(name));
    whole_ = {};
    suggestedFor_.clear();
    natural_ = 0;
    isOfPoints_ = false;
    isFresh_ = true;
  }
  emit sourceChanged();
}

// What a modeller would give where the file leaves it open.
void TerrainForm::suggest(const RasterPreview& preview) {
  if (!land_->number()) land_->setNumber(preview.landValue.value_or(landAbove(preview)), kDigits);
  if (!preview.itemType.empty()) itemType_->setCurrentText(QString::fromStdString(preview.itemType));
  if (preview.isOfPoints) spacing_->setNumber(preview.spacing[0], 6);
}

// The projection, and the spacing there, of what is in degrees; true where there was none.
bool TerrainForm::suggestPlace(const RasterPreview& preview) {
  const QString zone = preview.unit.empty() || !reproject_->text().isEmpty() ? QString() : zoneOf(preview);
  if (!zone.isEmpty()) {
    reproject_->setText(zone);
    spacing_->clear();
    return true;
  }
  // What comes of another projection has no round spacing of its own. One that is taken away then stays so.
  if (std::exchange(suggestedFor_, reproject_->text()) == reproject_->text()) return false;
  if (reproject_->text().isEmpty() || !spacing_->text().isEmpty()) return false;
  spacing_->setNumber(roundNumber(preview.spacing[0]), 6);
  return true;
}

// Why the empty spacing will not do; empty where it does, or is given.
QString TerrainForm::spacingWanted() const {
  const bool isWanted = isOfPoints_ || !reproject_->text().isEmpty();
  if (!isWanted || !spacing_->text().trimmed().isEmpty()) return {};
  if (natural_ == 0) return tr("A spacing is wanted.");
  return isOfPoints_ ? tr("A spacing is wanted: the points lie about %1 apart.").arg(natural_, 0, 'g', 3)
                     : tr("A spacing is wanted: the projection leads to %1 m, which is no round one.")
                           .arg(natural_, 0, 'g', 6);
}

void TerrainForm::showSpacingWanted() {
  const QString why = spacingWanted();
  QPalette colours;
  colours.setColor(QPalette::WindowText, faultColour(colours));
  spacingWanted_->setPalette(colours);
  spacingWanted_->setText(why);
  spacingWanted_->setVisible(!why.isEmpty());
}

bool TerrainForm::show(const RasterPreview& preview) {
  const QSignalBlocker quiet(this);
  fill(*raster_, preview.rasters);
  // Of several rasters the first is looked at.
  if (preview.values.empty()) return true;
  fill(*band_, preview.bands);
  isOfPoints_ = preview.isOfPoints;
  source_->setRowVisible(gridding_, isOfPoints_);
  if (crs_->text().isEmpty() && reproject_->text().isEmpty()) {
    const QString own = QString::fromStdString(preview.projectionName);
    crs_->edit().setPlaceholderText(own.isEmpty() ? tr("none: local coordinates") : own);
  }
  if (isFresh_) suggest(preview);
  isFresh_ = false;
  const bool isChanged = suggestPlace(preview);
  if (spacing_->text().isEmpty()) natural_ = preview.spacing[0];
  spacing_->setPlaceholderText(tr("as it is: %1").arg(preview.spacing[0], 0, 'g', 6));
  showSpacingWanted();
  takeExtent(preview);
  return isChanged;
}

void TerrainForm::fill(QComboBox& box, const std::vector<std::string>& names) {
  const QSignalBlocker quiet(&box);
  for (std::size_t i = static_cast<std::size_t>(box.count()); i < names.size(); ++i)
    box.addItem(QString("%1  %2").arg(i + 1).arg(QString::fromStdString(names[i])));
  source_->setRowVisible(&box, box.count() > 1);
}

// A window that was drawn stays where the raster lies as before, up to a few points.
void TerrainForm::takeExtent(const RasterPreview& preview) {
  const QRectF extent = extentOf(preview);
  const QSizeF cell(preview.spacing[0], preview.spacing[1]);
  constexpr double kFew = 2;
  const auto isNear = [](double a, double b, double limit) { return std::abs(a - b) <= kFew * limit; };
  const double dx = std::max(cell.width(), cell_.width());
  const double dy = std::max(cell.height(), cell_.height());
  const bool stays = isNear(extent.left(), whole_.left(), dx) && isNear(extent.right(), whole_.right(), dx) &&
                     isNear(extent.top(), whole_.top(), dy) && isNear(extent.bottom(), whole_.bottom(), dy) &&
                     window().isValid() && !isWhole();
  whole_ = extent;
  cell_ = cell;
  if (!stays) setWindow(whole_);
}

bool TerrainForm::isWhole() const {
  const double x = cell_.width() / 4;
  const double y = cell_.height() / 4;
  return window().adjusted(-x, -y, x, y).contains(whole_);
}

void TerrainForm::setWindow(const QRectF& window) {
  {
    const QSignalBlocker quiet(this);
    // Degrees have more digits that count.
    const int digits =
        whole_.width() < 360 && whole_.height() < 360 && std::abs(whole_.left()) < 360 ? 6 : kDigits;
    west_->setNumber(window.left(), digits);
    south_->setNumber(window.top(), digits);
    east_->setNumber(window.right(), digits);
    north_->setNumber(window.bottom(), digits);
  }
  emit planChanged();
}

QRectF TerrainForm::window() const {
  for (const NumberEdit* edit : {west_, south_, east_, north_}) {
    if (!edit->number()) return {};
  }
  return {QPointF(*west_->number(), *south_->number()), QPointF(*east_->number(), *north_->number())};
}

std::optional<float> TerrainForm::landValue() const {
  const std::optional<double> land = land_->number();
  return land ? std::optional(static_cast<float>(*land)) : std::nullopt;
}

RasterConversion TerrainForm::preview() const {
  RasterConversion wanted;
  wanted.in = file_->text().toStdString();
  if (band_->count() > 1) wanted.band = band_->currentIndex() + 1;
  if (raster_->count() > 1) wanted.subdataset = raster_->currentIndex() + 1;
  wanted.crs = crs_->text().toStdString();
  wanted.reproject = reproject_->text().toStdString();
  wanted.resample = spacing_->number();
  wanted.resampling = static_cast<Resampling>(resampling_->currentIndex());
  if (isOfPoints_) wanted.gridding = static_cast<Gridding>(gridding_->currentIndex());
  return wanted;
}

RasterConversion TerrainForm::conversion() const {
  RasterConversion wanted = preview();
  wanted.out = target_->text().toStdString();
  wanted.land = landValue();
  wanted.itemType = itemType_->currentText().toStdString();
  if (const std::optional<double> missing = missing_->number())
    wanted.missingAs = static_cast<float>(*missing);
  if (!isWhole()) {
    const QRectF asked = window();
    wanted.extent = {asked.left(), asked.top(), asked.right(), asked.bottom()};
  }
  wanted.history = "terrain imported from " + wanted.in;
  return wanted;
}

QString TerrainForm::fault() {
  const auto refuse = [](QWidget* field, const QString& why) {
    field->setFocus();
    return why;
  };
  for (NumberEdit* edit : {spacing_, west_, south_, east_, north_, land_, missing_}) {
    if (edit->isFaulty()) return refuse(edit, tr("\"%1\" is no number.").arg(edit->text()));
  }
  if (spacing_->number() && *spacing_->number() <= 0)
    return refuse(spacing_, tr("The spacing is a number of metres above 0."));
  if (const QString why = spacingWanted(); !why.isEmpty()) return refuse(spacing_, why);
  for (ProjectionSearch* search : {crs_, reproject_}) {
    if (!search->text().isEmpty() && !search->isValid())
      return refuse(&search->edit(), tr("\"%1\" is no projection that is known here.").arg(search->text()));
  }
  if (!window().isValid())
    return refuse(west_, tr("The window goes from west to east and from south to north."));
  const Result<const QunItem*> type =
      itemTypeOfText(itemType_->currentText().toStdString(), "the list of the field has all");
  if (!type) return refuse(itemType_, QString::fromStdString(type.error()) + ".");
  if (land_->number() && *land_->number() < 0) return refuse(land_, tr("The land value is at least 0."));
  if ((*type)->code == item::kBathymetry && !land_->number())
    return refuse(land_, tr("A bathymetry needs a land value: points at or above it are land."));
  if (target_->text().isEmpty()) return refuse(target_, tr("The map needs the name of a file."));
  return {};
}

}  // namespace gridbay::shell
