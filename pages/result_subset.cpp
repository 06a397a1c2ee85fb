#include "pages/result_subset.h"

#include <fmt/format.h>

#include "pages/part_pick.h"

namespace gridbay {
namespace {

constexpr std::array<const char*, 3> kDirections{"X direction", "Y direction", "Time steps"};
constexpr const char* kTitle = "Subset of results";

}  // namespace

CV27SetupResultSubsetDialog::Range CV27SetupResultSubsetDialog::rangeOf(const USubArea& area,
                                                                        const USubLine& steps) {
  return {area.x.first,    area.x.last, area.x.interval, area.y.first,  area.y.last,
          area.y.interval, steps.first, steps.last,      steps.interval};
}

void CV27SetupResultSubsetDialog::copyBack(const Range& range, USubArea& area, USubLine& steps) {
  area.x = {range[0], range[1], range[2]};
  area.y = {range[3], range[4], range[5]};
  steps = {range[6], range[7], range[8]};
}

CV27SetupResultSubsetDialog::CV27SetupResultSubsetDialog(const Range& range, std::int32_t lastJ,
                                                         std::int32_t lastK, std::int32_t lastStep)
    : range_(range), shown_(range), limits_{lastJ, lastK, lastStep} {
  for (std::size_t direction = 0; direction < kDirections.size(); ++direction) {
    const std::string limit = limits_[direction] < 0 ? "" : fmt::format(" (0 to {})", limits_[direction]);
    form_.Group(kDirections[direction] + limit, [&] {
      form_.DDX_Text("First:", shown_[3 * direction]);
      form_.DDX_Text("Last:", shown_[3 * direction + 1]).Beside();
      form_.DDX_Text("Interval:", shown_[3 * direction + 2]).Beside();
    });
  }
  form_.show(UnitChoices());
}

void CV27SetupResultSubsetDialog::SetPick(std::int32_t area, bool isLine) {
  std::vector<Control*> fields;
  for (Control& control : form_.controls()) {
    if (control.name() == "First" || control.name() == "Last") fields.push_back(&control);
  }
  fields.resize(4);  // of time steps there are none on a map
  // The other fields keep what is typed there.
  const auto wanted = [this, area] {
    form_.store(UnitChoices());
    USubArea part;
    USubLine steps;
    copyBack(shown_, part, steps);
    return pickOfPart(part, area);
  };
  const auto take = [fields, isLine](std::span<const PickedPlace> places) {
    USubArea part;
    takePart(part, places, isLine);
    const std::array values{part.x.first, part.x.last, part.y.first, part.y.last};
    for (std::size_t i = 0; i < values.size(); ++i) fields[i]->text = std::to_string(values[i]);
  };
  picks_ = {{fields, wanted, take}};
}

int CV27SetupResultSubsetDialog::DoModal(SetupHost& host) {
  if (!editForm(host, kTitle, form_, picks_, [this] { return fault(); })) return 0;
  range_ = shown_;
  return 1;
}

std::string CV27SetupResultSubsetDialog::fault() {
  if (std::string text = form_.store(UnitChoices()); !text.empty()) return text;
  for (std::size_t direction = 0; direction < kDirections.size(); ++direction) {
    const std::int32_t first = shown_[3 * direction];
    const std::int32_t last = shown_[3 * direction + 1];
    const bool isKnown = limits_[direction] >= 0;
    if (isKnown && (first < 0 || first > last || last > limits_[direction])) {
      return fmt::format("{}: {} to {} is not a part of 0 to {}", kDirections[direction], first, last,
                         limits_[direction]);
    }
    if (shown_[3 * direction + 2] < 1) {
      return fmt::format("{}: the interval {} is below 1", kDirections[direction], shown_[3 * direction + 2]);
    }
  }
  return {};
}

}  // namespace gridbay
