#pragma once

#include <QComboBox>
#include <QListWidget>
#include <QMainWindow>
#include <QSlider>
#include <memory>

#include "platform/tsb/tsb_file.h"
#include "shell/viewers/plot_widget.h"

namespace gridbay::shell {

// The window of a data file: a map, curves against time, or a profile, with the choice of item and time step,
// and a way to a picture.
class DataWindow final : public QMainWindow {
  Q_OBJECT
 public:
  // Null, with the reason, for a file that can't be shown.
  static DataWindow* open(const QString& path, QWidget* parent, QString* error);
  static bool isDataFile(const QString& path);

  PlotWidget& plot() { return *plot_; }
  QComboBox* items() { return items_; }
  QSlider* steps() { return steps_; }
  QListWidget* curves() { return curves_; }
  // Shows an item, from 1, and no other; one that is not there changes nothing.
  void showItem(int item);
  // Writes the picture; false when it can't be written, which is then said.
  bool exportPng(const QString& path);

 private:
  DataWindow(TsbFile file, QWidget* parent);
  void buildBars();
  void showValues();
  void showFailure(const QString& text);

  TsbFile file_;
  PlotWidget* plot_;
  QComboBox* items_ = nullptr;     // of a map
  QListWidget* curves_ = nullptr;  // of all else
  QSlider* steps_ = nullptr;
  QLabel* time_ = nullptr;
};

}  // namespace gridbay::shell
