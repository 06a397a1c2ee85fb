#pragma once

#include <cstdint>
#include <string>

#include "advection_dispersion/texts.h"
#include "core/list_kvs.h"

namespace gridbay {

// A substance, or the heat, that the water carries.
class CNadComponentObjectKvs final : public TableKvs<CNadComponentObjectKvs> {
 public:
  enum Type : std::int32_t {
    kHeatExchange = -2,
    kConservative = 0,
    kDecaying = 1,
    kHeatDissipating = 2,
  };

  using TableKvs::TableKvs;

  std::string name;
  std::int32_t type = kConservative;  // as the file has it, which may be none of the four

  static constexpr auto table() {
    return keywords(keyword("Component_Name", &CNadComponentObjectKvs::name),
                    keyword("Component_Description", &CNadComponentObjectKvs::type));
  }

  unsigned Validate(ValidationList& messages, int deep) override;
};

// The list of components, which leads all that has an entry for each of them.
class CNadComponentKvs final : public ListKvs<CNadComponentKvs, CNadComponentObjectKvs> {
 public:
  static constexpr int kMostComponents = 16;

  using ListKvs::ListKvs;

  static constexpr auto table() {
    return section("COMPONENT_SPECIFICATIONS", count("No_Of_Components"),
                   items("COMPONENT_%d", texts::componentSectionMissing));
  }

  void initialise(CNadComponentObjectKvs& component, int number) {
    component.name = formatted(texts::componentName, number);
  }

  // The list is empty afterwards where the file has no section of it.
  void Load(KvsSection section, const std::string& documentPath) override;
  unsigned Validate(ValidationList& messages, int deep) override;

  // How many components are of a type, and the number in the list (from 1) of the n-th of them (from 1); -1
  // for one that is not there.
  int CountOfType(std::int32_t type) const;
  int NumberOfType(std::int32_t type, int n) const;
};

}  // namespace gridbay
