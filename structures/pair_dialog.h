#pragma once

#include <algorithm>
#include <cstdint>
#include <string_view>
#include <vector>

#include "pages/cell_grid.h"
#include "pages/dialog.h"

namespace gridbay {

template <class Real>
struct NumberPair {
  Real first = 0;
  Real second = 0;
};

// A grid of pairs of numbers of one quantity.
template <class Real>
class PairGrid : public ColumnGrid {
 public:
  using Pairs = std::vector<NumberPair<Real>>;

  PairGrid(Pairs& pairs, std::string_view firstHeader, std::string_view secondHeader, int quantity)
      : pairs_(pairs), firstHeader_(firstHeader), secondHeader_(secondHeader), quantity_(quantity) {}

 protected:
  // How a pair that is a place is pointed at on a map.
  virtual Column::Pick pairPick() { return {}; }
  NumberPair<Real>& pairAt(GridRow row) { return pairs_[static_cast<std::size_t>(row.item) - 1]; }

 private:
  void LayOut() override {
    constexpr int kWidth = 90;
    Rows([this] { return static_cast<int>(pairs_.size()); });
    const auto pair = [this](GridRow row) { return &pairAt(row); };
    const Column::Pick pick = pairPick();
    Number(firstHeader_, kWidth, pair, &NumberPair<Real>::first, quantity_).Picks(pick);
    Number(secondHeader_, kWidth, pair, &NumberPair<Real>::second, quantity_).Picks(pick);
  }

  Pairs& pairs_;
  std::string_view firstHeader_;
  std::string_view secondHeader_;
  int quantity_;
};

// A dialog of a count and a grid over a copy of two arrays. Where one of them is shorter it is filled up with
// zeros, as are pairs that the count adds.
template <class Real, class Grid>
class PairDialog : public CV27SetupDialog {
 public:
  PairDialog(CVdDoc& document, std::string_view title, std::string_view countLabel, int most,
             std::string_view gridLabel, const std::vector<Real>& first, const std::vector<Real>& second)
      : CV27SetupDialog(document, title), pairs_(std::max(first.size(), second.size())), grid_(pairs_) {
    for (std::size_t i = 0; i < first.size(); ++i) pairs_[i].first = first[i];
    for (std::size_t i = 0; i < second.size(); ++i) pairs_[i].second = second[i];
    form().Count(countLabel,
                 {.get = [this] { return static_cast<std::int32_t>(pairs_.size()); },
                  .set = [this](std::int32_t count) { pairs_.resize(static_cast<std::size_t>(count)); }},
                 most);
    form().Grid(gridLabel, grid_);
  }
  Grid& grid() { return grid_; }
  void OnOK(std::vector<Real>& first, std::vector<Real>& second) const {
    first.clear();
    second.clear();
    for (const NumberPair<Real>& pair : pairs_) {
      first.push_back(pair.first);
      second.push_back(pair.second);
    }
  }

 private:
  std::vector<NumberPair<Real>> pairs_;
  Grid grid_;
};

}  // namespace gridbay
