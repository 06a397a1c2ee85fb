// What is brought in from elsewhere, and where it goes.

#include <QFileInfo>
#include <QStatusBar>

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
    terrainImport_ = new TerrainImport([this] { return bathymetryUses(); }, this);
    terrainImport_->setAttribute(Qt::WA_DeleteOnClose);
    connect(terrainImport_, &TerrainImport::viewWanted, this, [this](const QString& map) { openData(map); });
    connect(terrainImport_, &TerrainImport::helpWanted, this, [this] {
      QString error;
      if (!help_->showTopic(HelpDock::kImportTerrain, tr("Import Terrain"), &error)) tell(error);
    });
    terrainImport_->show();
  }
  terrainImport_->raise();
  terrainImport_->activateWindow();
}

// The areas of the document that is open, and a new setup.
std::vector<TerrainImport::Use> MainWindow::bathymetryUses() {
  std::vector<TerrainImport::Use> uses;
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
  return uses;
}

void MainWindow::importSeries() {
  std::optional<Period> period;
  QString folder;
  if (DocumentTab* tab = currentDocument()) {
    period = tab->editor().summary().period;
    const QString path = QString::fromStdString(tab->editor().path());
    if (!path.isEmpty()) folder = QFileInfo(path).absolutePath();
  }
  auto* dialog = new SeriesImport(period, folder, this);
  dialog->setAttribute(Qt::WA_DeleteOnClose);
  connect(dialog, &SeriesImport::imported, this,
          [this](const QString&, const QString& summary) { statusBar()->showMessage(summary); });
  dialog->open();
}

}  // namespace gridbay::shell
