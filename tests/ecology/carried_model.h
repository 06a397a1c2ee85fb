#pragma once

#include <string>

#include "core/file_name.h"
#include "ecology/model_definition.h"
#include "setup/global_kvs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

// A model definition with two state variables that are carried with the water, 3 and 7, one between them that
// is not, and three further items to write.
inline constexpr std::string_view kCarriedModel = R"(BIO_RIG_SETUP {
  DESCRIPTION "Plankton"
  STATE_VARIABLES {
    STATE_VARIABLE_1 { SYMBOL "PHY"; ID 3; QUN_TYPE 100201; DEFAULT_VALUE 1.5; MIN_VALUE 0.0; MAX_VALUE 10.0
                       TRANSPORT "ADVECTION_DISPERSION" }
    STATE_VARIABLE_2 { SYMBOL "BED"; ID 5; UNIT "g/m2"; DEFAULT_VALUE 0.25; MIN_VALUE 0.0; MAX_VALUE 1.0
                       TRANSPORT "NONE" }
    STATE_VARIABLE_3 { SYMBOL "OXY"; ID 7; UNIT "g/m3"; DEFAULT_VALUE 8.0; MIN_VALUE 0.0; MAX_VALUE 20.0
                       TRANSPORT "ADVECTION_DISPERSION" }
  }
  AUXILIARY_VARIABLES {
    AUXILIARY_VARIABLE_1 { SYMBOL "lux"; ID 1; DESCRIPTION "Light"; UNIT "W/m2"; OUTPUT "YES" }
    AUXILIARY_VARIABLE_2 { SYMBOL "hid"; ID 2; DESCRIPTION "Hidden"; OUTPUT "NO" }
  }
  PROCESSES {
    PROCESS_1 { SYMBOL "gro"; ID 4; DESCRIPTION "Growth"; UNIT "g/m3/d"; OUTPUT "YES"
                SPATIAL_VARIATION "NONE" }
  }
  DERIVED_OUTPUTS { DERIVED_OUTPUT_1 { ID 6; DESCRIPTION "All"; UNIT "g/m3" } }
}
)";
// One with a single variable, which is carried and has no limits.
inline constexpr std::string_view kModelWithoutLimits = R"(BIO_RIG_SETUP { STATE_VARIABLES {
  STATE_VARIABLE_1 { SYMBOL "ANY"; ID 1; DEFAULT_VALUE 0.5; TRANSPORT "ADVECTION_DISPERSION" } } }
)";
// One with nothing that is carried.
inline constexpr std::string_view kModelOfTheBed = R"(BIO_RIG_SETUP { STATE_VARIABLES {
  STATE_VARIABLE_1 { SYMBOL "BED"; ID 5; DEFAULT_VALUE 0.25; TRANSPORT "NONE" } } }
)";

// Has a model read a definition.
inline void define(CGlobalKvs& root, const TemporaryFolder& folder, std::string_view definition) {
  UFileName file;
  file = folder.write("m.biorig", definition);
  root.wqsModelDefinition->Choose(file);
}

}  // namespace gridbay::test
