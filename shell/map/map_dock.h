#pragma once

#include <QAction>
#include <QDockWidget>
#include <QHash>
#include <QLabel>
#include <QPointer>
#include <QTimer>
#include <QToolBar>
#include <QToolButton>
#include <map>
#include <memory>

#include "shell/document_tab.h"
#include "shell/map/dialog_aside.h"
#include "shell/map/layer_panel.h"
#include "shell/map/map_canvas.h"
#include "shell/map/map_export.h"
#include "shell/map/work_strip.h"

namespace gridbay::shell {

// The map of the document that is shown, with its tools, its layers, and what lies under the pointer. What is
// chosen on the map is chosen on its page, and the other way round. While it is hidden it asks for nothing.
class MapDock final : public QDockWidget {
  Q_OBJECT
 public:
  explicit MapDock(QWidget* parent);

  // Null where none is open. Each document keeps the part of the map that it was last seen with.
  void showDocument(DocumentTab* tab);
  // Lets the user point at what the page's current cell, which holds a point, is to hold.
  void startPick();

  MapCanvas& canvas() { return *canvas_; }
  LayerPanel& panel() { return *panel_; }
  QLabel& readout() { return *readout_; }
  // What the next click does.
  QLabel& hint() { return *hint_; }
  QToolButton& placeButton() { return *place_; }
  // The advice of the mark that was clicked on last.
  AdviceStrip& adviceStrip() { return *adviceStrip_; }
  QToolBar& tools() { return *tools_; }
  QAction* toolAction(MapTool tool) { return toolActions_[tool]; }
  QAction* pickAction() { return pick_; }
  // Begins to write the map as it is shown to a file, by its ending: png, svg or pdf.
  void exportTo(const QString& path);
  // What goes on beside the window: backgrounds that are read, and an export.
  WorkStrip& readingStrip() { return *readingStrip_; }
  WorkStrip& exportStrip() { return *exportStrip_; }

 signals:
  void failed(const QString& text);
  // An export has ended; what is wrong, or empty.
  void exported(const QString& path, const QString& fault);

 private:
  void buildTools();
  void buildStrips();
  void showTools();
  void follow();
  void followSetup();
  void followCell();
  void showFeature(const MapFeature& feature);
  void showAdvice();
  void goToRow(std::int32_t page, int row, int column);
  void refreshSoon();
  void showTool();
  void pickFor(PagePane* pane);
  void aim(const PagePane::PointPlace& place);
  void followPick();
  void takePick(const std::vector<PickedPlace>& places);
  void showMade(const MapFeature& feature);
  void askNestedArea(MapPoint corner, MapPoint opposite);
  void askExport();

  QPointer<DocumentTab> tab_;                        // that is shown here
  QPointer<DocumentTab> wanted_;                     // that is to be shown once the map is seen
  QHash<QObject*, std::optional<MapFrame>> frames_;  // nothing for the whole map
  QList<QMetaObject::Connection> links_;             // to the one that is shown
  QToolBar* tools_;
  MapCanvas* canvas_;
  QLabel* hint_;
  QLabel* readout_;
  LayerPanel* panel_;
  AdviceStrip* adviceStrip_;
  WorkStrip* readingStrip_;
  WorkStrip* exportStrip_;
  MapExport* export_;
  std::map<MapTool, QAction*> toolActions_;
  QAction* pick_ = nullptr;
  QToolButton* place_ = nullptr;
  QMetaObject::Connection pickLink_;  // to the one that is wanted
  QTimer refreshTimer_;
  QPointer<PagePane> pickPane_;  // of a page or a dialog, which is pointed for
  std::optional<PagePane::PointPlace> pickPlace_;
  std::unique_ptr<DialogAside> aside_;  // while it is for a dialog
  bool isShown_ = false;                // to the user: neither hidden nor behind another dock
};

}  // namespace gridbay::shell
