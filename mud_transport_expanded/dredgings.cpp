#include "mud_transport_expanded/dredgings.h"

#include <algorithm>

#include "core/table_code.h"
#include "families/data_files.h"
#include "mud_transport_expanded/bed_texts.h"
#include "mud_transport_expanded/transported.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Dredger = CNmtExpDredgingItemKvs;

constexpr Text kWeight{"Fraction_%d"};
constexpr std::string_view kFallbackProjection = "UTM-32";

float& weightOf(Dredger& dredger, int fraction) {
  return dredger.weights[static_cast<std::size_t>(fraction) - 1];
}

}  // namespace

void Dredger::WeightsRow::save(const Dredger& dredger, KvsFile& file, const std::string&) const {
  auto& held = const_cast<Dredger&>(dredger);  // to ask its model
  NumberedText name(kWeight);
  for (int fraction = 1; fraction <= held.WeightCount(); ++fraction)
    kvsPutParam(file, name.of(fraction), weightOf(held, fraction));
}

void Dredger::WeightsRow::load(Dredger& dredger, KvsSection from, const std::string&) const {
  NumberedText name(kWeight);
  for (int fraction = 1; fraction <= dredger.WeightCount(); ++fraction)
    kvsGetParam(from, name.of(fraction), &weightOf(dredger, fraction), 1, 1);
}

void Dredger::WeightsRow::copy(Dredger& dredger, const Dredger& other) const {
  dredger.weights = other.weights;
}

bool Dredger::WeightsRow::access(Dredger& dredger, std::string_view path, PathAccess& access) const {
  const std::optional<int> fraction = numberIn(path, kWeight);
  if (access.onlySections || !fraction || *fraction < 1 || *fraction > dredger.WeightCount()) return false;
  float& weight = weightOf(dredger, *fraction);
  if (access.what == PathAccess::What::write) kvsPutParam(*access.out, path, weight);
  if (access.what == PathAccess::What::set) kvsGetParam(access.in, path, &weight, 1, 1);
  return true;
}

void Dredger::Load(KvsSection section, const std::string& documentPath) {
  TableKvs::Load(section, documentPath);
  completeItems();
}

int Dredger::WeightCount() {
  return std::min(fractionCount(*this), kMostFractions);
}

void Dredger::SetDefaults() {
  weights.fill(1 / static_cast<float>(std::max(fractionCount(*this), 1)));
  coordinateType = kFallbackProjection;
  auto* basic = parts<BasicParts>();
  if (basic == nullptr) return;
  if (!basic->bathymetry->projection.empty()) coordinateType = basic->bathymetry->projection;
  nesting = basic->bathymetry->GetCount();
}

unsigned Dredger::Validate(ValidationList& messages, int) {
  constexpr double kLeast = 0.99;
  constexpr double kMost = 1.01;
  float sum = 0;
  for (int fraction = 1; fraction <= WeightCount(); ++fraction) sum += weightOf(*this, fraction);
  const double total = sum;
  unsigned faults = 0;
  if (!(total >= kLeast && total <= kMost))
    faults += report(messages, PageId::mtExpDredgings, Severity::fault, texts::bed::weightsNotOne);
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, 0);
  // The message is one of another page; that is meant.
  faults += checkDataFile(messages, PageId::mtExpStartingConditions, selector, file, Reason::left,
                          Severity::dependedUpon);
  messages.files.back().page = PageId::mtExpDredgings;
  return faults;
}

void Dredger::RequestDataFile(CVdFileSelectorDlg& selector, int) {
  completeItems();
  const auto request = [&selector](const Text& description, int quantity) {
    CVdRqTsbItem& added = selector.AddRequest();
    added.SetSelectionDescr(description.format);
    added.SetQunType(quantity);
    added.SetDimensions(0);
  };
  selector.SetNoItems(kItems);
  request(texts::bed::dredgerX, item::kGeographicalCoordinate);
  request(texts::bed::dredgerY, item::kGeographicalCoordinate);
  request(texts::bed::dredgedMassRate, item::kDredgedMassRate);
  request(texts::bed::dredgingSpill, item::kDredgingSpill);
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

void Dredger::completeItems() {
  if (file.items.size() < kItems) file.items = {1, 2, 3, 4};
}

}  // namespace gridbay
