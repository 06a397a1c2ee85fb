#pragma once

#include <pybind11/functional.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include "core/date_time.h"
#include "gridbay_setup/types.h"
#include "python/arguments.h"
#include "scripting/scripted_model.h"

// What the scripting classes take and give in Python, and how their members become those of a class there.

namespace pybind11::detail {

// A moment is a datetime, and None where there is none.
template <>
struct type_caster<gridbay::scripting::DateTime> {
  PYBIND11_TYPE_CASTER(gridbay::scripting::DateTime, const_name("datetime.datetime | None"));

  static handle cast(const gridbay::scripting::DateTime& moment, return_value_policy, handle) {
    const auto parts = gridbay::DateTime{moment.day, moment.status}.parts();
    if (!parts) return none().release();
    const auto& [year, month, day, hour, minute, second] = *parts;
    return module_::import("datetime").attr("datetime")(year, month, day, hour, minute, second).release();
  }
};

}  // namespace pybind11::detail

namespace gridbay::python {

template <>
struct Taken<scripting::DateTime> {
  static constexpr const char* kName = "datetime.datetime | None";
  static scripting::DateTime from(const Given& given) {
    if (given.value.is_none()) return {0, 1};
    const auto [year, month, day, hour, minute, second] = momentOf(given.value, given.path);
    const gridbay::DateTime moment = gridbay::DateTime::of({year, month, day, hour, minute, second});
    return {moment.day, moment.status};
  }
};
template <>
struct Taken<scripting::OutputPosition> {
  static constexpr const char* kName = "OutputPosition";
  static scripting::OutputPosition from(const Given& given) {
    if (!pybind11::isinstance<scripting::OutputPosition>(given.value))
      throw refusal(kWrongType, given.path, shown(given.value), "an OutputPosition");
    const auto position = pybind11::cast<scripting::OutputPosition>(given.value);
    checkEnds(given, position.number);
    return position;
  }
};
template <>
struct Taken<scripting::MessageBox> {
  static constexpr const char* kName = "Callable[[str], None] | None";
  static scripting::MessageBox from(const Given& given) {
    if (given.value.is_none()) return {};
    if (PyCallable_Check(given.value.ptr()) == 0)
      throw refusal(kWrongType, given.path, shown(given.value), "a function of a text, or None");
    return pybind11::cast<scripting::MessageBox>(given.value);
  }
};

inline constexpr const char* kTexts =
    "What validation and faults of a load have to say goes to this function; None is standard error again.";
inline constexpr const char* kThreads =
    "\n\nObjects in different threads work side by side. Members that are called on one object from several "
    "threads run one after the other, each as a whole; while a message is shown others may go on.";

// A class whose objects are made of nothing.
template <class Model>
pybind11::class_<Model> scriptingClass(pybind11::module_& module, const char* name, const std::string& doc) {
  return pybind11::class_<Model>(module, name, pybind11::module_local(), (doc + kThreads).c_str())
      .def(pybind11::init(
          [path = std::string(name)](const pybind11::args& given, const pybind11::kwargs& named) {
            if (!given.empty() || !named.empty())
              throw refusal(kWrongType, path, given.empty() ? shown(named) : shown(given), "no argument");
            return Model();
          }));
}

// The model behind an object of a class.
template <class Model>
ScriptedModel& modelOf(Model& object) {
  struct Reach : Model {
    static auto member() { return &Reach::model_; }
  };
  return *(object.*Reach::member());
}

// Arguments of several members.
inline Argument fileName() {
  return {.name = "file_name", .form = Argument::Form::file};
}
inline Argument flag(const char* name) {
  return {.name = name, .form = Argument::Form::flag};
}
// The number of an item of a data file.
inline Argument item(const char* name = "item") {
  return {.name = name, .least = 1};
}
// The number of a thing in a list, and how many there are.
template <class Model, class Count>
Argument indexIn(Count count) {
  return {.name = "index", .least = 1, .most = [count](pybind11::handle self) {
            return std::invoke(count, pybind11::cast<Model&>(self));
          }};
}

// A file that is to be read must be there, whatever else the class passes over.
template <class Model>
void load(Model& object, const std::string& file) {
  ScriptedModel& model = modelOf(object);
  const auto guard = model.lock();
  const ScriptedModel::Loaded loaded = model.load(file);
  if (!loaded.fault.empty()) throw fileRefusal(file, loaded.fault, kReadableSetup);
}

inline void refuseUnwritten(const Outcome& written, const std::string& file) {
  if (!written) throw fileRefusal(file, written.error(), kWritableFile);
}

// What an output is as a call begins: 0, nothing, or no moment.
template <class T>
T notGiven() {
  if constexpr (std::is_same_v<T, scripting::DateTime>) {
    return {0, 1};
  } else {
    return T{};
  }
}

// What a member gives as a tuple: its result, if any, and behind it the outputs that it takes by reference,
// in their order.
template <class... Outputs>
pybind11::tuple outputsOf(auto&& call) {
  std::tuple<Outputs...> outputs{notGiven<Outputs>()...};
  const auto all = [](const auto&... values) { return tupleOf(values...); };
  if constexpr (std::is_void_v<std::invoke_result_t<decltype(call), Outputs&...>>) {
    std::apply(call, outputs);
    return std::apply(all, outputs);
  } else {
    const auto result = std::apply(call, outputs);
    return tupleOf(result) + std::apply(all, outputs);
  }
}

// Members with outputs as functions of the object and what they take beside them.
template <class Model, class Class, class Result, class... Outputs>
auto reader(Result (Class::*member)(Outputs&...)) {
  return [member](Model& model) {
    return outputsOf<Outputs...>([&](Outputs&... outputs) { return (model.*member)(outputs...); });
  };
}
template <class Model, class Class, class Result, class... Outputs>
auto reader(Result (Class::*member)(int, Outputs&...)) {
  return [member](Model& model, int index) {
    return outputsOf<Outputs...>([&](Outputs&... outputs) { return (model.*member)(index, outputs...); });
  };
}

}  // namespace gridbay::python
