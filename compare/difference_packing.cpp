#include "compare/difference_packing.h"

#include "platform/packing.h"

namespace gridbay {

// Found by the packing, as they stand beside it.
static void pass(Packing& pack, KeywordDifference& each) {
  pack(each.path, each.isSection, each.own, each.other);
}
static void pass(Packing& pack, Difference& each) {
  pack(each.page, each.pageName, each.thing, each.own, each.other, each.label, each.labelNumber, each.table,
       each.row, each.column, each.currentRow, each.keywords);
}
static void pass(Packing& pack, MergeQuestion& each) {
  pack(each.path, each.page, each.pageName, each.thing, each.base, each.own, each.other, each.takesOther);
}
static void pass(Packing& pack, SetupDifference& each) {
  pack(each.keywords, each.differences);
}

namespace {

template <class Whole>
std::string bytesOf(Whole& whole) {
  Packing pack;
  pack(whole);
  return std::move(pack.bytes());
}

template <class Whole>
bool fill(const std::string& bytes, Whole& whole) {
  Packing pack(bytes);
  pack(whole);
  return pack.isWhole();
}

}  // namespace

std::string packed(SetupDifference found) {
  return bytesOf(found);
}
std::string packed(std::vector<MergeQuestion> questions) {
  return bytesOf(questions);
}
bool unpack(const std::string& bytes, SetupDifference& found) {
  return fill(bytes, found);
}
bool unpack(const std::string& bytes, std::vector<MergeQuestion>& questions) {
  return fill(bytes, questions);
}

}  // namespace gridbay
