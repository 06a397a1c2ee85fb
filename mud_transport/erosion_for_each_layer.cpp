#include "mud_transport/erosion_for_each_layer.h"

#include "mud_transport/texts.h"

namespace gridbay {

// Formats that differ are told at the first layer that differs, behind what is wrong with its files.
unsigned CNmtErosionForEachLayerPowerKvs::Validate(ValidationList& messages, int deep) {
  if (deep == 0) return 0;
  unsigned faults = 0;
  bool differs = false;
  for (int number = 1; number <= GetCount(); ++number) {
    CNmtErosionForEachLayerPowerLayerKvs& layer = *GetItem(number);
    const ListEntry entry{number, GetCount()};
    faults += checkedEntry(messages, entry, [&] { return layer.Validate(messages, deep); });
    if (differs || layer.format == GetItem(1)->format) continue;
    differs = true;
    faults += checkedEntry(messages, entry, [&] {
      return report(messages, PageId::mtErosionForEachLayerPower, Severity::fault, texts::layerFormatsDiffer);
    });
  }
  return faults;
}

}  // namespace gridbay
