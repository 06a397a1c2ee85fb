#include "tests/support/grids.h"

#include <gtest/gtest.h>

#include "platform/tsb/tsb_writer.h"

namespace gridbay::test {
namespace {

void writeItem(TsbWriter& writer, const GridSpec& spec, int item, int step, const Surface& surface) {
  std::vector<float> values;
  for (int k = 0; k < spec.noK; ++k) {
    for (int j = 0; j < spec.noJ; ++j) values.push_back(surface(j, k));
  }
  const Outcome written = writer.write(static_cast<std::size_t>(item), static_cast<std::size_t>(step),
                                       std::span<const float>(values));
  ASSERT_TRUE(written) << written.error();
}

}  // namespace

TsbDefinition definitionOf(const GridSpec& spec) {
  TsbDefinition definition;
  definition.title = "test";
  definition.dataType = spec.dataType;
  definition.time = spec.time;
  definition.time.count = static_cast<std::size_t>(spec.steps);
  definition.axes = {{static_cast<std::size_t>(spec.noJ), 0, spec.dx, spec.axisUnit},
                     {static_cast<std::size_t>(spec.noK), 0, spec.dy, spec.axisUnit}};
  for (int i = 1; i <= spec.items; ++i)
    definition.items.push_back({"Item " + std::to_string(i), spec.itemType, spec.unit});
  definition.customBlocks = spec.blocks;
  if (spec.land) definition.customBlocks.push_back({"V27_Misc", {0, 0, 0, *spec.land}});
  definition.geography = spec.geography;
  return definition;
}

void writeGrid(const std::string& path, const GridSpec& spec, const Surface& surface) {
  Result<TsbWriter> writer = TsbWriter::create(path, definitionOf(spec));
  ASSERT_TRUE(writer) << writer.error();
  for (int item = 1; item <= spec.items; ++item) {
    for (int step = 0; step < spec.steps; ++step) writeItem(*writer, spec, item, step, surface);
  }
  const Outcome written = writer->commit();
  ASSERT_TRUE(written) << written.error();
}

void writeHotStart(const std::string& path, GridSpec spec, const Surface& surface, int enclosing, int originJ,
                   int originK) {
  spec.dataType = 11;
  spec.items = 2;
  Result<TsbWriter> writer = TsbWriter::create(path, definitionOf(spec));
  ASSERT_TRUE(writer) << writer.error();
  const Surface placement = [=](int j, int k) {
    if (k != 0) return 0.0F;
    return static_cast<float>(j == 4 ? enclosing : j == 5 ? originJ : j == 6 ? originK : 0) + 0.5F;
  };
  writeItem(*writer, spec, 1, 0, placement);
  writeItem(*writer, spec, 2, 0, surface);
  const Outcome written = writer->commit();
  ASSERT_TRUE(written) << written.error();
}

void writeFile(const std::string& path, const TsbDefinition& definition) {
  Result<TsbWriter> writer = TsbWriter::create(path, definition);
  ASSERT_TRUE(writer) << writer.error();
  const std::vector<float> zeros(definition.pointCount(), 0.0F);
  for (std::size_t step = 0; step < definition.time.count; ++step) {
    for (std::size_t i = 1; i <= definition.items.size(); ++i) {
      ASSERT_TRUE(writer->write(i, step, std::span<const float>(zeros)));
    }
  }
  ASSERT_TRUE(writer->commit());
}

void writeSeries(const std::string& path, const TsbTimeAxis& time, int itemType, const std::string& unit,
                 int items) {
  TsbDefinition definition;
  definition.time = time;
  for (int i = 1; i <= items; ++i)
    definition.items.push_back({"Series " + std::to_string(i), itemType, unit});
  writeFile(path, definition);
}

}  // namespace gridbay::test
