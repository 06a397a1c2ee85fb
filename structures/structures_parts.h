#pragma once

#include <memory>

namespace gridbay {

class CNhdWeirKvs;
class CNhdCulvertKvs;
class CNhdDikeKvs;

// Weirs, culverts and dikes, as members of the root. None is ever null while the root lives.
struct StructureParts {
  StructureParts();
  ~StructureParts();

  std::unique_ptr<CNhdWeirKvs> nhdWeir;
  std::unique_ptr<CNhdCulvertKvs> nhdCulvert;
  std::unique_ptr<CNhdDikeKvs> nhdDike;
};

}  // namespace gridbay
