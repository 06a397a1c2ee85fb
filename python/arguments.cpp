#include "python/arguments.h"

#include <cmath>
#include <limits>
#include <memory>
#include <stdexcept>

namespace gridbay::python {
namespace py = pybind11;

namespace {

std::string listed(const Function& function) {
  std::string text;
  for (std::size_t i = 0; i < function.arguments.size(); ++i)
    text += fmt::format("{}{}: {}", i == 0 ? "" : ", ", function.arguments[i].name, function.types[i]);
  return "(" + text + ")";
}

// What is given for each argument, in order; of one that may be left out, and is, its fallback.
std::vector<py::object> matched(const Function& function, const std::string& path, const py::args& places,
                                const py::kwargs& names) {
  const auto wrong = [&](const std::string& what) {
    return refusal(kWrongType, path, what, listed(function));
  };
  std::vector<py::object> found(function.arguments.size());
  if (places.size() > found.size()) throw wrong(fmt::format("{} arguments", places.size()));
  for (std::size_t i = 0; i < places.size(); ++i) found[i] = places[i];
  for (const auto& [name, value] : names) {
    const auto argument = std::ranges::find(function.arguments, py::cast<std::string>(name), &Argument::name);
    if (argument == function.arguments.end()) throw wrong("an argument " + shown(name));
    py::object& place = found[static_cast<std::size_t>(argument - function.arguments.begin())];
    if (place) throw wrong(argument->name + " twice");
    place = py::reinterpret_borrow<py::object>(value);
  }
  for (std::size_t i = 0; i < found.size(); ++i) {
    const Argument& argument = function.arguments[i];
    if (!found[i] && argument.fallback) found[i] = py::int_(*argument.fallback);
    if (!found[i]) throw wrong("no " + argument.name);
  }
  return found;
}

py::object call(const Function& function, const std::string& path, py::handle self, const py::args& places,
                const py::kwargs& names) {
  const std::vector<py::object> objects = matched(function, path, places, names);
  std::vector<Given> all;
  for (std::size_t i = 0; i < objects.size(); ++i) {
    const Argument& argument = function.arguments[i];
    all.push_back({argument, self, objects[i], fmt::format("{}({})", path, argument.name)});
  }
  try {
    return function.body(self, all);
  } catch (const std::invalid_argument& fault) {
    py::tuple whole(objects.size());
    for (std::size_t i = 0; i < objects.size(); ++i) whole[i] = objects[i];
    throw refusal(kWrongValue, path, shown(whole), fmt::format("{}. {}", function.allowed, fault.what()));
  }
}

std::string docOf(const Function& function) {
  return fmt::format("{}{}\n\n{}", function.name, listed(function), function.doc);
}

// Help has the names of the arguments from here, where Python knows none.
struct OwnSignatures : py::options {
  OwnSignatures() { disable_function_signatures(); }
};

// One that is kept as long as the function of Python is.
std::shared_ptr<const Function> kept(Function function) {
  if (function.arguments.size() != function.types.size())
    throw std::logic_error(function.name + " has names for other arguments than it takes");
  return std::make_shared<const Function>(std::move(function));
}

}  // namespace

void checkEnds(const Given& given, int number) {
  const auto& [name, form, least, most, kind, fallback] = given.argument;
  if (!least && !most) return;
  const int lowest = least.value_or(std::numeric_limits<int>::min());
  const int highest = most ? most(given.self) : std::numeric_limits<int>::max();
  if (number >= lowest && number <= highest) return;
  const std::string allowed = highest < lowest ? "none: there is none in the model"
                              : !most          ? fmt::format("{} or more", lowest)
                              : !least         ? fmt::format("{} or less", highest)
                                               : fmt::format("{} to {}", lowest, highest);
  throw refusal(kind, given.path, fmt::format("{}", number), allowed);
}

int Taken<int>::from(const Given& given) {
  if (given.argument.form == Argument::Form::flag && isBool(given.value))
    return boolOf(given.value, given.path) ? 1 : 0;
  const int number = wholeOf(given.value, given.path);
  checkEnds(given, number);
  return number;
}

double Taken<double>::from(const Given& given) {
  const double number = realOf(given.value, given.path);
  if (!(std::abs(number) <= double{std::numeric_limits<float>::max()}))
    throw refusal(kWrongValue, given.path, shown(given.value), "a finite number of single precision");
  return number;
}

std::string Taken<std::string>::from(const Given& given) {
  return given.argument.form == Argument::Form::file ? fileOf(given.value, given.path)
                                                     : textOf(given.value, given.path);
}

void addFunction(py::module_& module, Function function) {
  const OwnSignatures own;
  const std::string name = function.name;
  const std::string doc = docOf(function);
  module.attr(name.c_str()) = py::cpp_function(
      [function = kept(std::move(function))](const py::args& places, const py::kwargs& names) {
        return call(*function, function->name, py::none(), places, names);
      },
      py::name(name.c_str()), py::scope(module), doc.c_str());
}

void addMember(py::handle ofClass, Function function) {
  const OwnSignatures own;
  const std::string name = function.name;
  const std::string doc = docOf(function);
  const std::string path = py::cast<std::string>(ofClass.attr("__name__")) + "." + name;
  py::setattr(ofClass, name.c_str(),
              py::cpp_function(
                  [function = kept(std::move(function)), path, ofClass](
                      const py::object& self, const py::args& places, const py::kwargs& names) {
                    if (!py::isinstance(self, ofClass))
                      throw refusal(kWrongType, path, shown(self), "an object of the class");
                    return call(*function, path, self, places, names);
                  },
                  py::name(name.c_str()), py::is_method(ofClass), doc.c_str()));
}

}  // namespace gridbay::python
