#include "shell/import/terrain_import.h"

#include <QFileInfo>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLocale>
#include <QMessageBox>
#include <QScrollArea>
#include <QStorageInfo>
#include <QVBoxLayout>
#include <algorithm>
#include <cmath>
#include <map>

#include "conversion/raster_preview.h"
#include "shell/import/file_drop.h"
#include "shell/import/terrain_plan.h"
#include "shell/import/work_host.h"
#include "shell/shades.h"
#include "shell/work_results.h"

namespace gridbay::shell {
namespace {

constexpr int kDelay = 300;  // milliseconds from an edit to the look at what it makes
constexpr int kMost = 1200;  // points of a picture along an axis
constexpr int kParts = 1000;

// Names the fields.
class FormConversion final : public WorkHost {
 public:
  using WorkHost::WorkHost;

  std::string option(std::string_view name, std::string_view) const override {
    static const std::map<std::string_view, std::string> kFields{
        {"band", "\"Band\""},        {"crs", "\"Projection of the file\""}, {"extent", "\"Window\""},
        {"land", "\"Land value\""},  {"nodata-as", "\"Missing values\""},   {"reproject", "\"Bring to\""},
        {"resample", "\"Spacing\""}, {"subdataset", "\"Raster\""}};
    const auto found = kFields.find(name);
    return found == kFields.end() ? std::string(name) : found->second;
  }
};

}  // namespace

TerrainImport::TerrainImport(std::function<UseStrip::Offer(const QString& map)> uses, QWidget* parent)
    : QDialog(parent), form_(new TerrainForm(this)), work_(nullptr) {
  setWindowTitle(tr("Import Terrain"));
  auto* layout = new QVBoxLayout(this);
  auto* columns = new QHBoxLayout;
  auto* fields = new QVBoxLayout;
  auto* scroll = new QScrollArea(this);
  scroll->setWidget(form_);
  scroll->setWidgetResizable(true);
  scroll->setFrameShape(QFrame::NoFrame);
  scroll->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  scroll->setMinimumWidth(form_->sizeHint().width() + scroll->fontMetrics().height());
  summary_ = new QLabel(this);
  summary_->setObjectName("summary");
  summary_->setTextInteractionFlags(Qt::TextSelectableByMouse);
  summary_->setMinimumHeight(3 * summary_->fontMetrics().lineSpacing());
  fields->addWidget(scroll, 1);
  fields->addWidget(summary_);
  columns->addLayout(fields);
  columns->addWidget(makePictures(), 1);
  layout->addLayout(columns, 1);
  status_ = new QLabel(this);
  status_->setWordWrap(true);
  layout->addWidget(status_);
  uses_ = new UseStrip(tr("Use the map as the bathymetr&y of"), std::move(uses), this);
  layout->addWidget(uses_);
  layout->addWidget(makeButtons());
  resize(1050, 720);

  connect(uses_, &UseStrip::viewWanted, this, &TerrainImport::viewWanted);
  new FileDrop(*this, [this](const QString& path) {
    if (stage_ != Stage::importing) form_->setFile(path);
  });
  delay_.setSingleShot(true);
  delay_.setInterval(kDelay);
  connect(&delay_, &QTimer::timeout, this, &TerrainImport::read);
  connect(form_, &TerrainForm::sourceChanged, this, &TerrainImport::readSoon);
  connect(form_, &TerrainForm::planChanged, this, &TerrainImport::showPlan);
  connect(preview_, &TerrainPreview::windowDrawn, this, &TerrainImport::takeWindow);
  connect(preview_, &TerrainPreview::pointed, pointed_, &QLabel::setText);
  connect(histogram_, &HeightHistogram::landDragged, this,
          [this](double land) { form_->land().setNumber(land, 3); });
  connect(&work_, &BackgroundWork::progressed, this,
          [this](double done) { progress_->setValue(static_cast<int>(std::lround(done * kParts))); });
  connect(&work_, &BackgroundWork::ended, this, [this](const std::optional<std::string>& bytes) {
    stage_ == Stage::importing ? takeImport(bytes) : takePreview(bytes);
  });
  preview_->showPreview(nullptr,
                        tr("Choose a file: a raster of any kind, or a text of points, x y z on each line."));
  enter(Stage::ready);
  form_->file().setFocus();
}

QWidget* TerrainImport::makePictures() {
  auto* pictures = new QWidget(this);
  auto* layout = new QVBoxLayout(pictures);
  layout->setContentsMargins({});
  auto* row = new QHBoxLayout;
  preview_ = new TerrainPreview(pictures);
  histogram_ = new HeightHistogram(pictures);
  row->addWidget(preview_, 1);
  row->addWidget(histogram_);
  pointed_ = new QLabel(pictures);
  pointed_->setObjectName("pointed");
  layout->addLayout(row, 1);
  layout->addWidget(pointed_);
  return pictures;
}

QWidget* TerrainImport::makeButtons() {
  auto* row = new QWidget(this);
  auto* layout = new QHBoxLayout(row);
  layout->setContentsMargins({});
  progress_ = new QProgressBar(row);
  progress_->setRange(0, kParts);
  cancel_ = new QPushButton(tr("&Cancel"), row);
  cancel_->setObjectName("cancel");
  import_ = new QPushButton(tr("Imp&ort"), row);
  import_->setObjectName("import");
  auto* help = new QPushButton(tr("Help"), row);
  help->setObjectName("help");
  auto* close = new QPushButton(tr("Close"), row);
  close->setObjectName("close");
  for (QPushButton* button : {cancel_, import_, help, close}) button->setAutoDefault(false);
  QSizePolicy stays = progress_->sizePolicy();
  stays.setRetainSizeWhenHidden(true);
  progress_->setSizePolicy(stays);
  layout->addWidget(progress_, 1);
  for (QPushButton* button : {cancel_, import_, help, close}) layout->addWidget(button);
  connect(cancel_, &QPushButton::clicked, this, &TerrainImport::cancel);
  // By its key it is pressed with the focus in an edit, which tells of another file once it is left.
  connect(import_, &QPushButton::clicked, this, [this] {
    import_->setFocus();
    if (import_->isEnabled()) startImport();
  });
  connect(help, &QPushButton::clicked, this, &TerrainImport::helpWanted);
  connect(close, &QPushButton::clicked, this, &QDialog::reject);
  return row;
}

void TerrainImport::enter(Stage stage) {
  stage_ = stage;
  const bool isAtWork = stage != Stage::ready;
  form_->setEnabled(stage != Stage::importing);
  preview_->setEnabled(stage != Stage::importing);
  histogram_->setEnabled(stage != Stage::importing);
  progress_->setVisible(isAtWork);
  progress_->setValue(0);
  cancel_->setVisible(isAtWork);
  import_->setEnabled(stage == Stage::ready && shown_);
}

void TerrainImport::tell(const QString& text, bool isFault) {
  QPalette colours;
  if (isFault) colours.setColor(QPalette::WindowText, faultColour(colours));
  status_->setPalette(colours);
  status_->setText(text);
}

void TerrainImport::readSoon() {
  work_.stop();
  uses_->hide();
  enter(Stage::ready);
  import_->setEnabled(false);
  delay_.start();
}

void TerrainImport::read() {
  tell({}, false);
  if (form_->file().text().isEmpty()) return;
  enter(Stage::reading);
  work_.begin([wanted = form_->preview()](const WorkApart::Progress& progress) {
    FormConversion host(progress);
    return packed(previewRaster(wanted, kMost, host));
  });
}

void TerrainImport::takePreview(const std::optional<std::string>& bytes) {
  const Result<RasterPreview> preview =
      bytes ? unpackedPreview(*bytes) : Failure{"The file can't be read: its reader came to a sudden end"};
  if (!preview) {
    shown_.reset();
    const QString why = QString::fromStdString(preview.error());
    preview_->showPreview(nullptr, why);
    histogram_->showHeights({});
    tell(why, true);
    enter(Stage::ready);
    summary_->clear();
    return;
  }
  const bool isAnother = form_->show(*preview);
  if (preview->values.empty() || isAnother) {
    // Of the same file with what was suggested.
    read();
    return;
  }
  shown_ = *preview;
  preview_->showPreview(&*shown_, {});
  histogram_->showHeights(shown_->values);
  enter(Stage::ready);
  showPlan();
}

void TerrainImport::showPlan() {
  if (!shown_) return;
  const std::optional<float> land = form_->landValue();
  preview_->setTint({histogram_->least(), histogram_->greatest(), land});
  preview_->setWindow(form_->window());
  histogram_->setLand(land);
  const RasterPreview& raster = *shown_;
  summary_->setText(form_->window().isValid() ? summaryOf(raster, form_->window(), land) : QString());
  if (stage_ == Stage::ready) uses_->hide();
  const QStorageInfo disk(QFileInfo(form_->target().text()).path());
  const auto [nx, ny] = pointsIn(raster, form_->window());
  const double size = static_cast<double>(sizeof(float)) * nx * ny;
  if (!raster.unit.empty()) {
    tell(tr("The raster is in %1. Bring it to a projection in metres.")
             .arg(QString::fromStdString(raster.unit)),
         true);
  } else if (disk.isValid() && size > static_cast<double>(disk.bytesAvailable())) {
    tell(tr("The disk of %1 has no room for the map: %2 are free.")
             .arg(form_->target().text(),
                  QLocale().formattedDataSize(disk.bytesAvailable(), 1, QLocale::DataSizeTraditionalFormat)),
         true);
  } else {
    tell({}, false);
  }
}

// To whole cells of the raster; all of it by a click.
void TerrainImport::takeWindow(const QRectF& drawn) {
  const QRectF whole = extentOf(*shown_);
  if (drawn.isEmpty()) {
    form_->setWindow(whole);
    return;
  }
  const auto rounded = [](double at, double first, double spacing) {
    return first + std::round((at - first) / spacing) * spacing;
  };
  const auto [dx, dy] = shown_->spacing;
  const QPointF corner(rounded(drawn.left(), whole.left(), dx), rounded(drawn.top(), whole.top(), dy));
  const QPointF opposite(rounded(drawn.right(), whole.left(), dx), rounded(drawn.bottom(), whole.top(), dy));
  form_->setWindow({corner, opposite});
}

void TerrainImport::startImport() {
  if (!shown_ || stage_ != Stage::ready) return;
  if (const QString fault = form_->fault(); !fault.isEmpty()) {
    tell(fault, true);
    return;
  }
  RasterConversion wanted = form_->conversion();
  made_ = QFileInfo(form_->target().text()).absoluteFilePath();
  wanted.out = made_.toStdString();
  if (QFileInfo::exists(made_)) {
    const auto answer = QMessageBox::question(
        this, windowTitle(), tr("\"%1\" is there already. Replace it?").arg(QFileInfo(made_).fileName()));
    if (answer != QMessageBox::Yes) return;
    wanted.force = true;
  }
  before_ = fileStamp(made_.toStdString());
  enter(Stage::importing);
  tell(tr("Importing..."), false);
  work_.begin(
      [wanted](const WorkApart::Progress& progress) {
        FormConversion host(progress);
        return packed(convertRaster(wanted, host));
      },
      made_);
}

void TerrainImport::takeImport(const std::optional<std::string>& bytes) {
  enter(Stage::ready);
  const Result<std::string> summary =
      bytes ? unpackedSummary(*bytes) : Failure{"The import came to a sudden end; nothing is written"};
  if (!summary) {
    tell(QString::fromStdString(summary.error()), true);
    return;
  }
  tell(QString::fromStdString(*summary).trimmed(), false);
  uses_->offer(made_);
}

void TerrainImport::cancel() {
  const bool wasImporting = stage_ == Stage::importing;
  work_.stop();
  delay_.stop();
  if (!wasImporting) {  // what is seen is not what the form asks for
    shown_.reset();
    preview_->showPreview(nullptr, tr("The reading was stopped."));
    histogram_->showHeights({});
    summary_->clear();
  }
  enter(Stage::ready);
  if (!wasImporting) {
    tell(tr("The reading was stopped."), false);
  } else if (fileStamp(made_.toStdString()) == before_) {
    tell(tr("The import was stopped; nothing is written."), false);
  } else {
    tell(tr("%1 was written before the import could be stopped.").arg(made_), false);
  }
}

// Return in a field is no end of the dialog, and Esc ends first what is going on.
void TerrainImport::keyPressEvent(QKeyEvent* event) {
  if (event->key() == Qt::Key_F1) {
    emit helpWanted();
  } else if (event->key() == Qt::Key_Escape && stage_ != Stage::ready) {
    cancel();
  } else {
    QDialog::keyPressEvent(event);
  }
}

// Fields that lose the focus as they go have nobody to tell any more.
TerrainImport::~TerrainImport() {
  for (QObject* part : std::initializer_list<QObject*>{form_, preview_, histogram_})
    disconnect(part, nullptr, this, nullptr);
}

void TerrainImport::done(int result) {
  work_.stop();
  QDialog::done(result);
}

}  // namespace gridbay::shell
