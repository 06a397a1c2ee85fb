#include "mud_transport/mud_transport_parts.h"

#include "mud_transport/pending.h"

namespace gridbay {

MudTransportParts::MudTransportParts() = default;
MudTransportParts::~MudTransportParts() = default;

}  // namespace gridbay
