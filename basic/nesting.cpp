#include "basic/nesting.h"

#include <cmath>

namespace gridbay {
namespace {

constexpr float kRatioTolerance = 0.005F;
constexpr std::int64_t kNearBorder = 3;  // an edge nearer than this to the outer border must be land

bool hasWrongRatio(float outer, float inner) {
  return std::abs(outer / (inner * static_cast<float>(kNestingRatio)) - 1.0F) > kRatioTolerance;
}

// Whether every edge of the inner area that comes near the outer border is all land.
bool landRuleHolds(const CBathymetryObjectKvs& inner, const CBathymetryObjectKvs& outer, std::int64_t jextr,
                   std::int64_t kextr) {
  const auto columnIsLand = [&inner](int j) {
    for (int k = 0; k < inner.noK; ++k) {
      if (!inner.isLand(j, k)) return false;
    }
    return true;
  };
  const auto rowIsLand = [&inner](int k) {
    for (int j = 0; j < inner.noJ; ++j) {
      if (!inner.isLand(j, k)) return false;
    }
    return true;
  };
  if (inner.origin.j < kNearBorder && !columnIsLand(0)) return false;
  if (inner.origin.k < kNearBorder && !rowIsLand(0)) return false;
  if (inner.origin.j + jextr > outer.noJ - kNearBorder - 1 && !columnIsLand(inner.noJ - 1)) return false;
  return inner.origin.k + kextr <= outer.noK - kNearBorder - 1 || rowIsLand(inner.noK - 1);
}

// A closed rectangle in grid units of the areas inside one enclosing area.
struct Rectangle {
  std::int64_t firstJ;
  std::int64_t lastJ;
  std::int64_t firstK;
  std::int64_t lastK;

  bool contains(std::int64_t j, std::int64_t k) const {
    return firstJ <= j && j <= lastJ && firstK <= k && k <= lastK;
  }
  bool containsCornerOf(const Rectangle& other) const {
    return contains(other.firstJ, other.firstK) || contains(other.lastJ, other.firstK) ||
           contains(other.firstJ, other.lastK) || contains(other.lastJ, other.lastK);
  }
};

Rectangle footprint(const CBathymetryObjectKvs& area) {
  const std::int64_t firstJ = std::int64_t{kNestingRatio} * area.origin.j;
  const std::int64_t firstK = std::int64_t{kNestingRatio} * area.origin.k;
  return {firstJ, firstJ + area.noJ - 1, firstK, firstK + area.noK - 1};
}

// What an area of so many points along an edge spans in steps of the outer grid.
std::int64_t extentIn(std::int32_t points) {
  return (std::int64_t{points} - 1) / kNestingRatio;
}

unsigned refuseNesting(const CBathymetryObjectKvs& inner, const CBathymetryObjectKvs& outer,
                       ValidationList& messages, const Text& text) {
  return report(messages, PageId::bathymetry, Severity::fault, text, inner.fileName.text(),
                outer.fileName.text());
}

}  // namespace

unsigned CheckNestingGeometry(const CBathymetryObjectKvs& inner, const CBathymetryObjectKvs& outer,
                              ValidationList& messages) {
  const auto refuse = [&](const Text& text) { return refuseNesting(inner, outer, messages, text); };
  if (hasWrongRatio(outer.dx, inner.dx) || hasWrongRatio(outer.dy, inner.dy)) return refuse(texts::nestRatio);
  if ((inner.noJ - 1) % kNestingRatio != 0) return refuse(texts::nestJextr);
  if ((inner.noK - 1) % kNestingRatio != 0) return refuse(texts::nestKextr);
  const bool inside = inner.origin.j >= 1 && inner.origin.k >= 1 &&
                      inner.origin.j + extentIn(inner.noJ) <= outer.noJ - 2 &&
                      inner.origin.k + extentIn(inner.noK) <= outer.noK - 2;
  return inside ? 0 : refuse(texts::nestPosition);
}

unsigned CheckNesting(const CBathymetryObjectKvs& inner, const CBathymetryObjectKvs& outer,
                      ValidationList& messages) {
  const unsigned faults = CheckNestingGeometry(inner, outer, messages);
  if (faults != 0 || landRuleHolds(inner, outer, extentIn(inner.noJ), extentIn(inner.noK))) return faults;
  return refuseNesting(inner, outer, messages, texts::nestPosition);
}

unsigned CheckOverlap(const CBathymetryObjectKvs& a, const CBathymetryObjectKvs& b,
                      ValidationList& messages) {
  if (&a == &b || a.enclosingArea != b.enclosingArea) return 0;
  const Rectangle first = footprint(a);
  const Rectangle second = footprint(b);
  if (!first.containsCornerOf(second) && !second.containsCornerOf(first)) return 0;
  return report(messages, PageId::bathymetry, Severity::fault, texts::overlap, a.fileName.text(),
                b.fileName.text());
}

}  // namespace gridbay
