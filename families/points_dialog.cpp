#include "families/points_dialog.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <limits>

#include "core/number_text.h"
#include "families/result_texts.h"
#include "pages/dialog.h"
#include "pages/scan.h"

namespace gridbay {
namespace {

// A text that is a number and nothing else: one field of the form "%lf%32s", with the value that atof gives.
std::optional<double> numberOf(std::string_view text) {
  const std::optional<double> number = doubleOfText(trimmed(text));
  return number && std::isfinite(*number) ? number : std::nullopt;
}

// Cut towards 0 as atoi does, and within what an integer holds.
std::int32_t wholeOf(double number) {
  using Limits = std::numeric_limits<std::int32_t>;
  return static_cast<std::int32_t>(std::clamp(number, double{Limits::min()}, double{Limits::max()}));
}

}  // namespace

std::string CGxPoints::shown(double value) const {
  return isInteger_ ? std::to_string(wholeOf(value)) : fmt::format("{:.4f}", value);
}

void CGxPoints::SetCount(std::int32_t count) {
  if (count >= 0) rows_.resize(static_cast<std::size_t>(count), {shown(0), shown(0)});
}

void CGxPoints::SetPoints(std::span<const double> first, std::span<const double> second) {
  rows_.clear();
  for (std::size_t i = 0; i < std::min(first.size(), second.size()); ++i)
    rows_.push_back({shown(first[i]), shown(second[i])});
}

std::string CGxPoints::GetPoints(std::vector<double>* first, std::vector<double>* second) const {
  std::vector<double> coordinates;
  for (const Row& row : rows_) {
    for (const std::string& text : {row.first, row.second}) {
      if (text.empty()) return formatted(texts::coordinateMissing);
      const std::optional<double> number = numberOf(text);
      if (!number) return formatted(texts::coordinateInvalid);
      coordinates.push_back(isInteger_ ? wholeOf(*number) : *number);
    }
  }
  first->clear();
  second->clear();
  for (std::size_t i = 0; i < coordinates.size(); i += 2) {
    first->push_back(coordinates[i]);
    second->push_back(coordinates[i + 1]);
  }
  return {};
}

// A text that is no number stays in its cell, to be mended.
Stored CGxPoints::store(std::string& cell, std::string_view text) {
  const std::optional<double> number = numberOf(text);
  cell = number && isInteger_ ? std::to_string(wholeOf(*number)) : std::string(text);
  if (number) return Stored::taken;
  document().host().show(formatted(texts::coordinateNotNumeric));
  return Stored::partly;
}

void CGxPoints::LayOut() {
  Rows([this] { return GetCount(); });
  const Column::Pick pick = pointPick();
  const auto coordinate = [this, &pick](std::string_view header, std::string Row::*member) {
    const auto cell = [this, member](GridRow row) -> std::string& {
      return rows_[static_cast<std::size_t>(row.item) - 1].*member;
    };
    Add({.header = std::string(header),
         .width = 80,
         .get = cell,
         .set = [this, cell](GridRow row, std::string_view text) { return store(cell(row), text); }})
        .Right()
        .Picks(pick);
  };
  coordinate(isInteger_ ? "j" : "x", &Row::first);
  coordinate(isInteger_ ? "k" : "y", &Row::second);
}

// Points of the grid can be pointed at on a map.
Column::Pick CGxPoints::pointPick() {
  if (!isInteger_) return {};
  const auto rowOf = [this](GridRow row) -> Row& { return rows_[static_cast<std::size_t>(row.item) - 1]; };
  const auto wanted = [rowOf](GridRow row) {
    CellPick pick{.name = "Point"};
    const std::optional<double> j = numberOf(rowOf(row).first);
    const std::optional<double> k = numberOf(rowOf(row).second);
    if (j && k) pick.held = {{.point = {wholeOf(*j), wholeOf(*k)}}};
    return std::optional(pick);
  };
  const auto take = [rowOf](GridRow row, std::span<const PickedPlace> places) {
    const GridPoint point = places.front().point;
    rowOf(row) = {std::to_string(point.j), std::to_string(point.k)};
    return Stored::taken;
  };
  return {wanted, take};
}

CPoints4Dlg::CPoints4Dlg(CVdDoc& document, std::span<const double> j, std::span<const double> k,
                         const ResultLimits& limits, const USubLine& steps)
    : document_(document), j_(j.begin(), j.end()), k_(k.begin(), k.end()), limits_(limits), steps_(steps) {}

int CPoints4Dlg::DoModal() {
  grid_.SetPoints(j_, k_);
  USubLine steps = steps_;
  CV27SetupDialog dialog(document_, texts::pointSelection.format);
  Form& form = dialog.form();
  const auto count = [this]() -> CGxPoints& { return grid_; };
  const auto range = [&form](std::string_view label, std::int32_t last) {
    form.Shown(label, [last] { return last < 0 ? "not known" : fmt::format("0 - {}", last); });
  };
  form.Count("Number of points", countOf(count), kMostPoints);
  range("X-Range", limits_.lastJ);
  range("Y-Range", limits_.lastK);
  if (hasDataRange_) {
    const auto chosen = [&steps]() -> USubLine& { return steps; };
    range("Time Range", limits_.lastStep);
    form.Number("First:", chosen, &USubLine::first);
    form.Number("Last:", chosen, &USubLine::last).Beside();
    form.Number("Interval:", chosen, &USubLine::interval).Beside();
  }
  form.Grid("Points", grid_);
  dialog.SetCheck([this] { return grid_.GetPoints(&j_, &k_); });
  if (dialog.DoModal() != 1) return 0;
  steps_ = steps;
  return 1;
}

}  // namespace gridbay
