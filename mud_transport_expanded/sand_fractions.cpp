#include "mud_transport_expanded/sand_fractions.h"

namespace gridbay {
namespace {

constexpr Text kSand{"Sand_fraction_%d"};
constexpr Text kFallVelocity{"Mean_Fall_Velocity_Fraction_%d"};

template <class Value>
void accessNumber(Value& value, std::string_view path, PathAccess& access) {
  if (access.what == PathAccess::What::write) kvsPutParam(*access.out, path, value);
  if (access.what == PathAccess::What::set) kvsGetParam(access.in, path, &value, 1, 1);
}

}  // namespace

void CNmtExpSandFractionsKvs::FractionsRow::save(const CNmtExpSandFractionsKvs& fractions, KvsFile& file,
                                                 const std::string&) const {
  NumberedText sand(kSand);
  NumberedText fallVelocity(kFallVelocity);
  for (int number = 1; number <= fractions.GetCount(); ++number) {
    const CNmtExpSandFractionObjectKvs& fraction = *fractions.GetItem(number);
    kvsPutParam(file, sand.of(number), fraction.isSand);
    kvsPutParam(file, fallVelocity.of(number), fraction.meanFallVelocity);
  }
}

void CNmtExpSandFractionsKvs::FractionsRow::load(CNmtExpSandFractionsKvs& fractions, KvsSection from,
                                                 const std::string&) const {
  NumberedText sand(kSand);
  NumberedText fallVelocity(kFallVelocity);
  for (int number = 1; number <= fractions.GetCount(); ++number) {
    CNmtExpSandFractionObjectKvs& fraction = *fractions.GetItem(number);
    kvsGetParam(from, sand.of(number), &fraction.isSand, 1, 1);
    kvsGetParam(from, fallVelocity.of(number), &fraction.meanFallVelocity, 1, 1);
  }
}

bool CNmtExpSandFractionsKvs::FractionsRow::access(CNmtExpSandFractionsKvs& fractions, std::string_view path,
                                                   PathAccess& access) const {
  if (access.onlySections) return false;
  const std::optional<int> sand = numberIn(path, kSand);
  const std::optional<int> fallVelocity = numberIn(path, kFallVelocity);
  CNmtExpSandFractionObjectKvs* fraction = fractions.GetItem(sand.value_or(fallVelocity.value_or(0)));
  if (fraction == nullptr) return false;
  if (sand) {
    accessNumber(fraction->isSand, path, access);
  } else {
    accessNumber(fraction->meanFallVelocity, path, access);
  }
  return true;
}

}  // namespace gridbay
