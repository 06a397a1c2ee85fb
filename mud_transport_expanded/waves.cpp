#include "mud_transport_expanded/waves.h"

#include "core/table_code.h"
#include "families/data_files.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtExpWavesKvs::TypeRow::save(const CNmtExpWavesKvs& waves, KvsFile& file, const std::string&) const {
  auto* module = const_cast<CNmtExpWavesKvs&>(waves).parts<MudTransportExpandedParts>();
  const bool hasWaves = module != nullptr && module->nmtExpForcings->includeWaves != 0;
  kvsPutParam(file, name, hasWaves ? waves.typeOfWaveVariation : 0);
}

void CNmtExpWavesKvs::TypeRow::load(CNmtExpWavesKvs& waves, KvsSection from, const std::string&) const {
  std::int32_t type = waves.typeOfWaveVariation;
  kvsGetParam(from, name, &type, 1, 1);
  waves.typeOfWaveVariation = type == 0 ? std::int32_t{kConstant} : type;
}

// As a load of a whole file, in which the forcings take what they need of the keyword.
void CNmtExpWavesKvs::TypeRow::set(CNmtExpWavesKvs& waves, KvsSection from,
                                   const std::string& documentPath) const {
  load(waves, from, documentPath);
  if (auto* module = waves.parts<MudTransportExpandedParts>(); module != nullptr)
    CNmtExpForcingsKvs::WavesRow{}.load(*module->nmtExpForcings, from, documentPath);
}

unsigned CNmtExpTSVWavesKvs::Validate(ValidationList& messages, int) {
  CVdFileSelectorDlg selector;
  RequestDataFile(selector);
  noteDataFile(messages, PageId::mtExpTsvWaves, selector, file.fileName, file.items);
  return 0;
}

void CNmtExpTSVWavesKvs::RequestDataFile(CVdFileSelectorDlg& selector) {
  requestWaveMaps(selector, *this);
  requestSimulationPeriod(selector, *this);
  selector.AllowOneTimeStep();
}

void requestWaveMaps(CVdFileSelectorDlg& selector, CKvsBase& object) {
  constexpr int kItems = 3;
  const auto request = [&](const Text& description, int quantity) {
    CVdRqTsbItem& item = selector.AddRequest();
    item.SetSelectionDescr(description.format);
    item.SetQunType(quantity);
    requestArea(item, object, 1);
  };
  selector.SetMinNoItems(kItems);
  request(texts::expWaveHeightRequest, item::kWaveHeight);
  request(texts::expWaveDirectionRequest, item::kMeanWaveDirection);
  request(texts::expWavePeriodRequest, item::kWavePeriod);
  requestForEngine(selector);
}

}  // namespace gridbay
