#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include "families/result_output.h"
#include "pages/cell_grid.h"

namespace gridbay {

// Two coordinates for each point, as they are typed. In integer mode they are whole numbers.
class CGxPoints final : public ColumnGrid {
 public:
  struct Row {
    std::string first;
    std::string second;
  };

  // Points are appended with zeros, and taken from the tail.
  void SetCount(std::int32_t count);
  std::int32_t GetCount() const { return static_cast<std::int32_t>(rows_.size()); }
  // Shows these; as many as the shorter list has.
  void SetPoints(std::span<const double> first, std::span<const double> second);
  // The points; or what is wrong with the first that is none, with both lists as they were.
  std::string GetPoints(std::vector<double>* first, std::vector<double>* second) const;

  void SetIntegerMode(bool isInteger) { isInteger_ = isInteger; }

 private:
  void LayOut() override;
  Column::Pick pointPick();
  std::string shown(double value) const;
  Stored store(std::string& cell, std::string_view text);

  std::vector<Row> rows_;
  bool isInteger_ = true;
};

// Lets the user choose the points and the time steps of an output. It works on copies.
class CPoints4Dlg {
 public:
  static constexpr int kMostPoints = 100;

  CPoints4Dlg(CVdDoc& document, std::span<const double> j, std::span<const double> k,
              const ResultLimits& limits, const USubLine& steps);

  // Coordinates with fractions, in place of points of the grid.
  void SetIntegerMode(bool isInteger) { grid_.SetIntegerMode(isInteger); }
  // Without it there are no time steps to choose.
  void SetDataRange(bool hasDataRange) { hasDataRange_ = hasDataRange; }

  // Shows the dialog; 1 for OK, when the points and the steps are those that were chosen.
  int DoModal();
  const std::vector<double>& j() const { return j_; }
  const std::vector<double>& k() const { return k_; }
  const USubLine& steps() const { return steps_; }

 private:
  CVdDoc& document_;
  std::vector<double> j_;
  std::vector<double> k_;
  ResultLimits limits_;
  USubLine steps_;
  CGxPoints grid_;
  bool hasDataRange_ = true;
};

}  // namespace gridbay
