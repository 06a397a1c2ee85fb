#pragma once

#include <QAction>
#include <QCheckBox>
#include <QComboBox>
#include <QDockWidget>
#include <QDoubleSpinBox>
#include <QHash>
#include <QLabel>
#include <QListWidget>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QTimer>
#include <QToolBar>
#include <map>

#include "shell/document_tab.h"
#include "shell/map/map_canvas.h"

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
  QListWidget& layers() { return *layers_; }
  QLabel& readout() { return *readout_; }
  // The advice of the mark that was clicked on last.
  AdviceStrip& adviceStrip() { return *adviceStrip_; }
  QToolBar& tools() { return *tools_; }
  QAction* toolAction(MapTool tool) { return toolActions_[tool]; }
  QAction* pickAction() { return pick_; }
  QDoubleSpinBox& least() { return *least_; }
  QDoubleSpinBox& greatest() { return *greatest_; }
  QCheckBox& automatic() { return *automatic_; }
  QComboBox& colours() { return *colours_; }
  // Writes the map as it is shown to a file, by its ending: png, svg or pdf. What is wrong, or empty.
  QString exportTo(const QString& path);

 signals:
  void failed(const QString& text);

 private:
  void buildTools();
  QWidget* makeLayerPanel();
  void takeStyle();
  void showScale();
  void follow();
  void followRow(int row);
  void showAdvice();
  void goToRow(PageId page, int row, int column);
  void refreshSoon();
  void takePick(MapPoint place);
  void askNestedArea(MapPoint corner, MapPoint opposite);
  void askExport();

  QPointer<DocumentTab> tab_;                        // that is shown here
  QPointer<DocumentTab> wanted_;                     // that is to be shown once the map is seen
  QHash<QObject*, std::optional<MapFrame>> frames_;  // nothing for the whole map
  QToolBar* tools_;
  MapCanvas* canvas_;
  QLabel* readout_;
  AdviceStrip* adviceStrip_;
  QWidget* panel_ = nullptr;
  QListWidget* layers_ = nullptr;
  QComboBox* colours_ = nullptr;
  QCheckBox* automatic_ = nullptr;
  QDoubleSpinBox* least_ = nullptr;
  QDoubleSpinBox* greatest_ = nullptr;
  QCheckBox* land_ = nullptr;
  QCheckBox* zeroLine_ = nullptr;
  QCheckBox* hillShade_ = nullptr;
  std::map<MapTool, QAction*> toolActions_;
  QAction* pick_ = nullptr;
  QTimer refreshTimer_;
  QPersistentModelIndex pickCell_;
  std::int32_t pickArea_ = 0;
  bool isShowingScale_ = false;
};

}  // namespace gridbay::shell
