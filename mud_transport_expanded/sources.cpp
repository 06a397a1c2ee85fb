#include "mud_transport_expanded/sources.h"

namespace gridbay {

float CNmtExpSourceObjectKvs::newConstant(int entry) {
  constexpr float kSalinity = 20;     // PSU
  constexpr float kFraction = 0.01F;  // kg/m3
  return entry == 1 && carriesSalinity(*this) ? kSalinity : kFraction;
}

int CNmtExpSourceObjectKvs::numberOnFile(int entry) const {
  if (!carriesSalinity(const_cast<CNmtExpSourceObjectKvs&>(*this))) return entry;
  return entry == 1 ? static_cast<int>(constants.size()) : entry - 1;
}

}  // namespace gridbay
