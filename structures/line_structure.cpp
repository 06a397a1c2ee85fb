#include "structures/line_structure.h"

#include <algorithm>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "platform/cartography/cartography.h"

namespace gridbay {
namespace {

// Constants of the format, around the name.
constexpr double kNoChainage = -1e-155;
constexpr std::string_view kTopologyId = "TopoID";
constexpr int kNameParameter = 3;

constexpr std::string_view kData = "Data";
constexpr std::string_view kFallbackProjection = "UTM-32";

void loadNumbers(KvsSection from, std::string_view name, std::int32_t stated, std::vector<double>& values) {
  values.clear();
  const KvsKeyword keyword = kvsKeywordByNameNum(from, name, 1);
  const int count = keyword == nullptr ? 0 : std::min(stated, kvsGetNoParams(keyword));
  for (int number = 1; number <= count; ++number)
    values.push_back(kvsGetDouble(kvsParamByNum(keyword, number)));
}

std::int32_t pointCount(const LineStructure& structure) {
  return static_cast<std::int32_t>(std::max(structure.x.size(), structure.y.size()));
}

void putPair(KvsFile& file, float level, float width) {
  kvsAddKeyword(file, kData);
  kvsAddFloat(file, level);
  kvsAddFloat(file, width);
}

}  // namespace

void LocationRow::save(const LineStructure& structure, KvsFile& file, const std::string&) const {
  kvsAddKeyword(file, name);
  kvsAddString(file, {});
  kvsAddDouble(file, kNoChainage);
  kvsAddString(file, structure.name);
  kvsAddString(file, kTopologyId);
}

void LocationRow::load(LineStructure& structure, KvsSection from, const std::string&) const {
  kvsGetParam(from, name, &structure.name, 1, kNameParameter);
}

bool LocationRow::access(LineStructure& structure, std::string_view path, PathAccess& access) const {
  return table_detail::accessRow(keyword(name, &LineStructure::name), structure, path, access);
}

void PointsRow::save(const LineStructure& structure, KvsFile& file, const std::string& documentPath) const {
  kvsPutParam(file, count, pointCount(structure));
  putValue(file, xName, structure.x, documentPath);
  putValue(file, yName, structure.y, documentPath);
}

void PointsRow::load(LineStructure& structure, KvsSection from, const std::string&) const {
  std::int32_t stated = 0;
  kvsGetParam(from, count, &stated, 1, 1);
  loadNumbers(from, xName, stated, structure.x);
  loadNumbers(from, yName, stated, structure.y);
}

void PointsRow::copy(LineStructure& structure, const LineStructure& other) const {
  structure.x = other.x;
  structure.y = other.y;
}

bool PointsRow::access(LineStructure& structure, std::string_view path, PathAccess& access) const {
  if (!sameName(path, count)) {
    return table_detail::accessRow(numbers(xName, &LineStructure::x), structure, path, access) ||
           table_detail::accessRow(numbers(yName, &LineStructure::y), structure, path, access);
  }
  if (access.what == PathAccess::What::set) {
    std::int32_t wanted = -1;
    kvsGetParam(access.in, count, &wanted, 1, 1);
    if (wanted >= 0 && wanted <= kMostItems) {
      structure.x.resize(static_cast<std::size_t>(wanted));
      structure.y.resize(static_cast<std::size_t>(wanted));
    }
  }
  if (access.what == PathAccess::What::write) kvsPutParam(*access.out, count, pointCount(structure));
  return true;
}

void LevelWidthRow::save(const LineStructure& structure, KvsFile& file, const std::string&) const {
  kvsAddSection(file, sectionName);
  for (std::size_t i = 0; i < structure.level.size(); ++i)
    putPair(file, structure.level[i], structure.width[i]);
  kvsEndSection(file);
}

void LevelWidthRow::load(LineStructure& structure, KvsSection from, const std::string&) const {
  const KvsSection table = kvsSectionByNameNum(from, sectionName, 1);
  if (table == nullptr) return;
  structure.level.clear();
  structure.width.clear();
  for (int number = 1; number <= kvsGetNoKeywords(table); ++number) {
    if (kvsKeywordByNameNum(table, kData, number) == nullptr) break;
    float level = 0;
    float width = 0;
    kvsGetParam(table, kData, &level, number, 1);
    kvsGetParam(table, kData, &width, number, 2);
    structure.level.push_back(level);
    structure.width.push_back(width);
  }
}

void LevelWidthRow::copy(LineStructure& structure, const LineStructure& other) const {
  structure.level = other.level;
  structure.width = other.width;
}

bool LevelWidthRow::access(LineStructure& structure, std::string_view path, PathAccess& access) const {
  const PathStep step = stepOf(path);
  if (!sameName(step.first, sectionName)) return false;
  if (step.isLast()) {
    access.isSection = true;
    if (access.what == PathAccess::What::write) save(structure, *access.out, *access.documentPath);
    return true;
  }
  const NamedOccurrence named = occurrenceOf(step.rest);
  if (!sameName(named.name, kData) || named.number < 1 ||
      named.number > static_cast<int>(structure.level.size()))
    return false;
  const auto place = static_cast<std::size_t>(named.number) - 1;
  if (access.what == PathAccess::What::write)
    putPair(*access.out, structure.level[place], structure.width[place]);
  if (access.what == PathAccess::What::set) {
    kvsGetParam(access.in, kData, &structure.level[place], 1, 1);
    kvsGetParam(access.in, kData, &structure.width[place], 1, 2);
  }
  return true;
}

std::string projectionOfNewStructure(CKvsBase& object) {
  std::string text;
  if (auto* basic = object.parts<BasicParts>(); basic != nullptr) {
    int coriolis = 0;
    basic->bathymetry->GetProjection(&text, &coriolis);
  }
  const std::string full = CVdMapProjection(text).GetProjectionString();
  return text.empty() || full.empty() ? CVdPRJParser::Format(kFallbackProjection) : full;
}

}  // namespace gridbay
