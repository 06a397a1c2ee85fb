#include "mud_transport_expanded/mud_transport_expanded_parts.h"

#include "mud_transport_expanded/pending.h"

namespace gridbay {

MudTransportExpandedParts::MudTransportExpandedParts() = default;
MudTransportExpandedParts::~MudTransportExpandedParts() = default;

}  // namespace gridbay
