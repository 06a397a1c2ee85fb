#pragma once

#include <QDialog>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <QTimer>
#include <functional>
#include <optional>

#include "platform/files/file_stamp.h"
#include "shell/background_work.h"
#include "shell/import/height_histogram.h"
#include "shell/import/terrain_form.h"
#include "shell/import/terrain_preview.h"
#include "shell/import/use_strip.h"

namespace gridbay::shell {

// Makes a map from terrain of any kind: what is chosen is seen at once, and what will be made is told before.
// Files are read and written in a copy of the process, so that the window never waits.
class TerrainImport final : public QDialog {
  Q_OBJECT
 public:
  // `uses` is asked for whenever a map has been made.
  TerrainImport(std::function<UseStrip::Offer(const QString& map)> uses, QWidget* parent);
  ~TerrainImport() override;

  TerrainForm& form() { return *form_; }
  TerrainPreview& preview() { return *preview_; }
  HeightHistogram& histogram() { return *histogram_; }
  QLabel& status() { return *status_; }
  // Nothing is read or written, and nothing is about to be.
  bool isSettled() const { return !work_.isRunning() && !delay_.isActive(); }
  bool isImporting() const { return stage_ == Stage::importing; }

 signals:
  void viewWanted(const QString& map);
  void helpWanted();

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void done(int result) override;

 private:
  enum class Stage { reading, ready, importing };

  QWidget* makePictures();
  QWidget* makeButtons();
  void readSoon();
  void read();
  void takePreview(const std::optional<std::string>& bytes);
  void showPlan();
  void takeWindow(const QRectF& drawn);
  void startImport();
  void takeImport(const std::optional<std::string>& bytes);
  void cancel();
  void enter(Stage stage);
  void tell(const QString& text, bool isFault);

  TerrainForm* form_;
  TerrainPreview* preview_;
  HeightHistogram* histogram_;
  QLabel* pointed_ = nullptr;
  QLabel* summary_ = nullptr;
  QLabel* status_ = nullptr;
  UseStrip* uses_ = nullptr;
  QProgressBar* progress_ = nullptr;
  QPushButton* import_ = nullptr;
  QPushButton* cancel_ = nullptr;
  QTimer delay_;  // from an edit to the look at what it makes
  BackgroundWork work_;
  Stage stage_ = Stage::ready;
  std::optional<RasterPreview> shown_;
  QString made_;                     // the map that is being made, or was
  std::optional<FileStamp> before_;  // what was there before it
};

}  // namespace gridbay::shell
