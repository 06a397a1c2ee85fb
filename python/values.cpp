#include "python/values.h"

#include <fmt/format.h>

#include <array>
#include <cmath>
#include <limits>

#include "core/number_text.h"
#include "python/refusal.h"

namespace gridbay::python {
namespace py = pybind11;

namespace {

constexpr std::size_t kDateParts = 6;

bool isDate(std::span<const Value> values) {
  return values.size() == kDateParts &&
         std::ranges::all_of(values, [](const Value& value) { return value.kind() == ValueKind::integer; });
}

py::object objectOf(const Value& value) {
  const std::string_view text = value.text();
  switch (value.kind()) {
    case ValueKind::boolean:
      return py::bool_(text == "true");
    case ValueKind::integer:
      return py::int_(int32OfText(text).value_or(0));
    case ValueKind::real:
      return py::float_(doubleOfText(text).value_or(std::numeric_limits<double>::quiet_NaN()));
    case ValueKind::string:
      return textObject(text);
    default:
      if (text.empty()) return py::none();
      return py::module_::import("pathlib").attr("Path")(py::reinterpret_steal<py::object>(
          PyUnicode_DecodeFSDefaultAndSize(text.data(), static_cast<py::ssize_t>(text.size()))));
  }
}

py::object dateOf(std::span<const Value> values) {
  std::array<int, kDateParts> parts{};
  for (std::size_t i = 0; i < kDateParts; ++i) parts[i] = int32OfText(values[i].text()).value_or(-1);
  if (parts[0] < 0) return py::none();
  return py::module_::import("datetime")
      .attr("datetime")(parts[0], parts[1], parts[2], parts[3], parts[4], parts[5]);
}

std::string_view nameOf(ValueKind kind) {
  switch (kind) {
    case ValueKind::boolean:
      return "True or False";
    case ValueKind::integer:
      return "a whole number of 32 bits";
    case ValueKind::real:
      return "a number";
    case ValueKind::string:
      return "a text";
    default:
      return "the name of a file (str or a path), or None";
  }
}

// Whether an object is an instance of a scalar class of numpy, by the beginning of its name.
bool isNumpy(py::handle given, std::string_view name) {
  const std::string_view type = Py_TYPE(given.ptr())->tp_name;
  return type.starts_with("numpy." + std::string(name));
}

bool isNumber(py::handle given) {
  return !isBool(given) &&
         (PyFloat_Check(given.ptr()) != 0 || PyIndex_Check(given.ptr()) != 0 || isNumpy(given, "float"));
}

Refusal wrong(std::string_view which, py::handle given, ValueKind kind, const std::string& path) {
  return refusal(which, path, shown(given), std::string(nameOf(kind)));
}

// A text as bytes; a path too.
std::string bytesOf(py::handle given, bool file, const std::string& path) {
  py::object text = py::reinterpret_borrow<py::object>(given);
  if (file && PyUnicode_Check(text.ptr()) == 0) text = py::module_::import("os").attr("fspath")(text);
  PyObject* bytes = PyUnicode_Check(text.ptr()) == 0 ? nullptr
                    : file                           ? PyUnicode_EncodeFSDefault(text.ptr())
                           : PyUnicode_AsEncodedString(text.ptr(), "utf-8", "surrogateescape");
  if (bytes == nullptr) {
    PyErr_Clear();
    throw refusal(kWrongValue, path, shown(given), "a text that UTF-8 can hold");
  }
  const std::string held = py::reinterpret_steal<py::bytes>(bytes);
  if (held.find('\0') != held.npos)
    throw refusal(kWrongValue, path, shown(given), "a text without zero bytes");
  return held;
}

std::string valueText(py::handle given, ValueKind kind, const std::string& path) {
  switch (kind) {
    case ValueKind::boolean:
      return boolOf(given, path) ? "true" : "false";
    case ValueKind::integer:
      return numberText(std::int64_t{wholeOf(given, path)});
    case ValueKind::real:
      return numberText(realOf(given, path));
    case ValueKind::string:
      return textOf(given, path);
    default:
      return fileOf(given, path);
  }
}

// Six whole numbers from a datetime.
std::vector<py::object> dateParts(py::handle given, const std::string& path) {
  std::vector<py::object> parts;
  for (const std::int32_t part : momentOf(given, path)) parts.emplace_back(py::int_(part));
  return parts;
}

}  // namespace

bool isBool(py::handle given) {
  return PyBool_Check(given.ptr()) != 0 || isNumpy(given, "bool");
}

bool boolOf(py::handle given, const std::string& path) {
  if (!isBool(given)) throw wrong(kWrongType, given, ValueKind::boolean, path);
  return py::bool_(py::reinterpret_borrow<py::object>(given));
}

std::int32_t wholeOf(py::handle given, const std::string& path) {
  if (isBool(given) || PyIndex_Check(given.ptr()) == 0)
    throw wrong(kWrongType, given, ValueKind::integer, path);
  const auto number = py::reinterpret_steal<py::int_>(PyNumber_Index(given.ptr()));
  if (!number) throw py::error_already_set();
  int overflow = 0;
  const long long whole = PyLong_AsLongLongAndOverflow(number.ptr(), &overflow);
  if (overflow != 0 || whole < std::numeric_limits<std::int32_t>::min() ||
      whole > std::numeric_limits<std::int32_t>::max()) {
    throw wrong(kWrongValue, given, ValueKind::integer, path);
  }
  return static_cast<std::int32_t>(whole);
}

double realOf(py::handle given, const std::string& path) {
  if (!isNumber(given)) throw wrong(kWrongType, given, ValueKind::real, path);
  const double number = PyFloat_AsDouble(given.ptr());
  if (PyErr_Occurred() != nullptr) {
    PyErr_Clear();
    throw wrong(kWrongValue, given, ValueKind::real, path);
  }
  return number;
}

std::string textOf(py::handle given, const std::string& path) {
  if (PyUnicode_Check(given.ptr()) == 0) throw wrong(kWrongType, given, ValueKind::string, path);
  return bytesOf(given, false, path);
}

std::string fileOf(py::handle given, const std::string& path) {
  if (given.is_none()) return {};
  if (PyUnicode_Check(given.ptr()) == 0 && !py::hasattr(given, "__fspath__"))
    throw wrong(kWrongType, given, ValueKind::fileName, path);
  return bytesOf(given, true, path);
}

std::array<std::int32_t, 6> momentOf(py::handle given, const std::string& path) {
  constexpr const char* kAllowed = "a datetime of whole seconds without a time zone";
  const auto part = [given](const char* name) { return py::cast<std::int32_t>(given.attr(name)); };
  if (!py::isinstance(given, py::module_::import("datetime").attr("datetime")))
    throw refusal(kWrongType, path, shown(given), kAllowed);
  if (!given.attr("tzinfo").is_none() || part("microsecond") != 0)
    throw refusal(kWrongValue, path, shown(given), kAllowed);
  return {part("year"), part("month"), part("day"), part("hour"), part("minute"), part("second")};
}

std::vector<py::object> piecesOf(py::handle given, const std::string& path, const std::string& allowed) {
  if (PyUnicode_Check(given.ptr()) != 0 || PyBytes_Check(given.ptr()) != 0 ||
      py::isinstance<py::dict>(given) || !py::hasattr(given, "__iter__")) {
    throw refusal(kWrongType, path, shown(given), allowed);
  }
  std::vector<py::object> pieces;
  for (const py::handle piece : given) pieces.push_back(py::reinterpret_borrow<py::object>(piece));
  return pieces;
}

py::object textObject(std::string_view text) {
  return py::reinterpret_steal<py::object>(
      PyUnicode_DecodeUTF8(text.data(), static_cast<py::ssize_t>(text.size()), "surrogateescape"));
}

py::object objectOf(const Node& keyword, bool takesAnyNumber) {
  const std::span<const Value> values = keyword.values();
  if (takesAnyNumber) {
    py::list list;
    for (const Value& value : values) list.append(objectOf(value));
    return list;
  }
  if (values.size() == 1) return objectOf(values.front());
  if (isDate(values)) return dateOf(values);
  py::tuple tuple(values.size());
  for (std::size_t i = 0; i < values.size(); ++i) tuple[i] = objectOf(values[i]);
  return tuple;
}

std::vector<Value> valuesOf(py::handle given, const Node& keyword, bool takesAnyNumber,
                            const std::string& path, ParameterTree& keeper) {
  const std::span<const Value> now = keyword.values();
  std::vector<py::object> pieces;
  if (now.size() == 1 && !takesAnyNumber) {
    pieces.push_back(py::reinterpret_borrow<py::object>(given));
  } else if (isDate(now) && !takesAnyNumber) {
    pieces = dateParts(given, path);
  } else {
    const std::string kind(now.empty() ? "a number" : nameOf(now.front().kind()));
    const std::string allowed = takesAnyNumber ? fmt::format("a list, each {}", kind)
                                               : fmt::format("{} values, as a tuple", now.size());
    pieces = piecesOf(given, path, allowed);
    if (!takesAnyNumber && pieces.size() != now.size())
      throw refusal(kWrongValue, path, fmt::format("{} values", pieces.size()), allowed);
  }
  // A list has values of one kind; an empty one does not say which.
  const bool allWhole =
      std::ranges::all_of(pieces, [](const py::object& piece) { return PyIndex_Check(piece.ptr()) != 0; });
  std::vector<Value> values;
  for (std::size_t i = 0; i < pieces.size(); ++i) {
    const ValueKind kind = now.empty() ? (allWhole ? ValueKind::integer : ValueKind::real)
                                       : now[std::min(i, now.size() - 1)].kind();
    values.push_back(keeper.makeValue(kind, keeper.keep(valueText(pieces[i], kind, path))));
  }
  return values;
}

}  // namespace gridbay::python
