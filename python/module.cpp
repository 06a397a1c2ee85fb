#include <fmt/format.h>
#include <pybind11/pybind11.h>

#include "core/edition.h"
#include "python/refusal.h"
#include "python/values.h"

namespace gridbay::python {
namespace py = pybind11;

Refusal refusal(std::string_view kind, const std::string& path, const std::string& given,
                const std::string& allowed) {
  return {kind, fmt::format("{}: {} was given; allowed is {}", path, given, allowed), path, given, allowed};
}

Refusal fileRefusal(const std::string& path, const std::string& fault, std::string_view allowed) {
  return {kFileError, fmt::format("{}; allowed is {}", fault, allowed), path, "\"" + path + "\"",
          std::string(allowed)};
}

std::string shown(py::handle value) {
  constexpr std::size_t kMost = 200;
  std::string text;
  try {
    text = py::cast<std::string>(py::repr(value).attr("encode")("utf-8", "backslashreplace"));
  } catch (const py::error_already_set&) {
    text = "a value that cannot be shown";
  }
  if (text.size() > kMost) text = text.substr(0, text.find_last_not_of("\x80\xBF", kMost)) + "...";
  return fmt::format("{} ({})", text, Py_TYPE(value.ptr())->tp_name);
}

namespace {

void raise(const Refusal& refused) {
  const py::object kind = py::module_::import("gridbay_setup.errors").attr(std::string(refused.kind).c_str());
  const py::object error = kind(textObject(refused.text), textObject(refused.path), textObject(refused.given),
                                textObject(refused.allowed));
  PyErr_SetObject(kind.ptr(), error.ptr());
}

void fill(py::module_& module) {
  py::register_local_exception_translator([](std::exception_ptr thrown) {
    try {
      if (thrown) std::rethrow_exception(thrown);
    } catch (const Refusal& refused) {
      raise(refused);
    }
  });
  module.doc() = "The setups of one edition.";
  module.attr("FILE_KIND") = std::string(theEdition.fileKind);
  module.attr("EDITION") = std::string(theEdition.editorName.format);
  addDocument(module);
  addConversions(module);
  addDataFiles(module);
  addFloodModels(module);
  addClimateChange(module);
  addKeywordList(module);
}

}  // namespace
}  // namespace gridbay::python

// The one source serves both modules: each is linked with its own edition.
PYBIND11_MODULE(_flow_model, module) {
  gridbay::python::fill(module);
}
PYBIND11_MODULE(_wetland_sweep_kit, module) {
  gridbay::python::fill(module);
}
