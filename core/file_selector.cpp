#include "core/file_selector.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <numeric>

#include "platform/units/units.h"

namespace gridbay {
namespace {

// Spacings are held as 32-bit numbers in the model, and as 64-bit ones in the files.
constexpr double kSpacingTolerance = 1e-4;
constexpr double kHalfSecond = 0.5 / 86400;

std::string itemLabel(const TsbHeader& header, int number) {
  const TsbItem* found = tsbItemD(header, number);
  return fmt::format("Item {} \"{}\"", number, found == nullptr ? "" : found->name);
}

std::string typeLabel(int code) {
  const QunItem* found = qunFindItem(code);
  return found == nullptr ? fmt::format("type {}", code) : fmt::format("{} (type {})", found->name, code);
}

std::string typeLabels(const std::vector<int>& codes) {
  std::string labels;
  for (const int code : codes) labels += (labels.empty() ? "" : " or ") + typeLabel(code);
  return labels;
}

std::string_view timeAxisLabel(int type) {
  switch (static_cast<TsbTimeAxisType>(type)) {
    case TsbTimeAxisType::relativeEquidistant:
      return "a relative equidistant axis";
    case TsbTimeAxisType::relative:
      return "a relative axis";
    case TsbTimeAxisType::calendarEquidistant:
      return "an equidistant calendar axis";
    case TsbTimeAxisType::calendar:
      return "a calendar axis";
  }
  return "another axis";
}

bool sameSpacing(double a, double b) {
  return std::abs(a - b) <= kSpacingTolerance * std::abs(b);
}

}  // namespace

void CVdRqTsbItem::SetQunType(int code, int) {
  types_ = {code};
}

std::string CVdRqTsbItem::fault(const TsbHeader& header, int number) const {
  const TsbItem* found = tsbItemD(header, number);
  const std::string request = description_.empty() ? std::string() : description_ + ": ";
  if (found == nullptr) return fmt::format("{}the file has no item {}", request, number);
  const std::string label = request + itemLabel(header, number);
  if (!types_.empty() && std::ranges::find(types_, found->type) == types_.end()) {
    return fmt::format("{} is {}; {} is expected", label, typeLabel(found->type), typeLabels(types_));
  }
  const std::vector<TsbGridAxis>& axes = header.file->definition().axes;
  if (dimensions_ && static_cast<int>(axes.size()) != *dimensions_) {
    return fmt::format("{} has {} dimensions; {} are expected", label, axes.size(), *dimensions_);
  }
  for (const auto& [axis, points] : points_) {
    const bool there = axis >= 1 && axis <= static_cast<int>(axes.size());
    const std::size_t has = there ? axes[static_cast<std::size_t>(axis) - 1].points : 0;
    if (!there || static_cast<std::int64_t>(has) != points) {
      return fmt::format("{} has {} points along axis {}; {} are expected", label, has, axis, points);
    }
  }
  for (const auto& [axis, interval] : intervals_) {
    const bool there = axis >= 1 && axis <= static_cast<int>(axes.size());
    const double has = there ? axes[static_cast<std::size_t>(axis) - 1].spacing : 0;
    if (!there || !sameSpacing(has, interval)) {
      return fmt::format("{} has a spacing of {:g} along axis {}; {:g} is expected", label, has, axis,
                         interval);
    }
  }
  return {};
}

bool CVdRqTsbItem::GetNameOfValidItem(const TsbHeader& header, int index, std::string* out) const {
  for (int number = 1; number <= tsbGetNoOfItems(header); ++number) {
    if (!fault(header, number).empty() || --index > 0) continue;
    *out = tsbItemD(header, number)->name;
    return true;
  }
  return false;
}

bool CVdRqTsbItem::IsTsbFileValid(const TsbHeader& header, CValidationMessageBuffer& buffer,
                                  std::span<const std::uint32_t> items) const {
  std::string why;
  if (place_ < items.size()) {
    why = fault(header, static_cast<int>(items[place_]));
  } else {
    why = fmt::format("{}no item is chosen", description_.empty() ? "" : description_ + ": ");
  }
  if (why.empty()) return true;
  buffer.AddValidationMessage(false, {why});
  return false;
}

CVdRqTsbItem& CVdFileSelectorDlg::AddRequest() {
  return AddRequest(std::make_unique<CVdRqTsbItem>());
}

CVdRqTsbItem& CVdFileSelectorDlg::AddRequest(std::unique_ptr<CVdRqTsbItem> request) {
  request->place_ = requests_.size();
  requests_.push_back(std::move(request));
  return *requests_.back();
}

void CVdFileSelectorDlg::AddRequestItemType(int code) {
  AddRequest().SetQunType(code, 0);
}

void CVdFileSelectorDlg::SetRequestPeriod(const DateTime& start, const DateTime& end) {
  periodStart_ = start;
  periodEnd_ = end;
}

int CVdFileSelectorDlg::DoModal() {
  return chooser_ != nullptr && chooser_->choose(*this) ? 1 : 0;
}

std::string CVdFileSelectorDlg::GetNameOfItem(int n) const {
  TsbHeader header;
  if (tsbFileRead(fileName_, &header) != 0) return {};
  const TsbItem* found = tsbItemD(header, n);
  return found == nullptr ? std::string() : found->name;
}

bool CVdFileSelectorDlg::IsTsbFileValid(const std::string& file, std::string* errorText) const {
  TsbHeader header;
  return tsbFileRead(file, &header, errorText) == 0 && IsTsbFileValid(header, errorText);
}

bool CVdFileSelectorDlg::IsTsbFileValid(const TsbHeader& header, std::string* errorText) const {
  std::vector<std::uint32_t> all(static_cast<std::size_t>(tsbGetNoOfItems(header)));
  std::iota(all.begin(), all.end(), 1U);
  *errorText = faultOf(header, all, false);
  return errorText->empty();
}

bool CVdFileSelectorDlg::IsTsbFileValid(const std::string& file, std::span<const std::uint32_t> items,
                                        std::string* errorText) const {
  TsbHeader header;
  if (tsbFileRead(file, &header, errorText) != 0) return false;
  *errorText = faultOf(header, items, true);
  return errorText->empty();
}

std::string CVdFileSelectorDlg::faultOf(const TsbHeader& header, std::span<const std::uint32_t> items,
                                        bool chosen) const {
  const TsbDefinition& definition = header.file->definition();
  if (dataType_ && definition.dataType != *dataType_) {
    return fmt::format("The file's data type is {}; {} is expected", definition.dataType, *dataType_);
  }
  if (std::string why = itemsFault(header, items, chosen); !why.empty()) return why;
  if (std::string why = timeFault(definition.time); !why.empty()) return why;
  if (std::string why = periodFault(definition.time); !why.empty()) return why;
  return complianceFault(header, items);
}

std::string CVdFileSelectorDlg::itemsFault(const TsbHeader& header, std::span<const std::uint32_t> items,
                                           bool chosen) const {
  const char* who = chosen ? "The selection" : "The file";
  const auto count = static_cast<int>(items.size());
  if (noItems_ && count != *noItems_)
    return fmt::format("{} has {} items; {} are expected", who, count, *noItems_);
  if (minNoItems_ && count < *minNoItems_) {
    return fmt::format("{} has {} items; at least {} are expected", who, count, *minNoItems_);
  }
  for (const auto& request : requests_) {
    CValidationMessageBuffer buffer;
    if (!request->IsTsbFileValid(header, buffer, items)) return buffer.text();
  }
  for (std::size_t i = 0; i < items.size(); ++i) {
    const auto number = static_cast<int>(items[i]);
    if (std::string why = common_.fault(header, number); !why.empty()) return why;
    const auto dimension = itemDims_.find(static_cast<int>(i) + 1);
    if (dimension == itemDims_.end()) continue;
    CVdRqTsbItem request;
    request.SetDimensions(dimension->second);
    if (std::string why = request.fault(header, number); !why.empty()) return why;
  }
  return {};
}

std::string CVdFileSelectorDlg::timeFault(const TsbTimeAxis& time) const {
  const int type = static_cast<int>(time.type);
  if (timeAxisType_ && type != *timeAxisType_) {
    return fmt::format("The time axis is {}; {} is expected", timeAxisLabel(type),
                       timeAxisLabel(*timeAxisType_));
  }
  if (timeAxisUnit_) {
    const QunUnit* expected = qunFindUnit(*timeAxisUnit_);
    if (expected == nullptr || !qunAreEquivalent(time.unit, expected->text)) {
      return fmt::format("The unit of the time axis is \"{}\"; one like \"{}\" is expected", time.unit,
                         expected == nullptr ? std::string_view("?") : expected->text);
    }
  }
  if (noTimeSteps_ && static_cast<std::int64_t>(time.count) != *noTimeSteps_) {
    return fmt::format("The file has {} time steps; {} are expected", time.count, *noTimeSteps_);
  }
  return {};
}

// A relative axis counts from the start of the simulation; one that is not of time has no period.
std::string CVdFileSelectorDlg::periodFault(const TsbTimeAxis& time) const {
  if (!periodStart_ || !periodEnd_ || !periodStart_->valid() || !periodEnd_->valid()) return {};
  if (oneStepAllowed_ && time.count == 1) return {};
  const CVdUnitConverter toDays(time.unit, "d");
  if (!toDays.IsValid() && !time.isCalendar()) return {};
  if (!toDays.IsValid()) return fmt::format("The unit \"{}\" of the time axis is no unit of time", time.unit);
  const DateTime origin = time.isCalendar() ? DateTime::of(time.start) : *periodStart_;
  if (!origin.valid()) return "The time axis has no valid start date";
  const DateTime start = origin.plusDays(toDays.Convert(time.at(0)));
  const DateTime end = origin.plusDays(toDays.Convert(time.at(time.count - 1)));
  if (start.linear() <= periodStart_->linear() + kHalfSecond &&
      end.linear() >= periodEnd_->linear() - kHalfSecond) {
    return {};
  }
  return fmt::format("The file covers {} to {}; the simulation needs {} to {}", dateTimeText(start),
                     dateTimeText(end), dateTimeText(*periodStart_), dateTimeText(*periodEnd_));
}

std::string CVdFileSelectorDlg::complianceFault(const TsbHeader& header,
                                                std::span<const std::uint32_t> items) const {
  if (!compliant_) return {};
  const TsbDefinition& definition = header.file->definition();
  for (std::size_t axis = 0; axis < definition.axes.size(); ++axis) {
    const std::string_view metre = qunFindUnit(unit::kMetre)->text;
    if (definition.axes[axis].unit != metre) {
      return fmt::format("The unit of axis {} is \"{}\"; \"{}\" is expected", axis + 1,
                         definition.axes[axis].unit, metre);
    }
  }
  for (const std::uint32_t number : items) {
    const TsbItem* found = tsbItemD(header, static_cast<int>(number));
    if (found == nullptr) return fmt::format("The file has no item {}", number);
    const QunUnit* base = qunBaseUnit(found->type);
    if (base != nullptr && found->unit != base->text) {
      return fmt::format("{} is in \"{}\"; \"{}\" is expected", itemLabel(header, static_cast<int>(number)),
                         found->unit, base->text);
    }
  }
  return {};
}

}  // namespace gridbay
