#include "hydrodynamic/wave_radiation_page.h"

#include "basic/page_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/wave_radiation.h"

namespace gridbay {

void CNhdWaveRadiationGrid::LayOut() {
  using Entry = CNhdWaveRadiationObjectKvs;
  const auto entry = RowsOf(&HydrodynamicParts::nhdWaveRadiation);
  Check("Included", 60, entry, &Entry::included);
  List("Time descr.", 110, entry, &Entry::timeDescription,
       Choices::numbered({"Stationary", "Quasi Stationary"}));
  File({.file = fileOf(entry, &Entry::fileName, texts::waveRadiationMap, &Entry::RequestFile),
        .header = "Filename",
        .browse = texts::browse.format});
}

}  // namespace gridbay
