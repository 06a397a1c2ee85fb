#include "structures/dike.h"

#include "core/table_code.h"
#include "families/data_files.h"
#include "platform/files/paths.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

// Of a point's section.
constexpr std::array<std::pair<std::string_view, double DikePoint::*>, 3> kCoordinates{
    {{"x", &DikePoint::x}, {"y", &DikePoint::y}, {"z", &DikePoint::z}}};
constexpr int kMostPoints = 1'000'000;  // that can be set by their number's path

void savePoint(const DikePoint& point, KvsFile& file, std::string_view name) {
  kvsAddSection(file, name);
  for (const auto& [keyword, coordinate] : kCoordinates) kvsPutParam(file, keyword, point.*coordinate);
  kvsEndSection(file);
}

}  // namespace

void CNhdDikeObjectKvs::PointsRow::save(const CNhdDikeObjectKvs& dike, KvsFile& file,
                                        const std::string&) const {
  kvsPutParam(file, count, static_cast<std::int32_t>(dike.points.size()));
  NumberedText name(point);
  int number = 0;
  for (std::size_t block = 0; block < dike.points.blockCount(); ++block) {
    for (const DikePoint& at : dike.points.block(block)) savePoint(at, file, name.of(++number));
  }
}

void CNhdDikeObjectKvs::PointsRow::load(CNhdDikeObjectKvs& dike, KvsSection from, const std::string&) const {
  dike.points.clear();
  NumberedText name(point);
  for (int number = 1;; ++number) {
    const KvsSection section = kvsSectionByNameNum(from, name.of(number), 1);
    if (section == nullptr) break;
    DikePoint read;
    for (const auto& [keyword, coordinate] : kCoordinates)
      kvsGetParam(section, keyword, &(read.*coordinate), 1, 1);
    dike.points.push_back(read);
  }
}

bool CNhdDikeObjectKvs::PointsRow::access(CNhdDikeObjectKvs& dike, std::string_view path,
                                          PathAccess& access) const {
  const bool isSet = access.what == PathAccess::What::set;
  const bool isWritten = access.what == PathAccess::What::write;
  if (sameName(path, count)) {
    auto number = static_cast<std::int32_t>(dike.points.size());
    if (isSet) kvsGetParam(access.in, count, &number, 1, 1);
    if (isSet && number <= kMostPoints) dike.SetNoPoints(number);
    if (isWritten) kvsPutParam(*access.out, count, number);
    return true;
  }
  const PathStep step = stepOf(path);
  const std::optional<int> number = numberIn(step.first, point);
  if (!number || *number < 1 || static_cast<std::size_t>(*number) > dike.points.size()) return false;
  const std::size_t place = static_cast<std::size_t>(*number) - 1;
  if (step.isLast()) {
    access.isSection = true;
    if (isWritten) savePoint(dike.points[place], *access.out, formatted(point, *number));
    return true;
  }
  for (const auto& [keyword, coordinate] : kCoordinates) {
    if (!sameName(step.rest, keyword)) continue;
    if (isSet) kvsGetParam(access.in, keyword, &(dike.points.edit(place).*coordinate), 1, 1);
    if (isWritten) kvsPutParam(*access.out, keyword, dike.points[place].*coordinate);
    return true;
  }
  return false;
}

std::int32_t CNhdDikeObjectKvs::crest() const {
  const bool isOne = crestLevelSpecification >= kConstant && crestLevelSpecification < kInSpaceAndTime + 1;
  return isOne ? static_cast<std::int32_t>(crestLevelSpecification) : 0;
}

void CNhdDikeObjectKvs::SetNoPoints(int count) {
  if (count >= 0) points.resize(static_cast<std::size_t>(count));
}

void CNhdDikeObjectKvs::RequestCrestLevelFile(CVdFileSelectorDlg& selector) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::crestLevelRequest.format);
  request.SetMultiQunType({item::kElevation, item::kCrestLevel});
  request.SetDimensions(1);
  selector.SetTimeAxisType(static_cast<int>(TsbTimeAxisType::calendarEquidistant));
  requestSimulationPeriod(selector, *this);
}

unsigned CNhdDikeObjectKvs::Validate(ValidationList& messages, int) {
  if (crest() != kInSpaceAndTime) return 0;
  CVdFileSelectorDlg selector;
  RequestCrestLevelFile(selector);
  noteDataFile(messages, PageId::dikes, selector, crestLevelFile);
  if (isReadableFile(crestLevelFile.absolute())) return 0;
  return reportDataFile(messages, PageId::dikes, crestLevelFile, {}, Reason::left);
}

std::size_t CNhdDikeObjectKvs::bytesBeside(const CNhdDikeObjectKvs* other) const {
  return points.bytesBeside(other == nullptr ? SharedArray<DikePoint>() : other->points);
}

}  // namespace gridbay
