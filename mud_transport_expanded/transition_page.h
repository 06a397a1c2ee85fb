#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/transition.h"

namespace gridbay {

struct NmtExpTransitionWords {
  static std::string band(int layer) { return formatted(texts::bed::betweenLayers, layer, layer + 1); }
  static constexpr FileKind kFile = texts::bed::transitionFile;
};

// A band for each layer and the one below it.
class CNmtExpTransitionGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpTransition, NmtExpTransitionWords> {
 public:
  bool IsEnabled() override;
};

// How fast mud goes from layer to layer.
class CNmtExpTransitionDlg final : public Page<18864, PageId::mtExpTransition> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpTransitionGrid grid_;
};

}  // namespace gridbay
