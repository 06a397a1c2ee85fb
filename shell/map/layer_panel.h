#pragma once

#include <QCheckBox>
#include <QComboBox>
#include <QDoubleSpinBox>
#include <QListWidget>
#include <QSlider>
#include <QToolButton>
#include <QWidget>

#include "shell/map/map_canvas.h"

namespace gridbay::shell {

// The layers of the map in their order, the topmost first, with backgrounds among them, and how the terrain
// is coloured. What is chosen here is kept for each setup.
class LayerPanel final : public QWidget {
  Q_OBJECT
 public:
  LayerPanel(MapCanvas& canvas, QWidget* parent);

  // Takes what is kept for a setup, which has no name before it is saved first.
  void showSetup(const QString& path);
  // The setup that is shown has another file from now on.
  void nameSetup(const QString& path);
  const QString& setup() const { return setup_; }
  void addBackground(const QString& path);

  QListWidget& layers() { return *layers_; }
  QDoubleSpinBox& least() { return *least_; }
  QDoubleSpinBox& greatest() { return *greatest_; }
  QCheckBox& automatic() { return *automatic_; }
  QCheckBox& land() { return *land_; }
  QCheckBox& zeroLine() { return *zeroLine_; }
  QCheckBox& hillShade() { return *hillShade_; }
  QComboBox& colours() { return *colours_; }
  QSlider& opacity() { return *opacity_; }
  QComboBox& rasters() { return *rasters_; }
  // By its text.
  QToolButton* button(const QString& text);

 private:
  QWidget* makeButtons();
  void fillLayers();
  void tellScene();
  void takeCheck(const QListWidgetItem& item);
  void takeStyle();
  void giveStyle();
  void showScale();
  void showLimits(double least, double greatest, int decimals);
  void fitDecimals();
  void showButtons();
  void askBackground();
  void askColour();
  void save();
  // The background that is chosen in the list; 0 for none.
  int chosen() const;

  MapCanvas& canvas_;
  QString setup_;
  QListWidget* layers_;
  QSlider* opacity_;
  QComboBox* rasters_;  // in the file of a background that has several
  QComboBox* colours_;
  QCheckBox* automatic_;
  QDoubleSpinBox* least_;
  QDoubleSpinBox* greatest_;
  QCheckBox* land_;
  QCheckBox* zeroLine_;
  QCheckBox* hillShade_;
  float steepest_ = 1;      // of the scale, which it goes by as the hill shade does
  bool isShowing_ = false;  // what is set is what the map has
};

}  // namespace gridbay::shell
