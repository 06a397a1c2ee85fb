#pragma once

#include "families/source_values_page.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/transported.h"

namespace gridbay {

// A row for each source.
class CNmtSourceSinkGrid final : public SourceValuesGrid<&MudTransportParts::nmtSourceSink, MudFractions> {};

// The concentrations in the water of the sources.
class CNmtSourceSinkDlg final : public SourceValuesDlg<18833, PageId::mtSourceSink, CNmtSourceSinkGrid> {
 public:
  explicit CNmtSourceSinkDlg(CVdDoc& document);
  ~CNmtSourceSinkDlg() override;
};

}  // namespace gridbay
