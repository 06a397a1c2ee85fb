#include "core/edition.h"

namespace gridbay {

const Edition theEdition{true, texts::wetlandSweepKitDocument, texts::wetlandSweepKit, "v27wsk"};

}  // namespace gridbay
