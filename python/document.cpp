#include <fmt/format.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <array>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "basic/boundary.h"
#include "core/edition.h"
#include "core/kdl_writer.h"
#include "platform/files/paths.h"
#include "python/arguments.h"
#include "python/keyword_list.h"
#include "setup/dlg_enumerator.h"
#include "setup/member_keyword.h"
#include "setup/new_setup.h"
#include "setup/setup_file.h"
#include "setup/setup_path.h"

namespace gridbay::python {
namespace py = pybind11;

namespace {

constexpr const char* kAreas =
    "a grid file, and for a nested one (file, (J, K)) or (file, (J, K), number of an area before it)";

}  // namespace

template <>
struct Taken<NewArea> {
  static constexpr const char* kName = "str | tuple";
  static NewArea from(const Given& given) {
    if (!py::isinstance<py::tuple>(given.value)) return {fileGiven(given.value, given.path)};
    const std::vector<py::object> pieces = piecesOf(given.value, given.path, kAreas);
    if (pieces.empty() || pieces.size() > 3)
      throw refusal(kWrongValue, given.path, shown(given.value), kAreas);
    NewArea area{fileGiven(pieces[0], given.path)};
    if (pieces.size() > 1) {
      const auto [j, k] =
          Taken<std::array<int, 2>>::from({given.argument, given.self, pieces[1], given.path});
      area.origin = GridPoint{j, k};
    }
    if (pieces.size() > 2) area.enclosing = wholeOf(pieces[2], given.path);
    return area;
  }
  static std::string fileGiven(py::handle value, const std::string& path) {
    if (value.is_none()) throw refusal(kWrongType, path, shown(value), kAreas);
    return absolutePath(fileOf(value, path), {});  // the current folder may be another one later
  }
};

namespace {

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
    if (!opened) throw fileRefusal(path, opened.error(), kReadableSetup);
    document->setup_ = std::move(*opened);
    document->path_ = absolutePath(path, {});
    return document;
  }

  static std::unique_ptr<Document> withAreas(const std::vector<NewArea>& areas) {
    auto document = std::make_unique<Document>();
    const std::optional<AreaFault> fault = layAreas(document->setup_.model(), areas);
    if (!fault) return document;
    const std::string file = fault->area == 0 ? "" : areas[fault->area - 1].file;
    if (fault->isOfFile) throw fileRefusal(file, fault->text, kReadableGrid);
    throw refusal(
        kWrongValue, "new(areas)",
        fault->area == 0 ? fmt::format("{} areas", areas.size()) : fmt::format("area {}", fault->area),
        fmt::format("{}. {}", kAreas, fault->text));
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
    if (const Outcome saved = setup_.save(path); !saved)
      throw fileRefusal(path, saved.error(), kWritableFile);
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
    if (!found) throw wrongPath(path, found.error(), path);
    if ((*found)->isSection()) throw wrongPath(path, aSection(path), path, "a keyword in it");
    return objectOf(**found, false);
  }

  void set(const std::string& path, const py::object& given) {
    // To look at what is given runs the script, which may change the setup: the keyword is found anew then.
    ParameterTree keeper;
    if (isOption(path)) {
      KvsFile now;
      const Node& option = optionAt(path, given);
      kvsAddKeyword(now, option.name());
      for (const Value& value : option.values()) now.add(value.kind(), value.text());
      const std::vector<Value> values = valuesOf(given, *now.tree().root().first(), false, path, keeper);
      setup_.replaceSource(withValues(setup_.source(), &optionAt(path, given), values));
      return;
    }
    const MemberKeyword now = keywordAt(path, given);
    const std::vector<Value> values = valuesOf(given, now.node(), now.takesAnyNumber(), path, keeper);
    MemberKeyword keyword = keywordAt(path, given);
    if (keyword.set(values)) return;
    const std::string stays = shownValues(keyword.node());
    const std::string allowed = keyword.allowed(values);
    throw Refusal{
        kWrongValue,
        fmt::format("{} cannot be {} here: it stays {}; allowed is {}", path, shown(given), stays, allowed),
        path, shown(given), allowed};
  }

  // Whether a path leads to a section or keyword of the model; of a name that is both, `section` asks for the
  // section.
  bool has(const std::string& path, bool section) {
    const std::string name(withoutTarget(path));
    PathAccess look{.what = PathAccess::What::look, .onlySections = section};
    if (!setup_.model().AccessPath(name, look) || look.isSection != section) return false;
    if (!section || !sameName(stepOf(name).first, "BIO_RIG_MODULE")) return true;
    // A look there passes what a file of another model may have.
    const KvsHandle scratch = kvsCreate();
    PathAccess write{
        .what = PathAccess::What::write, .out = scratch.get(), .documentPath = &path_, .onlySections = true};
    return setup_.model().AccessPath(name, write);
  }

  // How many items a list has whose sections are `name` with {} for the number, which counts from 1.
  int count(const std::string& name) {
    const auto isThere = [&](int number) { return has(fmt::format(fmt::runtime(name), number), true); };
    int there = 0;
    int step = 1;
    while (isThere(there + step)) {
      there += step;
      step *= 2;
    }
    for (; step > 0; step /= 2) {
      if (isThere(there + step)) there += step;
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
    if (!text) throw fileRefusal(section, text.error(), "what a file can hold");
    return *text;
  }

  // Open boundaries as they follow from the first area's grid, and its projection.
  int detectBoundaries() {
    followFirstGrid(setup_.model());
    return setup_.model().boundary->GetCount();
  }

 private:
  const Node& optionAt(const std::string& path, const py::object& given) const {
    const Result<const Node*> option = findPath(setup_.source(), path);
    if (!option) throw wrongPath(path, option.error(), shown(given));
    if ((*option)->isSection()) throw wrongPath(path, aSection(path), shown(given), "a keyword in it");
    return **option;
  }
  MemberKeyword keywordAt(const std::string& path, const py::object& given) {
    Result<MemberKeyword> keyword = findKeyword(setup_.model(), path, path_);
    if (keyword) return std::move(*keyword);
    const KvsHandle tree = setup_.tree(path_);
    const Result<const Node*> found = findPath(*tree, path);
    if (found && (*found)->isSection())
      throw wrongPath(path, aSection(path), shown(given), "a keyword in it");
    throw wrongPath(path, found ? keyword.error() : found.error(), shown(given), "a keyword that can be set");
  }
  static std::string aSection(const std::string& path) { return fmt::format("\"{}\" is a section", path); }
  // The fault names the path; what was given is another thing where it is to be set.
  static Refusal wrongPath(const std::string& path, const std::string& fault, const std::string& given,
                           const std::string& allowed = "a keyword that the setup has") {
    const std::string gave = given == path ? "" : fmt::format(" ({} was given)", given);
    return {kPathError, fmt::format("{}{}; allowed is {}", fault, gave, allowed), path, given, allowed};
  }
  // The section of a path, though a keyword may have the same name.
  static const Node& sectionIn(const KvsFile& tree, const std::string& section) {
    const Result<const Node*> found = findPath(tree, section);
    constexpr const char* kAllowed = "a section that the setup has";
    if (!found) throw wrongPath(section, found.error(), section, kAllowed);
    if ((*found)->isSection()) return **found;
    const std::size_t slash = section.rfind('/');
    const Result<const Node*> parent = findPath(tree, slash == section.npos ? "" : section.substr(0, slash));
    const auto [name, number] = occurrenceOf(std::string_view(section).substr(slash + 1));
    const Node* own =
        parent ? (*parent)->section(name, static_cast<std::uint32_t>(std::max(number, 0))) : nullptr;
    if (own == nullptr)
      throw wrongPath(section, fmt::format("\"{}\" is a keyword, not a section", section), section, kAllowed);
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
  addFunction(
      module, "new",
      [](std::vector<NewArea> areas) { return py::object(py::cast(Document::withAreas(areas))); },
      {{"areas"}}, "A new setup with the defaults, over grids.");
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
