// What is brought in from elsewhere, and where it goes.

#include <QFileInfo>
#include <QRegularExpression>
#include <QStatusBar>
#include <algorithm>

#include "shell/grid_view.h"
#include "shell/import/series_import.h"
#include "shell/import/terrain_import.h"
#include "shell/main_window.h"

namespace gridbay::shell {
namespace {

constexpr auto kAreasPage = static_cast<std::int32_t>(PageId::bathymetry);
constexpr int kAreasFileColumn = 1;

// The table of areas of a document, whose page is then open; null where the page is not shown.
GridModel* areasOf(DocumentTab& tab) {
  if (!tab.goToPage(kAreasPage)) return nullptr;
  auto* view = tab.pane().findChild<GridView*>();
  return view == nullptr ? nullptr : &view->cells();
}

// Columns of buttons have no name but dots.
QString nameOf(const SeriesPlace& place) {
  static const QRegularExpression dots("\\s*\\.\\.\\.\\s*");
  return QString::fromStdString(place.name).replace(dots, ' ' + MainWindow::tr("file"));
}

}  // namespace

// By the cell of the page, so that all happens that happens there, and is one step.
void MainWindow::useBathymetry(DocumentTab& tab, int area, const QString& map) {
  tabs_->setCurrentWidget(&tab);
  tab.commit();
  GridModel* areas = areasOf(tab);
  const QModelIndex cell = areas == nullptr ? QModelIndex() : areas->index(area - 1, kAreasFileColumn - 1);
  if (!cell.isValid() || !areas->setData(cell, map, Qt::EditRole))
    tell(tr("%1 can't be taken as area %2 of %3.").arg(map).arg(area).arg(tab.name()));
}

void MainWindow::importTerrain() {
  if (terrainImport_ == nullptr) {
    terrainImport_ = new TerrainImport([this](const QString&) { return bathymetryUses(); }, this);
    terrainImport_->setAttribute(Qt::WA_DeleteOnClose);
    connect(terrainImport_, &TerrainImport::viewWanted, this, [this](const QString& map) { openData(map); });
    connect(terrainImport_, &TerrainImport::helpWanted, this,
            [this] { showTopic(HelpDock::kImportTerrain, tr("Import Terrain")); });
    terrainImport_->show();
  }
  terrainImport_->raise();
  terrainImport_->activateWindow();
}

// The areas of the document that is open, and a new setup.
UseStrip::Offer MainWindow::bathymetryUses() {
  std::vector<UseStrip::Use> uses;
  if (DocumentTab* tab = currentDocument()) {
    const std::size_t count = tab->editor().map().scene().areas.size();
    for (int area = 1; area <= static_cast<int>(count); ++area) {
      uses.push_back({tr("Area %1 of %2").arg(area).arg(tab->name()),
                      [this, area, tab = QPointer(tab)](const QString& map) {
                        if (tab != nullptr) useBathymetry(*tab, area, map);
                      }});
    }
  }
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    uses.push_back({tr("a new setup: %1").arg(libraries_[i]->docString(CVdDocTemplate::kNewFileName)),
                    [this, i](const QString& map) { useBathymetry(*newDocument(i), 1, map); }});
  }
  return {std::move(uses)};
}

void MainWindow::importSeries() {
  if (seriesImport_ == nullptr) {
    const auto setup = [this] {
      SeriesImport::Setup found;
      DocumentTab* tab = currentDocument();
      if (tab == nullptr) return found;
      found.period = tab->editor().summary().period;
      found.state.emplace(tab, tab->editor().modelState());
      const QString path = QString::fromStdString(tab->editor().path());
      if (!path.isEmpty()) found.folder = QFileInfo(path).absolutePath();
      return found;
    };
    seriesImport_ = new SeriesImport(
        setup, [this](const QString& series) { return seriesUses(series); }, this);
    seriesImport_->setAttribute(Qt::WA_DeleteOnClose);
    connect(seriesImport_, &SeriesImport::imported, this,
            [this](const QString& summary) { statusBar()->showMessage(summary); });
    connect(seriesImport_, &SeriesImport::viewWanted, this,
            [this](const QString& series) { openData(series); });
    connect(seriesImport_, &SeriesImport::helpWanted, this,
            [this] { showTopic(HelpDock::kImportSeries, tr("Import Series")); });
    seriesImport_->show();
  }
  seriesImport_->raise();
  seriesImport_->activateWindow();
}

// Where the document that is open asks for such a series at present; else why nothing does.
UseStrip::Offer MainWindow::seriesUses(const QString& series) {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return {{}, tr("There is no setup open that could take the series.")};
  tab->commit();
  const SeriesPlaces found = tab->editor().seriesPlaces(series.toStdString());
  UseStrip::Offer offer;
  for (const SeriesPlace& place : found.places) {
    QString text = tr("%1 of %2").arg(nameOf(place), tab->name());
    QString format = QString::fromStdString(place.format.choice).trimmed();
    if (format.endsWith(':')) format.chop(1);
    if (!format.isEmpty()) text += tr(", given as \"%1\"").arg(format);
    // Of several items that fit it is told which one.
    const auto same = std::ranges::count(found.places, place.name, &SeriesPlace::name);
    if (same > 1) text += " (" + QString::fromStdString(place.item) + ')';
    offer.uses.push_back({text, [this, place, tab = QPointer(tab)](const QString& file) {
                            if (tab != nullptr) useSeries(*tab, place, file);
                          }});
  }
  if (!offer.uses.empty()) return offer;
  offer.why = tr("%1 has no place that takes such a series.").arg(tab->name());
  if (!found.others.empty()) {
    constexpr qsizetype kMost = 3;
    QStringList others;
    for (const std::string& other : found.others) others << QString::fromStdString(other);
    const QString more = others.size() > kMost ? ", ..." : "";
    offer.why += ' ' + tr("Asked for is: %1.").arg(others.mid(0, kMost).join(", ") + more);
  }
  return offer;
}

void MainWindow::useSeries(DocumentTab& tab, const SeriesPlace& place, const QString& series) {
  tabs_->setCurrentWidget(&tab);
  tab.commit();
  const std::string doubt = place.doubt.empty() ? "" : place.doubt + "\n\nTake the file all the same?";
  if (!doubt.empty() && !tab.askYesNo(doubt)) return;
  const std::string fault = tab.editor().useSeries(series.toStdString(), place);
  tab.goToPage(place.page);
  tab.pane().refresh();  // which may have been the page before
  if (!fault.empty()) {
    tell(QString::fromStdString(fault));
  } else {
    statusBar()->showMessage(tr("%1 has the series.").arg(nameOf(place)));
  }
}

void MainWindow::showTopic(int topic, const QString& caption) {
  QString error;
  if (!help_->showTopic(topic, caption, &error)) tell(error);
}

}  // namespace gridbay::shell
