#include "mud_transport_expanded/task_selection.h"

#include <algorithm>
#include <array>

#include "core/model_root.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {
namespace {

using Task = CNmtExpTaskSelectionKvs;

constexpr std::string_view kLayers = "Number_of_layers";
constexpr std::string_view kFractions = "Number_of_fractions";
constexpr std::string_view kSalinity = "Include_salinity";

// A count as it stands on file, as far as it is believed: no sections bear it out.
std::int32_t countIn(Task& task, KvsSection from, std::string_view name, std::int32_t now) {
  std::int32_t count = now;
  kvsGetParam(from, name, &count, 1, 1);
  if (count <= Task::kMost) return count;
  task.Tell(formatted(texts::countNotBorneOut, "TASK_SELECTION", count, 0, Task::kMost));
  return Task::kMost;
}

}  // namespace

void CNmtExpTaskSelectionKvs::SetCounts(std::int32_t newLayers, std::int32_t newFractions, bool salinity) {
  SetSalinity(salinity);
  if (newLayers >= 0) layers = newLayers;
  if (newFractions >= 0) fractions = newFractions;
  const std::array<int, 3> counts{layers, fractions, fractions + (includeSalinity ? 1 : 0)};
  if (auto* root = parts<ModelRoot>(); root != nullptr) root->TellFollowers(*this, counts);
}

void CNmtExpTaskSelectionKvs::SetSalinity(bool on) {
  if (on == includeSalinity) return;
  includeSalinity = on;
  auto* module = parts<MudTransportExpandedParts>();
  if (module == nullptr) return;
  if (on) {
    module->nmtExpInitialConditions->components.InsertHead();
    module->nmtExpBoundary->InsertHeadConstant();
    module->nmtExpSources->InsertHeadConstant();
  } else {
    module->nmtExpInitialConditions->components.RemoveHead();
    module->nmtExpBoundary->RemoveHeadConstant();
    module->nmtExpSources->RemoveHeadConstant();
  }
}

void CNmtExpTaskSelectionKvs::CountsRow::save(const Task& task, KvsFile& file, const std::string&) const {
  kvsPutParam(file, kLayers, task.layers);
  kvsPutParam(file, kFractions, task.fractions);
  kvsPutParam(file, kSalinity, task.includeSalinity);
}

void CNmtExpTaskSelectionKvs::CountsRow::load(Task& task, KvsSection from, const std::string&) const {
  const std::int32_t newLayers = countIn(task, from, kLayers, task.layers);
  const std::int32_t newFractions = countIn(task, from, kFractions, task.fractions);
  bool salinity = task.includeSalinity;
  kvsGetParam(from, kSalinity, &salinity, 1, 1);
  task.SetCounts(newLayers, newFractions, salinity);
}

void CNmtExpTaskSelectionKvs::CountsRow::copy(Task& task, const Task& other) const {
  task.layers = other.layers;
  task.fractions = other.fractions;
  task.includeSalinity = other.includeSalinity;
}

bool CNmtExpTaskSelectionKvs::CountsRow::access(Task& task, std::string_view path, PathAccess& access) const {
  const bool isLayers = sameName(path, kLayers);
  const bool isFractions = sameName(path, kFractions);
  if (access.onlySections || (!isLayers && !isFractions && !sameName(path, kSalinity))) return false;
  std::int32_t newLayers = task.layers;
  std::int32_t newFractions = task.fractions;
  bool salinity = task.includeSalinity;
  if (access.what == PathAccess::What::write) {
    if (isLayers) kvsPutParam(*access.out, kLayers, newLayers);
    if (isFractions) kvsPutParam(*access.out, kFractions, newFractions);
    if (!isLayers && !isFractions) kvsPutParam(*access.out, kSalinity, salinity);
  }
  if (access.what == PathAccess::What::set) {
    if (isLayers) kvsGetParam(access.in, kLayers, &newLayers, 1, 1);
    if (isFractions) kvsGetParam(access.in, kFractions, &newFractions, 1, 1);
    if (!isLayers && !isFractions) kvsGetParam(access.in, kSalinity, &salinity, 1, 1);
    if (std::max(newLayers, newFractions) <= kMost) task.SetCounts(newLayers, newFractions, salinity);
  }
  return true;
}

}  // namespace gridbay
