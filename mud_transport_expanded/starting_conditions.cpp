#include "mud_transport_expanded/starting_conditions.h"

#include <cmath>
#include <optional>
#include <span>

#include "core/name_bytes.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/transported.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

constexpr int kHotStartDataType = 2;
constexpr std::string_view kMiscBlock = "V27_Misc";

// What a hot start file says of the model that it is of.
struct HotCounts {
  bool salinity;
  std::int32_t fractions;
  std::int32_t layers;
};

// A count, cut to a whole number; nothing for one that no model has.
std::optional<std::int32_t> countIn(float value) {
  if (!(value >= 0 && value < CNmtExpTaskSelectionKvs::kMost + 1)) return std::nullopt;
  return static_cast<std::int32_t>(value);
}

std::optional<HotCounts> countsIn(std::span<const float> values) {
  constexpr std::size_t kValues = 3;  // salinity, fractions, layers
  if (values.size() < kValues || !std::isfinite(values[0])) return std::nullopt;
  const std::optional<std::int32_t> fractions = countIn(values[1]);
  const std::optional<std::int32_t> layers = countIn(values[2]);
  if (!fractions || *fractions < 1 || !layers) return std::nullopt;
  return HotCounts{values[0] != 0, *fractions, *layers};
}

}  // namespace

void CNmtExpHotStartObjectKvs::RequestFile(CVdFileSelectorDlg& selector, int number) {
  requestArea(selector, *this, number);
  selector.SetDataType(kHotStartDataType);
  selector.SetNoTimeStep(1);
  selector.SetVane27Compliant();
}

unsigned CNmtExpHotStartObjectKvs::Validate(ValidationList& messages, int, int number) {
  CVdFileSelectorDlg selector;
  RequestFile(selector, number);
  TsbHeader header;
  std::string why;
  if (tsbFileRead(file.absolute(), &header, &why) != 0 || !selector.IsTsbFileValid(header, &why))
    return reportDataFile(messages, CNmtExpStartingConditionsKvs::kPage, file, why, Reason::left,
                          Severity::dependedUpon);
  const unsigned faults = number == 1 ? takeCounts(messages, header) : 0;
  tsbFileClose(&header);
  tsbHeaderDestroy(&header);
  return faults;
}

// A file without the block leaves the counts as they are. Salinity is brought, and never taken away. That the
// blocks cannot be read is told of the older module's page.
unsigned CNmtExpHotStartObjectKvs::takeCounts(ValidationList& messages, const TsbHeader& header) {
  const auto failed = [&] {
    return reportDataFile(messages, PageId::mtStartingConditions, file, {}, Reason::left,
                          Severity::dependedUpon);
  };
  const TsbCustomBlock* block = nullptr;
  if (tsbGetCustomBlockRef(header, &block) != 0) return failed();
  while (block != nullptr) {
    std::string name;
    std::span<const float> values;
    if (tsbGetCustomBlock(header, &block, &name, &values) != 0) return failed();
    if (!names::same(name, kMiscBlock)) continue;
    const std::optional<HotCounts> counts = countsIn(values);
    if (!counts) return failed();
    if (CNmtExpTaskSelectionKvs* task = expandedCountsOf(*this); task != nullptr)
      task->SetCounts(counts->layers, counts->fractions, counts->salinity || task->includeSalinity);
    return 0;
  }
  return 0;
}

void CNmtExpStartingConditionsKvs::Load(KvsSection section, const std::string& documentPath) {
  StartingConditionsKvs::Load(section, documentPath);
  const KvsSection method = kvsSectionByNameNum(section, "CALCULATION_METHOD", 1);
  if (method == nullptr) return;
  kvsGetParam(method, kIntegrationStart, &integrationStart, 1, 1);
  kvsGetParam(method, kIntegrationEnd, &integrationEnd, 1, 1);
}

}  // namespace gridbay
