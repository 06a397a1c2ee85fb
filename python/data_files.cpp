#include <fmt/format.h>
#include <pybind11/numpy.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <memory>
#include <vector>

#include "conversion/history.h"
#include "conversion/item_types.h"
#include "core/land_value.h"
#include "platform/cartography/cartography.h"
#include "platform/files/may_write.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "python/arguments.h"
#include "python/item_type_text.h"

namespace gridbay::python {
namespace py = pybind11;

namespace {

constexpr const char* kLandBlock = "V27_Misc";

// Sizes of an array as Python has them: the last one is the fastest, x.
std::vector<py::ssize_t> shapeOf(const TsbDefinition& definition, std::size_t steps = 0) {
  std::vector<py::ssize_t> shape;
  if (steps > 0) shape.push_back(static_cast<py::ssize_t>(steps));
  for (auto axis = definition.axes.rbegin(); axis != definition.axes.rend(); ++axis)
    shape.push_back(static_cast<py::ssize_t>(axis->points));
  return shape;
}

// An array over values that it keeps alive.
template <class Real>
py::array arrayOver(std::unique_ptr<std::vector<Real>> values, std::vector<py::ssize_t> shape) {
  Real* data = values->data();
  const py::capsule keeper(values.get(), [](void* held) {
    std::default_delete<std::vector<Real>>()(static_cast<std::vector<Real>*>(held));
  });
  static_cast<void>(values.release());
  return py::array_t<Real>(std::move(shape), data, keeper);
}

const TsbItem& itemOf(const TsbFile& file, int item) {
  const std::vector<TsbItem>& items = file.definition().items;
  if (item < 1 || item > static_cast<int>(items.size())) {
    throw refusal(kRangeError, file.path(), fmt::format("item {}", item),
                  fmt::format("1 to {}", items.size()));
  }
  return items[static_cast<std::size_t>(item) - 1];
}

template <class Real>
py::array readStep(const TsbFile& file, int item, std::size_t step) {
  auto values = std::make_unique<std::vector<Real>>(file.definition().pointCount());
  if (const Outcome read = file.read(static_cast<std::size_t>(item), step, std::span<Real>(*values)); !read)
    throw fileRefusal(file.path(), read.error(), kReadableData);
  return arrayOver(std::move(values), shapeOf(file.definition()));
}

template <class Real>
py::array readAll(const TsbFile& file, int item) {
  const TsbDefinition& definition = file.definition();
  auto values = std::make_unique<std::vector<Real>>(definition.pointCount() * definition.time.count);
  if (const Outcome read = file.readSteps(static_cast<std::size_t>(item), 0, std::span<Real>(*values)); !read)
    throw fileRefusal(file.path(), read.error(), kReadableData);
  return arrayOver(std::move(values), shapeOf(definition, definition.time.count));
}

TsbFile openFile(const std::string& path) {
  Result<TsbFile> opened = TsbFile::open(path);
  if (!opened) throw fileRefusal(path, opened.error(), kReadableData);
  return std::move(*opened);
}

py::array read(const TsbFile& file, int item, int step) {
  const TsbItem& chosen = itemOf(file, item);
  const std::size_t count = file.definition().time.count;
  if (step < 0 || static_cast<std::size_t>(step) >= count) {
    throw refusal(kRangeError, file.path(), fmt::format("time step {}", step),
                  count == 0 ? "none" : fmt::format("0 to {}", count - 1));
  }
  const auto at = static_cast<std::size_t>(step);
  return chosen.isDouble ? readStep<double>(file, item, at) : readStep<float>(file, item, at);
}

py::dict definitionOf(const TsbFile& file) {
  const TsbDefinition& definition = file.definition();
  py::dict dict;
  dict["title"] = textObject(definition.title);
  dict["history"] = textObject(definition.history);
  py::list items;
  for (const TsbItem& item : definition.items)
    items.append(tupleOf(item.name, item.type, item.unit, item.deleteValue));
  dict["items"] = items;
  py::list axes;
  for (const TsbGridAxis& axis : definition.axes)
    axes.append(py::make_tuple(axis.points, axis.first, axis.spacing, axis.unit));
  dict["axes"] = axes;
  const TsbTimeAxis& time = definition.time;
  auto times = std::make_unique<std::vector<double>>(time.count);
  for (std::size_t i = 0; i < time.count; ++i) (*times)[i] = time.at(i);
  dict["times"] = arrayOver(std::move(times), {static_cast<py::ssize_t>(time.count)});
  dict["time_unit"] = time.unit;
  dict["start"] = time.isCalendar() ? py::module_::import("datetime")
                                          .attr("datetime")(time.start[0], time.start[1], time.start[2],
                                                            time.start[3], time.start[4], time.start[5])
                                    : py::none();
  dict["projection"] = textObject(definition.geography ? definition.geography->projection : "");
  dict["longitude"] = definition.geography ? py::cast(definition.geography->longitude) : py::none();
  dict["latitude"] = definition.geography ? py::cast(definition.geography->latitude) : py::none();
  dict["rotation"] = definition.geography ? definition.geography->rotation : 0.0;
  const Result<std::optional<float>> land = landValueOf(definition);
  dict["land"] = land && *land ? py::cast(static_cast<double>(**land)) : py::none();
  return dict;
}

// A map in the making: its values lie here, and arrays look at them.
class NewGrid {
 public:
  NewGrid(const std::array<int, 2>& points, const std::array<double, 2>& spacing,
          const std::array<double, 2>& first, const std::string& itemType, std::optional<float> land,
          const std::string& projection, double rotation, int steps, double timeStep) {
    const auto refuse = [](const char* what, const std::string& given, const char* allowed) {
      return refusal(kWrongValue, what, given, allowed);
    };
    constexpr int kMostPoints = 1 << 30;
    if (points[0] < 1 || points[1] < 1 || steps < 1 || kMostPoints / points[0] / points[1] / steps < 1) {
      throw refuse("points", fmt::format("{} x {} points in {} steps", points[0], points[1], steps),
                   "at least 1 of each, and together no more than 2**30");
    }
    if (!(spacing[0] > 0 && spacing[1] > 0))
      throw refuse("spacing", fmt::format("{}, {}", spacing[0], spacing[1]), "two numbers above 0 (m)");
    if (!(timeStep > 0)) throw refuse("time_step", fmt::format("{}", timeStep), "a number above 0 (s)");
    const Result<const QunItem*> quantity = itemTypeOfText(itemType, "gridbay_setup.item_types() lists them");
    if (!quantity)
      throw refusal(kWrongValue, "item_type", "\"" + itemType + "\"", "a quantity. " + quantity.error());
    if ((*quantity)->code == item::kBathymetry && !land)
      throw refuse("land", "None", "a number for a bathymetry: points at or above it are land");
    definition_.time.type = TsbTimeAxisType::relativeEquidistant;
    definition_.time.count = static_cast<std::size_t>(steps);
    definition_.time.step = timeStep;
    const CVdMapProjection map(projection);
    if (!map.IsValid())
      throw refuse("projection", "\"" + projection + "\"", "a projection that is known here");
    const bool turned = rotation != 0;
    if (turned && map.IsLocal())
      throw refuse("rotation", fmt::format("{}", rotation), "0 where there is no projection");
    for (std::size_t i = 0; i < points.size(); ++i) {
      definition_.axes.push_back(
          {static_cast<std::size_t>(points[i]), turned ? 0 : first[i], spacing[i], "m"});
    }
    definition_.items = {{std::string((*quantity)->name), (*quantity)->code,
                          std::string(qunBaseUnit((*quantity)->code)->text)}};
    if (land) definition_.customBlocks = {{kLandBlock, {0, 0, 0, *land}}};
    if (!map.IsLocal()) {
      TsbGeography place{projection, 0, 0, rotation};
      if (!map.Proj2Geo(first[0], first[1], &place.longitude, &place.latitude))
        throw refuse("first", fmt::format("{}, {}", first[0], first[1]), "a point in the projection");
      definition_.geography = place;
    }
    values_.resize(definition_.pointCount() * definition_.time.count);
  }

  // All steps; the object lives as long as the array does.
  static py::array values(const py::object& self) {
    auto& grid = self.cast<NewGrid&>();
    return py::array_t<float>(shapeOf(grid.definition_, grid.definition_.time.count), grid.values_.data(),
                              self);
  }

  void save(const std::string& path, const std::string& title, const std::string& history, bool force) {
    if (const Outcome free = mayWrite(path, force, {}, "force=True"); !free)
      throw fileRefusal(path, free.error(), kNewFile);
    definition_.title = title;
    definition_.history = historyWith({}, history);
    Result<TsbWriter> writer = TsbWriter::create(path, definition_);
    if (!writer) throw fileRefusal(path, writer.error(), kWritableFile);
    const std::size_t points = definition_.pointCount();
    for (std::size_t step = 0; step < definition_.time.count; ++step) {
      const std::span<const float> values(values_.data() + step * points, points);
      if (const Outcome written = writer->write(1, step, values); !written)
        throw fileRefusal(path, written.error(), kWritableFile);
    }
    if (const Outcome written = writer->commit(); !written)
      throw fileRefusal(path, written.error(), kWritableFile);
  }

 private:
  TsbDefinition definition_;
  std::vector<float> values_;
};

}  // namespace

void addDataFiles(py::module_& module) {
  const Argument file{.name = "path", .form = Argument::Form::file};
  addFunction(
      module, "open_data", [](std::string path) { return py::object(py::cast(openFile(path))); }, {file},
      "Opens a data file.");
  Members<TsbFile>(
      py::class_<TsbFile>(module, "DataFile", py::module_local(), "A data file, open for reading.")
          .def("definition", &definitionOf, "All but the values."))
      .add(
          "read", [](TsbFile& data, int item, int step) { return read(data, item, step); },
          {{"item"}, {"step"}}, "The values of one time step.")
      .add(
          "read_all",
          [](TsbFile& data, int item) {
            return itemOf(data, item).isDouble ? readAll<double>(data, item) : readAll<float>(data, item);
          },
          {{"item"}}, "The values of all time steps, the step first.");
  Members<NewGrid>(py::class_<NewGrid>(module, "NewGrid", py::module_local(), "A map in the making.")
                       .def_property_readonly("values", &NewGrid::values, "The values, to be written to."))
      .add("save", &NewGrid::save, {file, {"title"}, {"history"}, {"force"}},
           "Writes the file, whole or not at all.");
  addFunction(
      module, "new_grid",
      [](std::array<int, 2> points, std::array<double, 2> spacing, std::array<double, 2> first,
         ItemTypeText itemType, std::optional<float> land, std::string projection, double rotation, int steps,
         double timeStep) {
        return py::object(py::cast(std::make_unique<NewGrid>(points, spacing, first, itemType.text, land,
                                                             projection, rotation, steps, timeStep)));
      },
      {{"points"},
       {"spacing"},
       {"first"},
       {"item_type"},
       {"land"},
       {"projection"},
       {"rotation"},
       {"steps"},
       {"time_step"}},
      "Begins a map of 0 everywhere.");
}

}  // namespace gridbay::python
