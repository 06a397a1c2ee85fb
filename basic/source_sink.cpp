#include "basic/source_sink.h"

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "core/table_code.h"

namespace gridbay {
namespace {

// The messages for one of the two points, by rising order of their tests.
struct PointTexts {
  const Text& noArea;
  const Text& outside;
  const Text& covered;
  const Text& onLand;
};

constexpr PointTexts kSource{texts::sourceNoArea, texts::sourceOutside, texts::sourceCovered,
                             texts::sourceOnLand};
constexpr PointTexts kSink{texts::sinkNoArea, texts::sinkOutside, texts::sinkCovered, texts::sinkOnLand};

// What is wrong with a point, or null.
const Text* faultOf(GridPoint point, int areaNumber, const CBathymetryKvs* areas, const PointTexts& texts) {
  const CBathymetryObjectKvs* area = areas == nullptr ? nullptr : areas->GetItem(areaNumber);
  if (area == nullptr) return &texts.noArea;
  if (!area->contains(point.j, point.k)) return &texts.outside;
  if (areas->IsCoveredByEmbeddedArea(areaNumber, point.j, point.k)) return &texts.covered;
  return area->isLand(point.j, point.k) ? &texts.onLand : nullptr;
}

}  // namespace

unsigned CSourceSinkObjectKvs::Validate(ValidationList& messages, int, int number) {
  auto* basic = parts<BasicParts>();
  const CBathymetryKvs* areas = basic == nullptr ? nullptr : basic->bathymetry.get();
  unsigned faults = 0;
  const auto test = [&](GridPoint point, int area, const PointTexts& texts) {
    if (const gridbay::Text* fault = faultOf(point, area, areas, texts); fault != nullptr) {
      faults += report(messages, PageId::sourceAndSink, Severity::fault, *fault, number);
    }
  };
  if (type == kIsolatedSource || type == kPair) test(source, sourceArea, kSource);
  if (type == kIsolatedSink || type == kPair) test(sink, sinkArea, kSink);
  return faults;
}

std::string CSourceSinkObjectKvs::Text() const {
  switch (type) {
    case kIsolatedSource:
      return formatted(texts::sourceText, source.j, source.k);
    case kIsolatedSink:
      return formatted(texts::sinkText, sink.j, sink.k);
    case kPair:
      return formatted(texts::sourceSinkText, source.j, source.k, sink.j, sink.k);
    default:
      return {};
  }
}

void CSourceSinkKvs::Load(KvsSection section, const std::string& documentPath) {
  SetNoSources(0);
  ListKvs::Load(section, documentPath);
}

unsigned CSourceSinkKvs::Validate(ValidationList& messages, int deep) {
  unsigned faults = 0;
  // The page is that of the bathymetries, and the text speaks of another limit; both are meant.
  if (GetCount() > kMostSources) {
    faults += report(messages, PageId::bathymetry, Severity::dependedUpon, texts::sourceCount);
  }
  return faults + ListKvs::Validate(messages, deep);
}

}  // namespace gridbay
