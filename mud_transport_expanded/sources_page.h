#pragma once

#include "families/source_values_page.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

// A row for each source.
class CNmtExpSourcesGrid final
    : public SourceValuesGrid<&MudTransportExpandedParts::nmtExpSources, ExpandedMudEntries> {};

// The concentrations in the water of the sources.
class CNmtExpSourcesDlg final : public SourceValuesDlg<18861, PageId::mtExpSources, CNmtExpSourcesGrid> {
 public:
  explicit CNmtExpSourcesDlg(CVdDoc& document);
  ~CNmtExpSourcesDlg() override;
};

}  // namespace gridbay
