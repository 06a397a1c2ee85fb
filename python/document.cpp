#include <fmt/format.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "core/edition.h"
#include "core/kdl_writer.h"
#include "platform/files/paths.h"
#include "python/arguments.h"
#include "python/keyword_list.h"
#include "setup/dlg_enumerator.h"
#include "setup/member_keyword.h"
#include "setup/setup_file.h"
#include "setup/setup_path.h"

namespace gridbay::python {
namespace py = pybind11;

namespace {

// The highest number that an item of a list can have.
constexpr int kMostItems = 65535;

// The paths of all keywords below a section, in order; of several sections of a name the n-th is "name[n]".
void listKeywords(const Node& section, const std::string& prefix, std::vector<std::string>& paths) {
  std::unordered_map<const Node*, int> seen;  // by the first section of a name
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    std::string path = prefix + std::string(node->name());
    if (!node->isSection()) {
      paths.push_back(std::move(path));
      continue;
    }
    const int occurrence = ++seen[section.section(node->name())];
    if (occurrence > 1) path += fmt::format("[{}]", occurrence);
    listKeywords(*node, path + "/", paths);
  }
}

py::list listOf(const std::vector<std::string>& texts) {
  py::list list;
  for (const std::string& text : texts) list.append(textObject(text));
  return list;
}

// A setup, open for scripts.
class Document {
 public:
  Document() : setup_(&said_) {}
  Document(const Document&) = delete;
  Document& operator=(const Document&) = delete;

  static std::unique_ptr<Document> open(const std::string& path) {
    auto document = std::make_unique<Document>();
    Result<SetupFile> opened = SetupFile::open(path, &document->said_);
    if (!opened) throw Refusal{kFileError, opened.error(), path};
    document->setup_ = std::move(*opened);
    document->path_ = absolutePath(path, {});
    return document;
  }

  std::unique_ptr<Document> copy() {
    auto other = std::make_unique<Document>();
    other->setup_.model().AssignState(setup_.model());
    other->setup_.replaceSource(withValues(setup_.source(), nullptr, {}));
    other->path_ = path_;
    other->said_.texts = said_.texts;
    return other;
  }

  const std::string& path() const { return path_; }
  const std::vector<std::string>& said() const { return said_.texts; }
  std::vector<std::string> unknownSections() { return setup_.unknownSections(); }
  bool isSame(Document& other) { return setup_.model().SameState(other.setup_.model()); }

  void save(const std::string& path) {
    if (const Outcome saved = setup_.save(path); !saved) throw Refusal{kFileError, saved.error(), path};
    path_ = absolutePath(path, {});
  }

  // Page, its caption, severity and text of each message.
  py::list validate() {
    ValidationList messages;
    setup_.model().Validate(messages, 1);
    const CDlgEnumerator pages;
    py::list list;
    for (const CMessage& message : messages) {
      const int page = static_cast<int>(message.page);
      list.append(tupleOf(page, pages.GetCaption(page), static_cast<int>(message.severity), message.text));
    }
    return list;
  }

  py::object get(const std::string& path) {
    if (const Result<MemberKeyword> keyword = findKeyword(setup_.model(), path, path_))
      return objectOf(keyword->node(), keyword->takesAnyNumber());
    const KvsHandle tree = isOption(path) ? nullptr : setup_.tree(path_);
    const Result<const Node*> found = findPath(tree == nullptr ? setup_.source() : *tree, path);
    if (!found) throw Refusal{kPathError, found.error(), path};
    if ((*found)->isSection())
      throw Refusal{kPathError, fmt::format("\"{}\" is a section; name a keyword in it", path), path};
    return objectOf(**found, false);
  }

  void set(const std::string& path, const py::object& given) {
    ParameterTree keeper;
    if (isOption(path)) {
      const Result<const Node*> keyword = findPath(setup_.source(), path);
      if (!keyword) throw Refusal{kPathError, keyword.error(), path, shown(given)};
      if ((*keyword)->isSection()) throw aSection(path, given);
      const std::vector<Value> values = valuesOf(given, **keyword, false, path, keeper);
      setup_.replaceSource(withValues(setup_.source(), *keyword, values));
      return;
    }
    Result<MemberKeyword> keyword = findKeyword(setup_.model(), path, path_);
    if (!keyword) {
      const KvsHandle tree = setup_.tree(path_);
      const Result<const Node*> found = findPath(*tree, path);
      if (found && (*found)->isSection()) throw aSection(path, given);
      throw Refusal{kPathError,
                    fmt::format("{} ({} was given)", found ? keyword.error() : found.error(), shown(given)),
                    path, shown(given)};
    }
    const std::vector<Value> values =
        valuesOf(given, keyword->node(), keyword->takesAnyNumber(), path, keeper);
    if (keyword->set(values)) return;
    const std::string stays = shownValues(keyword->node());
    const std::string allowed = keyword->allowed(values);
    throw Refusal{
        kWrongValue,
        fmt::format("{} cannot be {} here: it stays {}; allowed is {}", path, shown(given), stays, allowed),
        path, shown(given), allowed};
  }

  // Whether a path leads to a section or keyword of the model; of a name that is both, `section` asks for the
  // section.
  bool has(const std::string& path, bool section) {
    PathAccess look{.what = PathAccess::What::look, .onlySections = section};
    return setup_.model().AccessPath(withoutTarget(path), look) && look.isSection == section;
  }

  // How many items a list has whose sections are `name` with {} for the number, which counts from 1.
  int count(const std::string& name) {
    const auto isThere = [&](int number) { return has(fmt::format(fmt::runtime(name), number), true); };
    int there = 0;
    int step = 1;
    while (there + step <= kMostItems && isThere(there + step)) {
      there += step;
      step *= 2;
    }
    for (; step > 0; step /= 2) {
      if (there + step <= kMostItems && isThere(there + step)) there += step;
    }
    return there;
  }

  // The paths of all keywords in a section, or in all of the setup.
  std::vector<std::string> paths(const std::string& section) {
    const KvsHandle tree = setup_.tree(path_);
    std::vector<std::string> paths;
    listKeywords(sectionIn(*tree, section), section.empty() ? "" : section + "/", paths);
    return paths;
  }

  std::string text(const std::string& section) {
    const KvsHandle tree = setup_.tree(path_);
    const Result<std::string> text = section.empty() ? tree->text() : kdlText(sectionIn(*tree, section));
    if (!text) throw Refusal{kFileError, text.error(), section};
    return *text;
  }

  // Open boundaries as they follow from the first area's grid, and its projection.
  int detectBoundaries() {
    CGlobalKvs& model = setup_.model();
    std::string projection;
    int coriolis = 0;
    model.bathymetry->GetProjection(&projection, &coriolis);
    model.boundary->RecalculateBoundaries();
    return model.boundary->GetCount();
  }

 private:
  static Refusal aSection(const std::string& path, const py::object& given) {
    return {kPathError,
            fmt::format("\"{}\" is a section; name a keyword in it ({} was given)", path, shown(given)), path,
            shown(given)};
  }
  // The section of a path, though a keyword may have the same name.
  static const Node& sectionIn(const KvsFile& tree, const std::string& section) {
    const Result<const Node*> found = findPath(tree, section);
    if (!found) throw Refusal{kPathError, found.error(), section};
    if ((*found)->isSection()) return **found;
    const std::size_t slash = section.rfind('/');
    const Result<const Node*> parent = findPath(tree, slash == section.npos ? "" : section.substr(0, slash));
    const auto [name, number] = occurrenceOf(std::string_view(section).substr(slash + 1));
    const Node* own =
        parent ? (*parent)->section(name, static_cast<std::uint32_t>(std::max(number, 0))) : nullptr;
    if (own == nullptr)
      throw Refusal{kPathError, fmt::format("\"{}\" is a keyword, not a section", section), section};
    return *own;
  }

  CollectingMessageHost said_;
  SetupFile setup_;
  std::string path_;
};

}  // namespace

void addDocument(py::module_& module) {
  const Argument file{.name = "path", .form = Argument::Form::file};
  py::class_<Document> document(module, "Document", py::module_local(),
                                "A setup, by the paths of its keywords.");
  document.def(py::init<>(), "A new setup with the defaults.")
      .def("copy", &Document::copy, "Another setup in the same exact state.")
      .def_property_readonly(
          "path", [](const Document& setup) { return textObject(setup.path()); },
          "The file; empty until there is one.")
      .def_property_readonly(
          "said", [](const Document& setup) { return listOf(setup.said()); }, "What the load had to say.")
      .def("unknown_sections", &Document::unknownSections, "Sections of the file that a save leaves out.")
      .def("is_same", &Document::isSame, py::arg("other"), "Whether the models are in the same exact state.")
      .def("validate", &Document::validate, "Page, caption, severity and text of each message.")
      .def("get", &Document::get, py::arg("path"), "The value of a keyword.")
      .def("set", &Document::set, py::arg("path"), py::arg("value"), "Gives a keyword another value.")
      .def("has", &Document::has, py::arg("path"), py::arg("section"),
           "Whether there is a section, or else a keyword, of the path.")
      .def("count", &Document::count, py::arg("name"),
           "How many items a list has, by the path of its sections with {} for the number.")
      .def("paths", &Document::paths, py::arg("section") = "", "The paths of all keywords, in order.")
      .def(
          "text", [](Document& setup, const std::string& section) { return textObject(setup.text(section)); },
          py::arg("section") = "", "What a save would write.")
      .def("detect_boundaries", &Document::detectBoundaries,
           "Finds the open boundaries on the border of the first area; how many.");
  Members<Document>(document).add("save", &Document::save, {file}, "Writes the setup, whole or not at all.");
  addFunction(
      module, "open", [](std::string path) { return py::object(py::cast(Document::open(path))); }, {file},
      "Reads a setup.");
}

// Tuples, as little more than the making of the package reads them.
void addKeywordList(py::module_& module) {
  module.def(
      "keyword_list",
      [](const std::string& definition) {
        const KeywordList list = collectKeywords(definition);
        const auto kindOf = [](ValueKind kind) { return static_cast<int>(kind); };
        py::list keywords;
        for (const KeywordNote& note : list.keywords) {
          py::list values;
          for (const auto& [kind, text] : note.values) values.append(py::make_tuple(kindOf(kind), text));
          py::list parts;
          for (const ValueNote& part : note.parts)
            parts.append(py::make_tuple(part.label, part.quantity, part.unit, part.choices));
          keywords.append(
              py::make_tuple(note.path, values, note.takesAnyNumber, note.canBeSet, note.page, parts));
        }
        py::list lists;
        for (const ListNote& note : list.lists)
          lists.append(py::make_tuple(note.name, note.count, note.followed));
        return py::make_tuple(keywords, lists);
      },
      "All keywords and lists, with what the pages call them; takes some seconds.");
}

}  // namespace gridbay::python
