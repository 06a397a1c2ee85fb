#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CNhdWeirKvs;
class CNhdCulvertKvs;
class CNhdDikeKvs;

// Weirs, culverts and dikes, as members of the root. None is ever null while the root lives.
struct StructureParts {
  StructureParts();
  ~StructureParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CNhdWeirKvs> nhdWeir;
  std::unique_ptr<CNhdCulvertKvs> nhdCulvert;
  std::unique_ptr<CNhdDikeKvs> nhdDike;
};

}  // namespace gridbay
