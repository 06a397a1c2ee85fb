#include "python/keyword_list.h"

#include <fmt/format.h>

#include <cctype>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <unordered_map>

#include "basic/module_selection.h"
#include "core/edition.h"
#include "core/file_name.h"
#include "core/nearest.h"
#include "core/number_text.h"
#include "ecology/model_definition.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "pages/no_host.h"
#include "setup/gridbay_doc.h"
#include "setup/member_keyword.h"
#include "setup/page_factory.h"
#include "setup/setup_path.h"

namespace gridbay::python {
namespace {

struct Keyword {
  std::string path;
  std::vector<std::pair<ValueKind, std::string>> values;
};

// The keywords of a tree with the sections that have any, in order.
struct Snapshot {
  std::vector<Keyword> keywords;
  std::set<std::string> sections;
};

void list(const Node& section, const std::string& prefix, Snapshot& snapshot) {
  std::unordered_map<std::string, int> seen;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    std::string name(node->name());
    if (!node->isSection()) {
      Keyword keyword{prefix + name, {}};
      for (const Value& value : node->values()) keyword.values.emplace_back(value.kind(), value.text());
      snapshot.keywords.push_back(std::move(keyword));
      continue;
    }
    if (const int occurrence = ++seen[lowered(name)]; occurrence > 1) name += fmt::format("[{}]", occurrence);
    snapshot.sections.insert(prefix + name);
    list(*node, prefix + name + "/", snapshot);
  }
}

Snapshot snapshotOf(CGlobalKvs& model) {
  const KvsHandle file = kvsCreate();
  model.Save(*file, {});
  Snapshot snapshot;
  const KvsSection target = kvsTargetByNameNum(*file, CGlobalKvs::kTarget, 1);
  if (target != nullptr) list(*target, {}, snapshot);
  return snapshot;
}

// A step of a path as the name of a list and the number of an item: "AREA_2", "weir_data[2]".
struct ItemStep {
  std::string list;  // with {} for the number
  int number = 0;
};
std::optional<ItemStep> itemOf(std::string_view step) {
  if (step.ends_with(']')) {
    const NamedOccurrence occurrence = occurrenceOf(step);
    return ItemStep{fmt::format("{}[{{}}]", occurrence.name), occurrence.number};
  }
  const std::size_t last = step.find_last_not_of("0123456789");
  if (last == step.npos || last + 1 == step.size() || step[last] != '_') return std::nullopt;
  const std::optional<std::int32_t> number = int32OfText(step.substr(last + 1));
  if (!number) return std::nullopt;
  return ItemStep{std::string(step.substr(0, last + 1)) + "{}", *number};
}

// Whether a path leads through no item but the first of each list.
bool isOfFirstItems(std::string_view path) {
  for (PathStep step = stepOf(path);; step = stepOf(step.rest)) {
    if (const auto item = itemOf(step.first); item && item->number > 1 && !step.isLast()) return false;
    if (step.isLast()) return true;
  }
}

std::string parentOf(const std::string& path) {
  const std::size_t slash = path.rfind('/');
  return slash == path.npos ? std::string() : path.substr(0, slash);
}
std::string nameOf(const std::string& path) {
  return path.substr(path.rfind('/') + 1);
}

bool looksLikeACount(const Keyword& keyword) {
  const std::string name = lowered(nameOf(keyword.path));
  return keyword.values.size() == 1 && keyword.values.front().first == ValueKind::integer &&
         (name.find("number") != name.npos || name.starts_with("no") || name.find("_no") != name.npos);
}

class Collector {
 public:
  // The lists of the ecological model follow a definition.
  KeywordList collect(const std::string& definition) {
    constexpr std::array kModules{module::kHydrodynamic, module::kAdvectionDispersion, module::kMudTransport,
                                  module::kMudTransportExpanded, module::kEcological};
    for (const std::int32_t code : kModules) {
      if (theEdition.wetlandSweepKit && code != module::kHydrodynamic) continue;
      document_ = std::make_unique<CGridbayDoc>(host_);
      root().moduleSelection->simulationType = code;
      take(snapshot());
      module_ = code;
      if (code == module::kEcological) {
        UFileName file;
        file = definition;
        root().wqsModelDefinition->Choose(file);
      }
      fill();
      // The task of a module, which is chosen by a keyword, decides which pages apply.
      for (const Keyword& keyword : snapshot().keywords) {
        if (!keyword.path.ends_with("_MODULE/TASK_SELECTION/" + nameOf(keyword.path)) ||
            keyword.values.size() != 1) {
          continue;
        }
        const bool isTrue = keyword.values.front().second == "true";
        if (keyword.values.front().first != ValueKind::boolean || !set(keyword.path, !isTrue)) continue;
        fill();
        set(keyword.path, isTrue);
      }
    }
    for (auto& [name, note] : lists_) list_.lists.push_back(std::move(note));
    return std::move(list_);
  }

 private:
  CGlobalKvs& root() { return document_->root(); }
  Snapshot snapshot() { return snapshotOf(root()); }

  bool set(const std::string& path, std::int32_t value) {
    return set(path, ValueKind::integer, numberText(std::int64_t{value}));
  }
  bool set(const std::string& path, bool value) {
    return set(path, ValueKind::boolean, value ? "true" : "false");
  }
  bool set(const std::string& path, ValueKind kind, const std::string& text) {
    Result<MemberKeyword> keyword = findKeyword(root(), path, {});
    ParameterTree keeper;
    return keyword && keyword->set({keeper.makeValue(kind, keeper.keep(text))});
  }

  // Keywords and lists that were not there yet.
  void take(const Snapshot& shot) {
    for (const Keyword& keyword : shot.keywords) {
      if (!isOfFirstItems(keyword.path) || isOption(keyword.path)) continue;
      if (const auto known = notes_.find(keyword.path); known != notes_.end()) {
        KeywordNote& held = list_.keywords[known->second];
        held.canBeSet = held.canBeSet || findKeyword(root(), keyword.path, {});
        continue;
      }
      notes_[keyword.path] = list_.keywords.size();
      KeywordNote note;
      note.path = keyword.path;
      note.values = keyword.values;
      const Result<MemberKeyword> member = findKeyword(root(), keyword.path, {});
      note.canBeSet = static_cast<bool>(member);
      note.takesAnyNumber = member && member->takesAnyNumber();
      list_.keywords.push_back(std::move(note));
    }
    for (const std::string& section : shot.sections) {
      const auto item = itemOf(nameOf(section));
      const std::string parent = parentOf(section);
      if (!item || !isOfFirstItems(parent + "/x")) continue;
      const std::string name = parent.empty() ? item->list : parent + "/" + item->list;
      lists_.try_emplace(name, ListNote{.name = name, .count = {}, .followed = {}});
    }
  }

  void fill() {
    grow();
    grow();
    // So that what is taken back later does not go behind this.
    document_->RecordEdit(PageId::none, "filled");
    take(snapshot());
    usePages();
  }

  // Each list gets one item at least, and it is seen which keyword makes another.
  void grow() {
    std::set<std::string> tried;
    for (bool grown = true; grown;) {
      grown = false;
      for (const Keyword& keyword : snapshot().keywords) {
        if (!looksLikeACount(keyword) || !isOfFirstItems(keyword.path) ||
            !tried.insert(keyword.path).second) {
          continue;
        }
        grown = true;
        const Snapshot before = snapshot();
        const std::int32_t now = int32OfText(keyword.values.front().second).value_or(0);
        if (now < 0 || now > 100 || !set(keyword.path, now + 2)) continue;
        const Snapshot after = snapshot();
        bool any = false;
        for (const std::string& section : after.sections) {
          const auto item = itemOf(nameOf(section));
          if (before.sections.contains(section) || !item || item->number < 2) continue;
          const std::string parent = parentOf(section);
          if (!isOfFirstItems(parent + "/x")) continue;
          any = true;
          const std::string name = parent.empty() ? item->list : parent + "/" + item->list;
          ListNote& note =
              lists_.try_emplace(name, ListNote{.name = name, .count = {}, .followed = {}}).first->second;
          (parent == parentOf(keyword.path) ? note.count : note.followed) = keyword.path;
        }
        take(after);
        set(keyword.path, any ? std::max(now, 1) : now);
      }
    }
  }

  // The pages that this module has brought up; what has no name yet is tried again.
  void usePages() {
    for (const PageEntry& entry : document_->enumerator().pages()) {
      const auto known = pageModules_.find(entry.id);
      if (entry.pageClass.empty() || (known != pageModules_.end() && known->second != module_)) continue;
      const std::unique_ptr<CV27SetupFormView> page = makePage(entry.pageClass, *document_);
      if (page == nullptr) continue;
      page_ = entry;
      // By places: what an edit does may make the list of controls anew.
      for (std::size_t i = 0; i < page->form().controls().size(); ++i) useControl(*page, i, true);
      for (std::size_t i = 0; i < page->form().controls().size(); ++i) useBehindChoices(*page, i);
    }
  }

  // What can only be edited while another choice is made.
  void useBehindChoices(CV27SetupFormView& page, std::size_t place) {
    std::deque<Control>& controls = page.form().controls();
    const Control& control = controls[place];
    if (!control.isIndexed() || control.absent) return;
    const int choices = control.kind == ControlKind::check ? 2 : static_cast<int>(control.choices.size());
    const int now = control.index;
    for (int choice = 0; choice < choices; ++choice) {
      if (choice == now) continue;
      const std::uint64_t state = document_->ModelState();
      controls[place].index = choice;
      page.form().act(controls[place]);
      for (std::size_t i = 0; document_->ModelState() != state && i < controls.size(); ++i)
        useControl(page, i, false);
      undoTo(state);
      page.SetData();
    }
  }
  void undoTo(std::uint64_t state) {
    while (document_->ModelState() != state && document_->UndoStep() != nullptr) document_->Undo();
  }

  // Makes an edit, sees what it has changed, and takes it back.
  template <class Edit>
  std::vector<const Keyword*> changedBy(const Edit& edit) {
    const std::uint64_t state = document_->ModelState();
    before_ = snapshot();
    edit();
    after_ = snapshot();
    take(after_);
    undoTo(state);
    std::unordered_map<std::string_view, const Keyword*> old;
    for (const Keyword& keyword : before_.keywords) old.emplace(keyword.path, &keyword);
    std::vector<const Keyword*> changed;
    for (const Keyword& keyword : after_.keywords) {
      const auto held = old.find(keyword.path);
      if (held != old.end() && held->second->values != keyword.values && isOfFirstItems(keyword.path))
        changed.push_back(&keyword);
    }
    return changed;
  }

  KeywordNote* noteOf(const std::vector<const Keyword*>& changed, const std::string& label) {
    // Where an edit has changed more than one thing it is not plain which of them it is named after.
    if (changed.size() != 1 || !notes_.contains(changed.front()->path)) return nullptr;
    pageModules_.emplace(page_.id, module_);
    linked_.insert(place_);
    KeywordNote& note = list_.keywords[notes_.at(changed.front()->path)];
    if (note.label.empty()) {
      note.label = label;
      note.page = page_.caption;
    }
    return note.label == label ? &note : nullptr;
  }

  static void addQuantity(KeywordNote* note, int itemCode) {
    const QunItem* quantity = qunFindItem(itemCode);
    if (note == nullptr || quantity == nullptr) return;
    note->quantity = quantity->name;
    note->unit = qunBaseUnit(itemCode)->symbol;
  }
  void addChoice(const std::vector<const Keyword*>& changed, const std::string& label,
                 const std::string& choice) {
    KeywordNote* note = noteOf(changed, label);
    if (note == nullptr || changed.front()->values.size() != 1) return;
    const std::pair<std::string, std::string> entry(changed.front()->values.front().second, choice);
    if (std::ranges::find(note->choices, entry) == note->choices.end()) note->choices.push_back(entry);
  }

  static std::string another(const std::string& text) {
    const std::optional<double> number = doubleOfText(text);
    return number ? numberText(*number + 1) : text + "1";
  }

  // `choices` says whether those are used, too, or only what is typed.
  void useControl(CV27SetupFormView& page, std::size_t place, bool choices) {
    Control& control = page.form().controls()[place];
    if (control.grid != nullptr) {
      useGrid(*control.grid, place, choices);
      return;
    }
    place_ = fmt::format("{}/{}", page_.id, place);
    if (control.absent || control.readOnly || linked_.contains(place_)) return;
    const std::string label = control.name();
    Form& form = page.form();
    if (control.kind == ControlKind::text) {
      const auto changed = changedBy([&] {
        control.text = another(control.text);
        form.act(control);
      });
      addQuantity(noteOf(changed, label), control.itemCode);
      page.SetData();
      return;
    }
    if (!control.isIndexed() || !choices) return;
    const int count = control.kind == ControlKind::check ? 2 : static_cast<int>(control.choices.size());
    const int now = control.index;
    for (int choice = 0; choice < count; ++choice) {
      if (choice == now) continue;
      const std::vector<std::string> names = control.choices;
      const auto changed = changedBy([&] {
        control.index = choice;
        form.act(control);
      });
      if (control.kind == ControlKind::check) {
        noteOf(changed, label);
      } else {
        addChoice(changed, label, names[static_cast<std::size_t>(choice)]);
        addNow(changed, label, now < 0 || now >= count ? "" : names[static_cast<std::size_t>(now)]);
      }
      page.SetData();
    }
  }
  // The choice that stood before.
  void addNow(const std::vector<const Keyword*>& changed, const std::string& label,
              const std::string& choice) {
    if (changed.size() != 1 || choice.empty()) return;
    for (const Keyword& keyword : before_.keywords) {
      if (keyword.path == changed.front()->path) {
        const std::vector<const Keyword*> held{&keyword};
        addChoice(held, label, choice);
      }
    }
  }

  void useGrid(CV27SetupGridWnd& grid, std::size_t place, bool choices) {
    constexpr int kMostRows = 12;
    for (int row = 1; row <= std::min(grid.GetRowCount(), kMostRows); ++row) {
      for (int col = 1; col <= grid.GetColCount(); ++col) {
        CellStyle style;
        place_ = fmt::format("{}/{}/{}/{}", page_.id, place, row, col);
        if (linked_.contains(place_) || grid.GetStyleRowCol(row, col, style) != 1 || !style.editable())
          continue;
        std::string label = grid.GetColHeader(col);
        if (label.empty()) label = grid.GetRowHeader(row);
        if (style.kind == CellKind::dropDown) {
          if (!choices) continue;
          for (const std::string& choice : style.choices) {
            const auto changed = changedBy([&] { grid.StoreStyleRowCol(row, col, choice); });
            addChoice(changed, label, choice);
            addNow(changed, label, style.value);
          }
          continue;
        }
        const std::string text = style.kind == CellKind::checkBox ? (style.value == "1" ? "0" : "1")
                                 : style.value.starts_with('(')   ? "(5,6)"
                                                                  : another(style.value);
        KeywordNote* note = noteOf(changedBy([&] { grid.StoreStyleRowCol(row, col, text); }), label);
        // The tool tip of a number is "Water level [m]", of the unit that is shown.
        const std::size_t bracket = style.toolTip.rfind(" [");
        if (note == nullptr || bracket == style.toolTip.npos || !style.toolTip.ends_with(']')) continue;
        for (const QunItem& quantity : qunItems()) {
          if (quantity.name == std::string_view(style.toolTip).substr(0, bracket))
            addQuantity(note, quantity.code);
        }
      }
    }
  }

  NoHost host_{true};
  std::unique_ptr<CGridbayDoc> document_;
  KeywordList list_;
  std::unordered_map<std::string, std::size_t> notes_;
  std::map<std::string, ListNote> lists_;
  std::int32_t module_ = 0;
  std::map<std::int32_t, std::int32_t> pageModules_;  // the module that a page was first used with
  PageEntry page_{};
  std::string place_;             // of the control or cell that is used
  std::set<std::string> linked_;  // places whose keywords have been found
  Snapshot before_;
  Snapshot after_;
};

}  // namespace

KeywordList collectKeywords(const std::string& definition) {
  return Collector().collect(definition);
}

}  // namespace gridbay::python
