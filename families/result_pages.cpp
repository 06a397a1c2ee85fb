#include "families/result_pages.h"

#include "pages/result_subset.h"

namespace gridbay {
namespace {

constexpr std::string_view kBrowse = "...";

}  // namespace

FileKind resultFileKind(Extent extent) {
  switch (extent) {
    case Extent::point:
      return texts::pointResultFile;
    case Extent::line:
      return texts::lineResultFile;
    default:
      return texts::mapResultFile;
  }
}

bool hasAreaOrTells(CVdDoc& document, const ResultLimits& limits) {
  if (!limits.hasArea) document.host().show(formatted(texts::associatedAreaInvalid));
  return limits.hasArea;
}

bool chooseResultPart(CVdDoc& document, const ResultLimits& limits, std::int32_t area, USubArea& part,
                      USubLine& steps, bool isLine) {
  if (!hasAreaOrTells(document, limits)) return false;
  CV27SetupResultSubsetDialog dialog(CV27SetupResultSubsetDialog::rangeOf(part, steps), limits.lastJ,
                                     limits.lastK, limits.lastStep);
  dialog.SetPick(area, isLine);
  if (dialog.DoModal(document.host()) != 1) return false;
  CV27SetupResultSubsetDialog::copyBack(dialog.range(), part, steps);
  return true;
}

Column& ResultFileGrid::BrowseBeside(const FileChoice& file) {
  Column& column = Browse(kBrowse, 20, file);
  column.header = kBrowse;
  return column;
}

std::string ResultFileGrid::editName(int row, int col) {
  return ColumnGrid::editName(row, GetColHeader(col) == kBrowse ? col - 1 : col);
}

std::string hotStartCaption(std::string_view label, bool isOn, double megabytes) {
  return std::string(label) + (isOn ? formatted(texts::hotStartSize, megabytes) : std::string());
}

}  // namespace gridbay
