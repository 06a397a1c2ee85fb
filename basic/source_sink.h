#pragma once

#include <cstdint>
#include <string>

#include "basic/texts.h"
#include "core/list_kvs.h"

namespace gridbay {

// Where water enters or leaves the model.
class CSourceSinkObjectKvs final : public TableKvs<CSourceSinkObjectKvs> {
 public:
  static constexpr std::int32_t kIsolatedSource = 0;
  static constexpr std::int32_t kIsolatedSink = 1;
  static constexpr std::int32_t kPair = 2;

  using TableKvs::TableKvs;

  GridPoint source;
  GridPoint sink;
  std::int32_t sourceArea = 1;  // from 1
  std::int32_t sinkArea = 1;
  std::int32_t type = kIsolatedSource;

  static constexpr auto table() {
    return keywords(keyword("Type", &CSourceSinkObjectKvs::type),
                    keyword("Source_Point", &CSourceSinkObjectKvs::source),
                    keyword("Sink_Point", &CSourceSinkObjectKvs::sink),
                    keyword("Source_Area", &CSourceSinkObjectKvs::sourceArea),
                    keyword("Sink_Area", &CSourceSinkObjectKvs::sinkArea));
  }

  using TableKvs::Validate;
  // Tests the points against the grids in memory; number from 1.
  unsigned Validate(ValidationList& messages, int deep, int number);

  // "(1,2)->", "->(3,4)" or "(1,2)->(3,4) "
  std::string Text() const;
};

// The list of sources and sinks. What flows there, module by module, follows its count.
class CSourceSinkKvs final : public ListKvs<CSourceSinkKvs, CSourceSinkObjectKvs> {
 public:
  static constexpr int kMostSources = 1024;

  using ListKvs::ListKvs;

  static constexpr auto table() {
    return section("SOURCE_AND_SINK", count("Number_Of_Sources"),
                   items("SOURCE_SINK_%d", texts::sourceSectionMissing));
  }

  // Empties the list first.
  void Load(KvsSection section, const std::string& documentPath) override;
  unsigned Validate(ValidationList& messages, int deep) override;

  void SetNoSources(int n) { SetCount(n); }
};

}  // namespace gridbay
