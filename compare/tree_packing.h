#pragma once

#include <string>

#include "core/kvs.h"
#include "platform/packing.h"

namespace gridbay {

// The tree of a file as bytes on its way between copies of this process, of which it is made much faster than
// of its text. A file that is null stays so.
void pass(Packing& pack, KvsHandle& file);
// Only puts one in, in the same form.
void passTree(Packing& pack, const KvsFile& file);

}  // namespace gridbay
