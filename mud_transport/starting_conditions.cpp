#include "mud_transport/starting_conditions.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <span>

#include "core/name_bytes.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/result.h"
#include "mud_transport/task_selection.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

constexpr int kHotStartDataType = 2;
constexpr std::string_view kTaskBlock = "V27_Misc";

// The places of the numbers in the block.
enum Place : std::size_t { kIsMultiLayer, kHasSalinity, kSedimentationInMm, kFractions, kLayers, kNumbers };

// What a hot start file says of the module.
struct HotTask {
  bool isMultiLayer;
  bool hasSalinity;
  bool sedimentationInMm;
  int count;  // of fractions or layers
};

// The count is cut to a whole number. Nothing for a block that is too short, and for numbers that are none or
// beyond reason.
std::optional<HotTask> taskIn(std::span<const float> values) {
  if (values.size() < kNumbers) return std::nullopt;
  const bool isMultiLayer = values[kIsMultiLayer] != 0;
  const float count = values[isMultiLayer ? kLayers : kFractions];
  const auto switches = values.first(kFractions);
  const bool isFinite = std::ranges::all_of(switches, [](float value) { return std::isfinite(value); });
  if (!isFinite || !(count > -1 && count < CNmtTaskSelectionKvs::kMostBelieved + 1)) return std::nullopt;
  return HotTask{isMultiLayer, values[kHasSalinity] != 0, values[kSedimentationInMm] != 0,
                 static_cast<int>(count)};
}

}  // namespace

void CNmtHotStartObjectKvs::RequestFile(CVdFileSelectorDlg& selector, int number) {
  requestArea(selector, *this, number);
  selector.SetDataType(kHotStartDataType);
  selector.SetVane27Compliant();
}

unsigned CNmtHotStartObjectKvs::Validate(ValidationList& messages, int, int number) {
  CVdFileSelectorDlg selector;
  RequestFile(selector, number);
  TsbHeader header;
  std::string why;
  const bool isValid =
      tsbFileRead(file.absolute(), &header, &why) == 0 && selector.IsTsbFileValid(header, &why);
  if (!isValid || (number == 1 && !takeTask(header)))
    return reportDataFile(messages, CNmtStartingConditionsKvs::kPage, file, why, Reason::left,
                          Severity::dependedUpon);
  tsbFileClose(&header);
  tsbHeaderDestroy(&header);
  return 0;
}

// False when the blocks cannot be read, or the one that counts makes no sense: nothing has changed then. A
// file without it leaves the task as it is.
bool CNmtHotStartObjectKvs::takeTask(const TsbHeader& header) {
  const TsbCustomBlock* block = nullptr;
  std::string name;
  std::span<const float> values;
  if (tsbGetCustomBlockRef(header, &block) != 0) return false;
  do {
    if (block == nullptr) return true;
    if (tsbGetCustomBlock(header, &block, &name, &values) != 0) return false;
  } while (!sameName(name, kTaskBlock));
  const std::optional<HotTask> said = taskIn(values);
  if (!said) return false;
  auto* module = parts<MudTransportParts>();
  if (module == nullptr) return true;
  CNmtTaskSelectionKvs& task = *module->nmtTaskSelection;
  said->isMultiLayer ? task.SetLayers(said->count) : task.SetFractions(said->count);
  task.SetSalinity(said->hasSalinity);
  module->nmtResult->netSedimentationInMm = said->sedimentationInMm ? 1 : 0;
  return true;
}

}  // namespace gridbay
