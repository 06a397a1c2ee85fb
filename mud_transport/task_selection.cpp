#include "mud_transport/task_selection.h"

#include <algorithm>
#include <array>

#include "core/item_rows.h"
#include "core/model_root.h"
#include "mud_transport/texts.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Task = CNmtTaskSelectionKvs;
using Counts = std::array<int, Task::kNoOfCounts>;

constexpr int kLeftAlone = -1;

constexpr std::string_view kMultiFraction = "Multifraction";
constexpr std::string_view kMultiLayer = "MultiLayer";
constexpr std::string_view kLayersName = "Number_of_layers";
constexpr std::string_view kFractionsName = "Number_of_fractions";
constexpr std::string_view kSalinityName = "Include_salinity_component_for_flocculation";

void tell(Task& task, const Counts& counts) {
  if (auto* root = task.parts<ModelRoot>()) root->TellFollowers(task, counts);
}

// A count as a file has it; one that is negative leaves what there is. No sections bear it out.
int believed(Task& task, int count, int present) {
  if (count < 0) return present;
  if (count > Task::kMostBelieved)
    task.Tell(formatted(texts::countNotBorneOut, "TASK_SELECTION", count, 0, Task::kMostBelieved));
  return std::min(count, Task::kMostBelieved);
}

}  // namespace

void Task::SetFractions(int n) {
  if (n < 0) return;
  multiFraction = true;
  fractions = n;
  layers = 1;
  const int count = TransportedCount();
  tell(*this, {count, count, count, kLeftAlone, 0});
}

void Task::SetLayers(int n) {
  if (n < 0) return;
  multiFraction = false;
  layers = n;
  fractions = 1;
  tell(*this, {EntryCount(), TransportedCount(), kLeftAlone, layers, 0});
}

void Task::SetSalinity(bool on) {
  if (on == includeSalinity) return;
  includeSalinity = on;
  tell(*this, {kLeftAlone, kLeftAlone, kLeftAlone, kLeftAlone, on ? 1 : -1});
}

std::string Task::EntryName(int number) const {
  if (multiFraction) return formatted(texts::mtFraction, number);
  if (IsSalinity(number)) return formatted(texts::mtSalinity);
  return IsThickness(number) ? formatted(texts::mtThickness, number - TransportedCount())
                             : formatted(texts::mtOnlyFraction);
}

int Task::EntryQuantity(int number) const {
  if (IsSalinity(number)) return item::kSalinity;
  return IsThickness(number) ? item::kLayerThickness : item::kConcentration;
}

void Task::TaskRow::save(const Task& task, KvsFile& file, const std::string&) const {
  kvsPutParam(file, kMultiFraction, task.multiFraction);
  kvsPutParam(file, kMultiLayer, !task.multiFraction);
  kvsPutParam(file, kLayersName, task.layers);
  kvsPutParam(file, kFractionsName, task.fractions);
  kvsPutParam(file, kSalinityName, task.includeSalinity);
}

void Task::TaskRow::load(Task& task, KvsSection from, const std::string&) const {
  bool isMultiFraction = task.multiFraction;
  std::int32_t layers = task.layers;
  std::int32_t fractions = task.fractions;
  bool hasSalinity = task.includeSalinity;
  kvsGetParam(from, kMultiFraction, &isMultiFraction, 1, 1);
  kvsGetParam(from, kLayersName, &layers, 1, 1);
  kvsGetParam(from, kFractionsName, &fractions, 1, 1);
  kvsGetParam(from, kSalinityName, &hasSalinity, 1, 1);
  if (isMultiFraction) {
    task.SetFractions(believed(task, fractions, task.fractions));
  } else {
    task.SetLayers(believed(task, layers, task.layers));
  }
  task.SetSalinity(hasSalinity);
}

void Task::TaskRow::copy(Task& task, const Task& other) const {
  task.multiFraction = other.multiFraction;
  task.fractions = other.fractions;
  task.layers = other.layers;
  task.includeSalinity = other.includeSalinity;
}

bool Task::TaskRow::access(Task& task, std::string_view path, PathAccess& access) const {
  const auto isOneOf = [path](auto... names) { return (sameName(path, names) || ...); };
  if (access.onlySections ||
      !isOneOf(kMultiFraction, kMultiLayer, kLayersName, kFractionsName, kSalinityName))
    return false;
  // The other task follows from the first keyword, and its count is 1.
  access.isWrittenOnly = isOneOf(kMultiLayer) || isOneOf(task.multiFraction ? kLayersName : kFractionsName);
  const auto value = [&](auto held, const auto& take) {
    if (access.what == PathAccess::What::write) kvsPutParam(*access.out, path, held);
    if (access.what != PathAccess::What::set || access.isWrittenOnly) return;
    auto wanted = held;
    kvsGetParam(access.in, path, &wanted, 1, 1);
    if (wanted != held) take(wanted);
  };
  const auto setCount = [&task](std::int32_t n) {
    if (n > kMostItems) return;
    task.multiFraction ? task.SetFractions(n) : task.SetLayers(n);
  };
  if (isOneOf(kMultiFraction)) {
    value(task.multiFraction,
          [&](bool on) { on ? task.SetFractions(task.fractions) : task.SetLayers(task.layers); });
  } else if (isOneOf(kMultiLayer)) {
    value(!task.multiFraction, [](bool) {});
  } else if (isOneOf(kLayersName)) {
    value(task.layers, setCount);
  } else if (isOneOf(kFractionsName)) {
    value(task.fractions, setCount);
  } else {
    value(task.includeSalinity, [&](bool on) { task.SetSalinity(on); });
  }
  return true;
}

}  // namespace gridbay
