#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "platform/packing.h"
#include "setup/setup_doc.h"

namespace gridbay {

// What a step makes of a document: the parts of the model that differ between two files, and the file that a
// save passes on the engine's options from.
struct DocumentChange {
  std::vector<std::int32_t> parts = {};    // that differ, by their places among the children of a root
  KvsHandle after = {};                    // what is loaded
  std::string path = {};                   // that file names in it start from
  KvsHandle source = {};                   // null where it stays
  std::unique_ptr<CGlobalKvs> model = {};  // what has been loaded

  bool isNone() const { return parts.empty() && source == nullptr; }
};

// What is found out about a change beside the process: the model is loaded again.
void pass(Packing& pack, DocumentChange& change);

struct ChangeOf {
  const KvsFile& before;          // as a save writes it
  const std::string& beforePath;  // that file names in it start from
  KvsHandle after;
  std::string path;
  const KvsFile& source;   // whose options are exchanged
  bool isOfFiles = false;  // whose unknown sections come too
};
DocumentChange changeOf(ChangeOf files);

// Gives the document a change as one step; what is wrong, or empty. Parts of the model that are the same in
// both keep what stands on no file.
std::string makeChange(CV27SetupDoc& document, DocumentChange change, PageId page, const std::string& name);

}  // namespace gridbay
