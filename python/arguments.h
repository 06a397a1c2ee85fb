#pragma once

#include <fmt/format.h>
#include <pybind11/pybind11.h>

#include <array>
#include <functional>
#include <optional>
#include <span>
#include <string>
#include <tuple>
#include <vector>

#include "python/refusal.h"
#include "python/values.h"

// Functions and members for scripts as rows of tables: what is given for each argument is looked at before
// anything is done, and refused with the function, the argument, what was given and what is allowed.

namespace gridbay::python {

// An argument of a function, which is given by its place or its name.
struct Argument {
  enum class Form {
    plain,
    file,
    flag
  };  // a text that names a file; a whole number that may be True or False

  std::string name;
  Form form = Form::plain;
  // The ends of what a whole number may be; the highest may depend on the object that the member is called
  // on.
  std::optional<int> least = {};
  std::function<int(pybind11::handle self)> most = {};
  std::string_view kind = kRangeError;  // of the refusal of a number that lies outside
  std::optional<int> fallback = {};     // where none is given
};

// What is given for an argument.
struct Given {
  const Argument& argument;
  pybind11::handle self;
  pybind11::handle value;
  std::string path;  // "function(argument)"
};

// Throws a Refusal for a whole number beyond the ends.
void checkEnds(const Given& given, int number);

// How a type is taken from Python, and what help calls it.
template <class T>
struct Taken;
template <>
struct Taken<bool> {
  static constexpr const char* kName = "bool";
  static bool from(const Given& given) { return boolOf(given.value, given.path); }
};
template <>
struct Taken<int> {
  static constexpr const char* kName = "int";
  static int from(const Given& given);
};
// Within single precision, in which the model has its numbers.
template <>
struct Taken<double> {
  static constexpr const char* kName = "float";
  static double from(const Given& given);
};
template <>
struct Taken<float> : Taken<double> {
  static float from(const Given& given) { return static_cast<float>(Taken<double>::from(given)); }
};
template <>
struct Taken<std::string> {
  static constexpr const char* kName = "str";
  static std::string from(const Given& given);
};
template <class T>
struct Taken<std::optional<T>> {
  static constexpr const char* kName = Taken<T>::kName;
  static std::optional<T> from(const Given& given) {
    if (given.value.is_none()) return {};
    return Taken<T>::from(given);
  }
};
template <class T>
struct Taken<std::vector<T>> {
  static constexpr const char* kName = "list";
  static std::vector<T> from(const Given& given) {
    std::vector<T> all;
    for (const pybind11::object& piece : piecesOf(given.value, given.path, "a list"))
      all.push_back(Taken<T>::from({given.argument, given.self, piece, given.path}));
    return all;
  }
};
template <class T, std::size_t N>
struct Taken<std::array<T, N>> {
  static constexpr const char* kName = "tuple";
  static std::array<T, N> from(const Given& given) {
    const std::string allowed = fmt::format("{} values, as a tuple", N);
    const std::vector<T> pieces = Taken<std::vector<T>>::from(given);
    if (pieces.size() != N) throw refusal(kWrongValue, given.path, shown(given.value), allowed);
    std::array<T, N> all;
    std::ranges::copy(pieces, all.begin());
    return all;
  }
};

// What functions give, as objects; a text of any bytes.
template <class T>
pybind11::object given(const T& value) {
  if constexpr (std::is_same_v<T, std::string>) {
    return textObject(value);
  } else if constexpr (std::is_base_of_v<pybind11::object, T>) {
    return value;
  } else {
    return pybind11::cast(value);
  }
}
template <class... Values>
pybind11::tuple tupleOf(const Values&... values) {
  return pybind11::make_tuple(given(values)...);
}

// A function of a module, or a member of a class, for scripts.
struct Function {
  using Body = std::function<pybind11::object(pybind11::handle self, std::span<const Given> arguments)>;

  std::string name;
  std::vector<Argument> arguments;
  std::vector<const char*> types;
  std::string doc;
  // What is allowed where the body finds that what was given can't be, by std::invalid_argument.
  const char* allowed = "";
  Body body;
};
void addFunction(pybind11::module_& module, Function function);
void addMember(pybind11::handle ofClass, Function function);

// What is given for each argument, the first ones first.
template <class... Args, std::size_t... At>
std::tuple<Args...> takenFrom([[maybe_unused]] std::span<const Given> all, std::index_sequence<At...>) {
  return {Taken<Args>::from(all[At])...};
}

// The work of a function as one of objects: `work` takes the object that it is called on, and the arguments.
template <class Result, class... Args>
Function functionOf(const char* name, std::vector<Argument> arguments, const char* doc, const char* allowed,
                    auto work) {
  auto body = [work = std::move(work)](pybind11::handle self, std::span<const Given> all) {
    auto taken = takenFrom<std::decay_t<Args>...>(all, std::index_sequence_for<Args...>());
    const auto call = [&](auto&... values) -> Result { return work(self, std::move(values)...); };
    if constexpr (std::is_void_v<Result>) {
      std::apply(call, taken);
      return pybind11::object(pybind11::none());
    } else {
      return pybind11::object(given(std::apply(call, taken)));
    }
  };
  return {name, std::move(arguments), {Taken<std::decay_t<Args>>::kName...}, doc, allowed, std::move(body)};
}

template <class Work, class Result, class... Args>
void addFunction(pybind11::module_& module, const char* name, Work work, std::vector<Argument> arguments,
                 const char* doc, Result (Work::*)(Args...) const) {
  addFunction(module,
              functionOf<Result, Args...>(name, std::move(arguments), doc, "",
                                          [work = std::move(work)](pybind11::handle, auto&&... values) {
                                            return work(std::move(values)...);
                                          }));
}
template <class Work>
void addFunction(pybind11::module_& module, const char* name, Work work, std::vector<Argument> arguments,
                 const char* doc) {
  addFunction(module, name, std::move(work), std::move(arguments), doc, &Work::operator());
}

// The members of a class.
template <class Model>
class Members {
 public:
  explicit Members(pybind11::class_<Model> ofClass) : class_(std::move(ofClass)) {}

  template <class Result, class Class, class... Args>
  Members& add(const char* name, Result (Class::*member)(Args...), std::vector<Argument> arguments = {},
               const char* doc = "", const char* allowed = "") {
    return addAs<Result, Args...>(
        name, std::move(arguments), doc, allowed,
        [member](Model& model, auto&&... values) { return (model.*member)(std::move(values)...); });
  }
  // A function of the object and the arguments.
  template <class Work>
  Members& add(const char* name, Work work, std::vector<Argument> arguments = {}, const char* doc = "",
               const char* allowed = "") {
    return addWork(name, std::move(work), std::move(arguments), doc, allowed, &Work::operator());
  }

 private:
  template <class Work, class Result, class... Args>
  Members& addWork(const char* name, Work work, std::vector<Argument> arguments, const char* doc,
                   const char* allowed, Result (Work::*)(Model&, Args...) const) {
    return addAs<Result, Args...>(name, std::move(arguments), doc, allowed, std::move(work));
  }
  template <class Result, class... Args>
  Members& addAs(const char* name, std::vector<Argument> arguments, const char* doc, const char* allowed,
                 auto work) {
    addMember(class_,
              functionOf<Result, Args...>(name, std::move(arguments), doc, allowed,
                                          [work = std::move(work)](pybind11::handle self, auto&&... values) {
                                            return work(pybind11::cast<Model&>(self), std::move(values)...);
                                          }));
    return *this;
  }

  pybind11::class_<Model> class_;
};

}  // namespace gridbay::python
