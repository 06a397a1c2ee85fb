#include "core/edition.h"

namespace gridbay {

const Edition theEdition{false, texts::flowModelDocument, texts::flowModel, "v27"};

}  // namespace gridbay
