#include "mud_transport_expanded/sources.h"

namespace gridbay {

float CNmtExpSourceObjectKvs::newConstant(int entry) {
  constexpr float kSalinity = 20;     // PSU
  constexpr float kFraction = 0.01F;  // kg/m3
  return entry == 1 && carriesSalinity(*this) ? kSalinity : kFraction;
}

bool CNmtExpSourceObjectKvs::isHeadLastOnFile() const {
  return carriesSalinity(const_cast<CNmtExpSourceObjectKvs&>(*this));
}

}  // namespace gridbay
