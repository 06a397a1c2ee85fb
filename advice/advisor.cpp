#include "advice/advisor.h"

#include <fmt/format.h>

#include <algorithm>
#include <cctype>
#include <exception>
#include <filesystem>

#include "advice/fix_files.h"
#include "advice/removal.h"
#include "advice/rules.h"
#include "basic/bathymetry.h"
#include "basic/grid_file.h"
#include "basic/nesting.h"
#include "platform/files/paths.h"
#include "setup/page_places.h"
#include "setup/setting.h"
#include "structures/dike.h"

namespace gridbay {
namespace {

constexpr AdviceRule kRules[] = {
    {"area-position", adviseAreaPositions},
    {"projection", adviseProjections},
    {"land-value", adviseLandValues},
    {"courant", adviseCourant},
    {"flood-and-dry", adviseThresholds},
    {"warm-up", adviseWarmUp},
    {"engine", adviseCodes},
    {"boundary", adviseBoundaries},
    {"source", adviseSources},
    {"structure", adviseStructures},
    {"series", adviseSeries},
    {"file-name", adviseFileNames},
    {"output-size", adviseOutputSize},
};

std::optional<double> freeOnDisk(const std::string& folder) {
  std::error_code error;
  const std::filesystem::space_info space = std::filesystem::space(folder, error);
  if (error) return std::nullopt;
  constexpr double kMegabyte = 1024.0 * 1024.0;
  return static_cast<double>(space.available) / kMegabyte;
}

}  // namespace

std::span<const AdviceRule> adviceRules() {
  return kRules;
}

std::string thingOf(std::string_view what, int number) {
  return fmt::format("{} {}", what, number);
}

std::string capital(std::string_view text) {
  return static_cast<char>(std::toupper(text.front())) + std::string(text.substr(1));
}

std::string valueOf(GridPoint point) {
  return fmt::format("{},{}", point.j, point.k);
}

PagePlace placeOfEntry(PageId page, std::string_view what, ListEntry entry, std::string keyword,
                       std::string_view column) {
  return {.page = page,
          .thing = thingOf(what, entry.number),
          .keyword = std::move(keyword),
          .field = std::string(column),
          .entries = {entry}};
}

const GridFacts* AdviceContext::grid(int number) {
  const auto [at, isNew] = grids_.try_emplace(number, nullptr);
  const CBathymetryObjectKvs* area = model.bathymetry->GetArea(number);
  if (isNew && area != nullptr && !area->fileName.empty()) {
    at->second = files.grid(area->fileName.absolute(), elevationItem());
  }
  return at->second;
}

std::vector<GridRectangle> AdviceContext::coverOf(int number) {
  std::vector<GridRectangle> cover;
  for (int inner = 2; inner <= model.bathymetry->GetCount(); ++inner) {
    const CBathymetryObjectKvs& area = *model.bathymetry->GetArea(inner);
    const GridFacts* facts = grid(inner);
    if (area.enclosingArea != number || facts == nullptr) continue;
    const auto last = [](std::int32_t origin, int count) {
      return origin > 1'000'000'000 ? origin : origin + count / kNestingRatio;
    };
    cover.push_back(
        {area.origin.j, last(area.origin.j, facts->noJ), area.origin.k, last(area.origin.k, facts->noK)});
  }
  return cover;
}

bool AdviceContext::isHotStart() const {
  return model.bathymetry->hotStart == 1;
}

std::size_t AdviceContext::elevationItem() const {
  return static_cast<std::size_t>(gridbay::elevationItem(isHotStart()));
}

// Longitude and latitude are what counts: a projection may be without a zone.
std::optional<GridPlace> AdviceContext::placeOf(int number) {
  const GridFacts* facts = grid(number);
  if (facts == nullptr || !facts->file.geography) return std::nullopt;
  const TsbGeography& on = *facts->file.geography;
  const CVdMapProjection& projection = files.projection(on.projection);
  GridPlace place{on.projection, 0, 0, on.rotation};
  if (projection.IsLocal() ||
      !projection.Geo2Proj(on.longitude, on.latitude, &place.easting, &place.northing))
    return std::nullopt;
  return place;
}

bool AdviceContext::isSameProjection(const std::string& a, const std::string& b) {
  return a == b || files.fullText(a) == files.fullText(b);
}

std::optional<std::vector<GridSpot>> AdviceContext::spotsOn(int number, const std::string& projection,
                                                            std::span<const AdviceSite::MapPoint> points) {
  const GridFacts* facts = grid(number);
  const std::optional<GridPlace> place = placeOf(number);
  if (!place) return std::nullopt;
  const bool isSame = isSameProjection(projection, place->projection);
  const CVdMapProjection& from = files.projection(projection);
  const CVdMapProjection& to = files.projection(place->projection);
  const CVdCartography cartography({}, place->easting, place->northing, place->rotation);
  std::vector<GridSpot> spots;
  spots.reserve(points.size());
  for (auto [easting, northing] : points) {
    double longitude = 0;
    double latitude = 0;
    if (!isSame && !(from.Proj2Geo(easting, northing, &longitude, &latitude) &&
                     to.Geo2Proj(longitude, latitude, &easting, &northing)))
      return std::nullopt;
    GridSpot& spot = spots.emplace_back();
    cartography.Proj2Xy(easting, northing, &spot.j, &spot.k);
    spot.j /= facts->dx;
    spot.k /= facts->dy;
  }
  return spots;
}

std::string AdviceContext::freeName(const std::string& name) {
  const std::string folder = folderOfFile(documentPath);
  if (names_.empty()) {
    names_.insert({});
    for (const FileKeyword& each : fileKeywords()) names_.insert(absolutePath(each.name, folder));
  }
  const std::filesystem::path path(name);
  std::string free = name;
  std::error_code error;
  for (int number = 2;; ++number) {
    const std::string absolute = absolutePath(free, folder);
    if (!std::filesystem::exists(absolute, error) && names_.insert(absolute).second) return free;
    free = fmt::format("{}_{}{}", path.stem().string(), number, path.extension().string());
  }
}

std::vector<std::string> AdviceContext::keywordsNaming(const std::string& path) {
  std::vector<std::string> keywords;
  const std::string folder = folderOfFile(documentPath);
  if (const KvsFile* file = written()) {
    eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
      const auto isIts = [&](const Value& value) {
        return value.kind() == ValueKind::fileName && !value.text().empty() &&
               absolutePath(value.text(), folder) == path;
      };
      if (keyword.values().size() == 1 && isIts(keyword.values()[0])) keywords.push_back(place.keyword);
    });
  }
  return keywords;
}

const KvsFile* AdviceContext::written() {
  if (!isWritten_) {
    isWritten_ = true;
    try {
      CGlobalKvs copy;
      copy.AssignState(model);
      for (int number = 1; number <= copy.nhdDike->GetCount(); ++number)
        copy.nhdDike->GetItem(number)->points.clear();
      KvsHandle file = kvsCreate();
      copy.Save(*file, documentPath);
      file->tree();
      written_ = std::move(file);
    } catch (const std::exception&) {
      // Why it can't be written is told by a save.
    }
  }
  return written_.get();
}

std::vector<FileKeyword> fileKeywordsOf(const KvsFile& file) {
  std::vector<FileKeyword> found;
  eachKeyword(file, [&](const PagePlace& place, const Node& keyword) {
    if (keyword.values().size() != 1) return;
    const Value& value = keyword.values()[0];
    const bool isResult = value.kind() == ValueKind::resultFileName;
    if ((isResult || value.kind() == ValueKind::fileName) && !value.text().empty())
      found.push_back({place, std::string(value.text()), isResult});
  });
  return found;
}

const std::vector<FileKeyword>& AdviceContext::fileKeywords() {
  if (!fileKeywords_) {
    const KvsFile* file = written();
    fileKeywords_ = file == nullptr ? std::vector<FileKeyword>() : fileKeywordsOf(*file);
  }
  return *fileKeywords_;
}

Advisor::Advisor() : files_(std::make_unique<DataFileFacts>()), freeMegabytes_(freeOnDisk) {}
Advisor::~Advisor() = default;

std::vector<Advice> Advisor::look(CGlobalKvs& model, const std::string& documentPath, const KvsFile* source) {
  AdviceContext context(model, documentPath, source, *files_);
  context.freeMegabytes = freeMegabytes_;
  for (const AdviceRule& rule : kRules) {
    context.kind = rule.kind;
    rule.look(context);
  }
  files_->forgetUnused();
  return std::move(context.found);
}

bool Advisor::read(std::chrono::milliseconds time) {
  return files_->read(time);
}

bool Advisor::isComplete() const {
  return files_->isComplete();
}

std::vector<Advice> Advisor::lookThoroughly(CGlobalKvs& model, const std::string& documentPath,
                                            const KvsFile* source) {
  constexpr std::chrono::milliseconds kPiece{100};
  std::vector<Advice> found = look(model, documentPath, source);
  while (!isComplete()) {
    while (!read(kPiece)) {
    }
    found = look(model, documentPath, source);
  }
  return found;
}

void Advisor::setFreeMegabytes(std::function<std::optional<double>(const std::string& folder)> free) {
  freeMegabytes_ = std::move(free);
}

Outcome makeFix(CGlobalKvs& model, const AdviceFix& fix, const std::string& documentPath,
                const std::function<bool(double)>& progress) {
  if (Outcome made = makeFiles(fix.files, progress); !made) return made;
  CGlobalKvs before;
  before.AssignState(model);
  try {
    for (const Setting& setting : fix.settings) {
      if (Outcome done = applySetting(model, setting, documentPath); !done) {
        model.AssignState(before);
        removeFiles(fix.files);
        return done;
      }
    }
    if (fix.removal) makeRemoval(model, *fix.removal);
  } catch (...) {
    model.AssignState(before);
    removeFiles(fix.files);
    throw;
  }
  return {};
}

}  // namespace gridbay
