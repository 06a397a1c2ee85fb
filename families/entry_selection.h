#pragma once

#include <string>
#include <vector>

#include "families/entry_flags.h"
#include "pages/vd_doc.h"

namespace gridbay {

// Lets the user choose among a module's entries for the output `whose`; true when he did. There is a flag for
// each entry then.
bool chooseEntries(CVdDoc& document, const std::string& whose, std::vector<std::string> names,
                   EntryFlags& flags);

}  // namespace gridbay
