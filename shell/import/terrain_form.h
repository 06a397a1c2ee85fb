#pragma once

#include <QComboBox>
#include <QFormLayout>
#include <QLabel>
#include <QPushButton>
#include <QRectF>
#include <QWidget>
#include <string>
#include <vector>

#include "conversion/raster_preview.h"
#include "shell/import/number_edit.h"
#include "shell/projection_search.h"

namespace gridbay::shell {

// The fields of a terrain import: which file, where it lies and goes, and what its values are.
class TerrainForm final : public QWidget {
  Q_OBJECT
 public:
  explicit TerrainForm(QWidget* parent);

  QLineEdit& file() { return *file_; }
  NumberEdit& land() { return *land_; }
  QLineEdit& target() { return *target_; }

  // Takes a file as if it were typed: what was said of another one goes.
  void setFile(const QString& path);
  // What the preview tells of the file: what there is to choose, and defaults for what is not given. True
  // where a default makes another preview of it.
  bool show(const RasterPreview& preview);
  void setWindow(const QRectF& window);
  QRectF window() const;
  std::optional<float> landValue() const;

  // What the fields ask for, with neither window nor file to write where it is only looked at.
  RasterConversion preview() const;
  RasterConversion conversion() const;
  // What is wrong with a field, which then has the focus; empty where nothing is.
  QString fault();

 signals:
  // What is looked at has changed, or only what is made of it.
  void sourceChanged();
  void planChanged();

 private:
  QWidget* makeSourceGroup();
  QWidget* makePlaceGroup();
  QWidget* makeWindowGroup();
  QWidget* makeValuesGroup();
  NumberEdit* makeNumber(const char* name, void (TerrainForm::*changed)());
  QWidget* withBrowse(QLineEdit* edit, void (TerrainForm::*browse)());
  void browseFile();
  void browseTarget();
  void fill(QComboBox& box, const std::vector<std::string>& names);
  void suggest(const RasterPreview& preview);
  bool suggestPlace(const RasterPreview& preview);
  QString spacingWanted() const;
  void showSpacingWanted();
  void takeExtent(const RasterPreview& preview);
  bool isWhole() const;

  QLineEdit* file_;
  QComboBox* raster_;
  QComboBox* band_;
  QComboBox* gridding_;
  QFormLayout* source_ = nullptr;
  ProjectionSearch* crs_;
  ProjectionSearch* reproject_;
  NumberEdit* spacing_;
  QLabel* spacingWanted_;  // why an empty spacing will not do
  QComboBox* resampling_;
  NumberEdit* west_;
  NumberEdit* south_;
  NumberEdit* east_;
  NumberEdit* north_;
  QComboBox* itemType_;
  NumberEdit* land_;
  NumberEdit* missing_;
  QLineEdit* target_;
  QString taken_;         // the file that was last taken
  QString suggestedFor_;  // the projection that a spacing was last suggested for
  double natural_ = 0;    // the spacing of the raster where none is given; 0 where that is unknown
  QRectF whole_;
  QSizeF cell_;
  bool isOfPoints_ = false;
  bool isFresh_ = true;  // the file: no preview of it has been shown
};

}  // namespace gridbay::shell
