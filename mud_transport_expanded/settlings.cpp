#include "mud_transport_expanded/settlings.h"

namespace gridbay {

using Settlings = CNmtExpSettlingsKvs;

void Settlings::FlocculationRow::save(const Settlings& settlings, KvsFile& file, const std::string&) const {
  kvsPutParam(file, name, settlings.isConstant() ? 0 : 1);
}

void Settlings::FlocculationRow::load(Settlings& settlings, KvsSection from, const std::string&) const {
  constexpr std::int32_t kWithFormulation = 2;
  std::int32_t onFile = -1;  // which is none of them
  kvsGetParam(from, name, &onFile, 1, 1);
  if (onFile < 0 || onFile > kWithFormulation) return;
  settlings.noFlocculation = onFile == 0 ? 1 : 0;
  if (onFile == kWithFormulation) settlings.formulation = kRichardsonZaki;
}

void Settlings::FlocculationRow::copy(Settlings& settlings, const Settlings& other) const {
  settlings.noFlocculation = other.noFlocculation;
}

void Settlings::HinderedRow::save(const Settlings& settlings, KvsFile& file, const std::string&) const {
  const int formulation = settlings.formulation == kWinterwerp ? 1 : 2;
  kvsPutParam(file, name, settlings.hinderedSettling == 0 ? 0 : formulation);
}

void Settlings::HinderedRow::load(Settlings& settlings, KvsSection from, const std::string&) const {
  kvsGetParam(from, nameToLoad, &settlings.hinderedSettling, 1, 1);
}

void Settlings::HinderedRow::set(Settlings& settlings, KvsSection from, const std::string&) const {
  std::int32_t onFile = -1;
  kvsGetParam(from, name, &onFile, 1, 1);
  if (onFile < 0 || onFile > 2) return;
  settlings.hinderedSettling = onFile == 0 ? 0 : 1;
  if (onFile > 0) settlings.formulation = onFile - 1;
}

void Settlings::HinderedRow::copy(Settlings& settlings, const Settlings& other) const {
  settlings.hinderedSettling = other.hinderedSettling;
  settlings.formulation = other.formulation;
}

}  // namespace gridbay
