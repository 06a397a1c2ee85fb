#pragma once

#include <map>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "conversion/vector_file.h"
#include "core/selections.h"
#include "map/map_scene.h"
#include "setup/global_kvs.h"

// What a setup says of what it places, as attributes of the layers for a GIS. Values in base units.

namespace gridbay {

using GisValues = std::vector<VectorValue>;

// Where attributes are taken from: a model, and the data files that it names.
class GisSource {
 public:
  // Of the setup at a path, from whose folder files are named.
  GisSource(CGlobalKvs& model, std::string_view setupPath);

  // Nothing for no name.
  VectorValue file(const FileNameValue& name) const { return file(name.absolute()); }
  VectorValue file(const std::string& absolute) const;
  // Items by their numbers, and by their names in the file where that can be read: "1; 2".
  VectorValue itemNumbers(std::span<const std::uint32_t> items) const;
  VectorValue itemNames(const FileNameValue& name, std::span<const std::uint32_t> items);

  CGlobalKvs& root;

 private:
  std::string folder_;
  std::map<std::string, std::vector<std::string>> names_;  // of the items of a file
};

// A kind of feature as a layer: its name and shape, and what is told of it beside what all have.
struct GisKind {
  MapKind kind;
  std::string_view name;
  VectorShape shape;
  std::vector<VectorLayer::Field> fields;
  GisValues (*values)(GisSource& source, const MapFeature& feature);
};

// All kinds but sources and sinks, whose points stand by themselves.
std::vector<GisKind> gisKinds();

// What flows at a source or sink.
std::vector<VectorLayer::Field> flowFields();
GisValues flowValues(GisSource& source, int number);

inline VectorValue wholeNumber(std::int64_t number) {
  return number;
}
// Nothing for an empty text; a number of 32 bits as its digits tell it.
VectorValue textOr(std::string text);
VectorValue plainNumber(float number);

}  // namespace gridbay
