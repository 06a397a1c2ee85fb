#include "python/keyword_list.h"

#include <fmt/format.h>

#include <algorithm>
#include <cctype>
#include <cmath>
#include <map>
#include <memory>
#include <optional>
#include <regex>
#include <set>
#include <unordered_map>
#include <unordered_set>

#include "basic/module_selection.h"
#include "core/edition.h"
#include "core/file_name.h"
#include "core/nearest.h"
#include "core/number_text.h"
#include "ecology/model_definition.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "python/model_snapshot.h"
#include "python/page_fields.h"
#include "setup/gridbay_doc.h"
#include "setup/member_keyword.h"
#include "setup/page_factory.h"
#include "setup/setup_path.h"

namespace gridbay::python {
namespace {

// A value that an edit has changed. Where the values are others in number it is the first that stands for
// all.
struct Change {
  std::size_t note;  // of its keyword
  std::size_t value;
  ValueKind kind;
  std::string before;
  std::string after;
  bool ofFurtherItem = false;  // not in the first item of each list, which stands for all
};

// How surely a label is that of a value: it was one of several that changed with a choice; one of several
// numbers in the text that was typed; in a dialog or on the page the one that was meant.
enum class Sureness { none, together, amongNumbers, inDialog, onPage };

// A form that can be had to be used: that of a page, or of a dialog, which opens for as long as that takes.
struct Surface {
  std::string name;
  std::string title;  // of a dialog
  std::function<void(const std::function<void(Form&)>& use)> with;
};

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
      if (code == module::kEcological) {
        UFileName file;
        file = definition;
        root().wqsModelDefinition->Choose(file);
      }
      fill(1, 1);
      // What is chosen on one page decides what another one shows: each choice is made, all at once.
      for (std::size_t turn = 0; turn < kTurns; ++turn) {
        // Twice, as one may bring up another.
        chooseAll(turn);
        chooseAll(turn);
        const bool isLast = turn + 1 == kTurns;
        fill(isLast ? 2 : 1, isLast || turn == 0 ? 1 : 0);
      }
    }
    fillNumbered();
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
      if (!seen_.insert(keyword.path).second || !isOfFirstItems(keyword.path) || isOption(keyword.path))
        continue;
      notes_[keyword.path] = list_.keywords.size();
      KeywordNote note;
      note.path = keyword.path;
      note.values = keyword.values;
      const Result<MemberKeyword> member = findKeyword(root(), keyword.path, {});
      note.canBeSet = static_cast<bool>(member);
      note.takesAnyNumber = member && member->takesAnyNumber();
      note.parts.resize(note.takesAnyNumber ? 1 : std::max<std::size_t>(note.values.size(), 1));
      list_.keywords.push_back(std::move(note));
    }
    for (const std::string& section : shot.sections) {
      if (!seen_.insert(section + "/").second) continue;
      const auto item = itemOf(nameOf(section));
      const std::string parent = parentOf(section);
      if (!item || !isOfFirstItems(parent + "/x")) continue;
      const std::string name = parent.empty() ? item->list : parent + "/" + item->list;
      lists_.try_emplace(name, ListNote{.name = name, .count = {}, .followed = {}});
    }
  }

  // What follows from other values for one module or task may be set for another.
  void takeWhatCanBeSet() {
    for (KeywordNote& note : list_.keywords)
      note.canBeSet = note.canBeSet || findKeyword(root(), note.path, {});
  }

  // All flags on, off, and every other one of them; and of each choice another one.
  void chooseAll(std::size_t turn) {
    std::size_t flags = 0;
    for (const Keyword& keyword : snapshot().keywords) {
      const auto known = notes_.find(keyword.path);
      if (known == notes_.end() || !list_.keywords[known->second].canBeSet || keyword.values.size() != 1 ||
          keyword.path.starts_with(kModuleSelection))
        continue;
      const auto& choices = list_.keywords[known->second].parts.front().choices;
      if (!choices.empty()) {
        set(keyword.path, keyword.values.front().first, choices[(turn + 1) % choices.size()].first);
      } else if (keyword.values.front().first == ValueKind::boolean) {
        set(keyword.path, turn < 2 ? turn == 0 : flags++ % 2 == turn % 2);
      }
    }
  }

  void fill(int items, int depth) {
    grow(items);
    grow(items);
    // So that what is taken back later does not go behind this.
    document_->RecordEdit(PageId::none, "filled");
    stateBefore_.reset();
    tried_.clear();
    take(snapshot());
    takeWhatCanBeSet();
    usePages(depth);
  }

  // Each list gets so many items at least, and it is seen which keyword makes another.
  void grow(int items) {
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
        const std::set<std::string> known(before.sections.begin(), before.sections.end());
        for (const std::string& section : after.sections) {
          const auto item = itemOf(nameOf(section));
          if (known.contains(section) || !item || item->number < 2) continue;
          const std::string parent = parentOf(section);
          if (!isOfFirstItems(parent + "/x")) continue;
          any = true;
          const std::string name = parent.empty() ? item->list : parent + "/" + item->list;
          ListNote& note =
              lists_.try_emplace(name, ListNote{.name = name, .count = {}, .followed = {}}).first->second;
          (parent == parentOf(keyword.path) ? note.count : note.followed) = keyword.path;
        }
        take(after);
        set(keyword.path, any ? std::max(now, items) : now);
      }
    }
  }

  void usePages(int depth) {
    for (const PageEntry& entry : document_->enumerator().pages()) {
      if (entry.pageClass.empty()) continue;
      const std::unique_ptr<CV27SetupFormView> page = makePage(entry.pageClass, *document_);
      if (page == nullptr) continue;
      page_ = entry.caption;
      for (Control& control : page->form().controls()) {
        if (control.grid != nullptr && control.grid->GetRowCount() > 0) control.grid->OnCurrentRow(1);
      }
      page->SetData();
      shown_ = page.get();
      // What a page works out when it is opened is no edit.
      document_->RecordEdit(PageId::none, "shown");
      explore({.name = fmt::format("{}", entry.id),
               .title = {},
               .with = [&page](const std::function<void(Form&)>& use) { use(page->form()); }},
              depth);
      shown_ = nullptr;
    }
  }

  // Uses each field, and what can be used while another choice is made in one of them.
  void explore(const Surface& surface, int depth) {
    std::vector<Field> fields;
    surface.with([&fields](Form& form) { fields = fieldsOf(form); });
    const std::size_t changes = changes_;
    const std::size_t edits = edits_;
    const bool isLinked = std::ranges::any_of(
        fields, [&](const Field& field) { return linked_.contains(surface.name + "/" + field.key()); });
    // A page that edits nothing that is on file does not apply.
    const auto applies = [&] {
      return isLinked || !surface.title.empty() || changes_ != changes || edits_ - edits < kEnoughEdits;
    };
    for (const Field& field : fields) {
      if (applies()) tryField(surface, field);
    }
    if (depth == 0 || !applies()) return;
    for (const Field& field : fields) {
      for (const std::string& choice : waysOf(field)) {
        if (choice == field.value) continue;
        const std::uint64_t state = document_->ModelState();
        surface.with([&](Form& form) { useField(form, field, choice); });
        if (document_->ModelState() != state) {
          if (made_.insert(surface.name + "/" + field.key() + "/" + choice).second) look();
          explore(surface, depth - 1);
        }
        undoTo(state);
      }
    }
  }
  // What can be made of a field for others to depend on it.
  static std::vector<std::string> waysOf(const Field& field) {
    if (field.kind == Field::Kind::choice) return field.choices;
    if (field.kind == Field::Kind::check) return {"0", "1"};
    return field.isCount ? std::vector{otherTexts(field.value).texts.front()} : std::vector<std::string>();
  }
  void undoTo(std::uint64_t state) {
    while (document_->ModelState() != state && document_->UndoStep() != nullptr) document_->Undo();
    // What was not taken goes, too.
    if (shown_ != nullptr) shown_->SetData();
  }

  void tryField(const Surface& surface, const Field& field) {
    const std::string place = surface.name + "/" + field.key();
    if (linked_.contains(place) || tried_[place] >= kMostTries) return;
    const std::size_t edits = edits_;
    const auto edit = [&](const std::string& text) {
      return changedBy([&] { surface.with([&](Form& form) { useField(form, field, text); }); });
    };
    bool found = false;
    switch (field.kind) {
      case Field::Kind::typed:
        found = type(surface, field, edit);
        break;
      case Field::Kind::check:
        found = check(surface, field, edit(field.value == "1" ? "0" : "1"));
        break;
      case Field::Kind::choice:
        found = choose(surface, field, edit);
        break;
      case Field::Kind::button:
        found = press(surface, field, edit);
    }
    if (found) linked_.insert(place);
    // A field that takes nothing at present costs little.
    if (edits_ != edits) ++tried_[place];
  }

  using Edit = std::function<std::vector<Change>(const std::string& text)>;

  bool type(const Surface& surface, const Field& field, const Edit& edit) {
    const OtherTexts other = otherTexts(field.value);
    bool found = false;
    for (const std::string& text : other.texts) {
      const std::vector<Change> changes = edit(text);
      const Sureness sureness = other.forEachNumber ? Sureness::amongNumbers : surely(surface);
      if (const Change* meant = meantBy(changes, text)) {
        note(*meant, surface, field, sureness);
        found = true;
      }
      if (found && !other.forEachNumber) break;
      if (!other.forEachNumber && !changes.empty()) {
        for (const Change& change : changes) note(change, surface, field, Sureness::together);
        return true;
      }
    }
    return found;
  }
  // Of the changes the one by which the keyword has got the value that was typed; null where it isn't plain.
  static const Change* meantBy(const std::vector<Change>& changes, const std::string& text) {
    if (changes.size() == 1) return changes.data();
    for (const Change& change : changes) {
      const auto typed = doubleOfText(text);
      const auto now = doubleOfText(change.after);
      constexpr double kSinglePrecision = 1e-6;
      const bool isSame = typed && now ? std::abs(*typed - *now) <= kSinglePrecision * std::abs(*typed)
                                       : change.after == text;
      if (isSame) return &change;
    }
    return nullptr;
  }

  bool check(const Surface& surface, const Field& field, const std::vector<Change>& changes) {
    const auto named = [&field](bool isChanged) { return (field.value == "1") == isChanged ? "off" : "on"; };
    for (const Change& change : changes) {
      ValueNote* held =
          note(change, surface, field, changes.size() == 1 ? surely(surface) : Sureness::together);
      if (held == nullptr || change.kind != ValueKind::integer) continue;
      addChoice(*held, change.before, named(false));
      addChoice(*held, change.after, named(true));
    }
    return !changes.empty();
  }

  // A choice sets a value of its own in each keyword that holds it.
  bool choose(const Surface& surface, const Field& field, const Edit& edit) {
    std::map<std::pair<std::size_t, std::size_t>, std::map<std::string, Change>> byValue;  // and by choice
    std::size_t effective = 0;
    for (const std::string& choice : field.choices) {
      if (choice == field.value) continue;
      const std::vector<Change> changes = edit(choice);
      effective += changes.empty() ? 0 : 1;
      for (const Change& change : changes) byValue[{change.note, change.value}].emplace(choice, change);
    }
    std::erase_if(byValue, [effective](const auto& held) {
      std::set<std::string> distinct;
      for (const auto& [choice, change] : held.second) distinct.insert(change.after);
      return distinct.size() != effective;
    });
    for (const auto& [value, changes] : byValue) {
      ValueNote* held = note(changes.begin()->second, surface, field,
                             byValue.size() == 1 ? surely(surface) : Sureness::together);
      if (held == nullptr) continue;
      for (const std::string& choice : field.choices) {
        const auto found = changes.find(choice);
        if (found != changes.end()) addChoice(*held, found->second.after, choice);
        if (choice == field.value) addChoice(*held, changes.begin()->second.before, choice);
      }
    }
    return !byValue.empty();
  }
  static void addChoice(ValueNote& note, const std::string& value, const std::string& choice) {
    const std::pair<std::string, std::string> entry(value, choice);
    if (std::ranges::find(note.choices, entry) == note.choices.end()) note.choices.push_back(entry);
  }

  // A button opens a dialog, or lets a file be chosen with its items.
  bool press(const Surface& surface, const Field& field, const Edit& edit) {
    if (!surface.title.empty()) return false;
    Surface dialog{.name = surface.name + "/" + field.key(), .title = {}, .with = {}};
    host_.UseDialog([&dialog](std::string_view title, Form&) {
      dialog.title = title;
      return false;
    });
    host_.ChooseFiles(true);
    const std::vector<Change> changes = edit({});
    host_.ChooseFiles(false);
    host_.UseDialog({});
    if (dialog.title.empty()) return noteFile(surface, field, changes);
    dialog.with = [&](const std::function<void(Form&)>& use) {
      host_.UseDialog([&use](std::string_view, Form& form) {
        use(form);
        return true;
      });
      surface.with([&](Form& form) { useField(form, field, {}); });
      host_.UseDialog({});
    };
    explore(dialog, 1);
    return false;
  }
  // The items of a file are labelled as the file is.
  bool noteFile(const Surface& surface, Field field, const std::vector<Change>& changes) {
    const auto isFile = [](const Change& change) {
      return change.kind == ValueKind::fileName && change.after.ends_with(DialogHost::kFile);
    };
    const auto file = std::ranges::find_if(changes, isFile);
    if (file == changes.end()) return false;
    const ValueNote& named = list_.keywords[file->note].parts[file->value];
    if (!named.label.empty()) field.label = named.label;
    for (const Change& change : changes) {
      if (change.kind == ValueKind::integer || isFile(change))
        note(change, surface, field, Sureness::amongNumbers);
    }
    return true;
  }

  static Sureness surely(const Surface& surface) {
    return surface.title.empty() ? Sureness::onPage : Sureness::inDialog;
  }

  // Notes what a value is called; null where it is known more surely already.
  ValueNote* note(const Change& change, const Surface& surface, const Field& field, Sureness sureness) {
    if (change.ofFurtherItem) sureness = Sureness::together;
    Sureness& known = known_[{change.note, change.value}];
    const std::string label = surface.title.empty() ? field.label : surface.title + ": " + field.label;
    KeywordNote& keyword = list_.keywords[change.note];
    ValueNote& held = keyword.parts[change.value];
    if (sureness < known || (sureness == known && held.label != label)) return nullptr;
    known = sureness;
    if (held.label != label) held = {.label = label, .quantity = {}, .unit = {}, .choices = {}};
    keyword.page = page_;
    if (field.quantity != nullptr && held.quantity.empty()) {
      held.quantity = field.quantity->name;
      held.unit = qunBaseUnit(field.quantity->code)->symbol;
    }
    return &held;
  }

  // What is on file at present.
  void look() {
    if (document_->ModelState() == stateBefore_) return;
    before_ = snapshot();
    stateBefore_ = document_->ModelState();
    take(before_);
    placesBefore_.clear();
    for (const Keyword& keyword : before_.keywords) placesBefore_.emplace(keyword.path, &keyword);
  }

  // Makes an edit, sees what it has changed, and takes it back.
  std::vector<Change> changedBy(const std::function<void()>& edit) {
    const std::uint64_t state = document_->ModelState();
    look();
    edit();
    if (document_->ModelState() == state) {
      undoTo(state);
      return {};
    }
    ++edits_;
    const Snapshot after = snapshot();
    take(after);
    undoTo(state);
    std::vector<Change> changes;
    std::vector<Change> further;
    for (const Keyword& now : after.keywords) {
      const auto held = placesBefore_.find(now.path);
      if (held == placesBefore_.end() || held->second->values == now.values) continue;
      const bool isFirst = isOfFirstItems(now.path);
      const auto known = notes_.find(isFirst ? now.path : inFirstItems(now.path));
      if (known != notes_.end())
        addChanges(known->second, held->second->values, now.values, isFirst ? changes : further);
    }
    if (changes.empty()) {
      changes = std::move(further);
      for (Change& change : changes) change.ofFurtherItem = true;
    }
    changes_ += changes.size();
    return changes;
  }
  void addChanges(std::size_t note, const Values& before, const Values& after, std::vector<Change>& changes) {
    const bool isWhole = before.size() != after.size();
    const std::size_t parts = list_.keywords[note].parts.size();
    for (std::size_t i = 0; i < (isWhole ? 1 : after.size()); ++i) {
      if (!isWhole && before[i] == after[i]) continue;
      const std::pair<ValueKind, std::string> none;
      const auto& [kind, now] = i < after.size() ? after[i] : none;
      changes.push_back({note, std::min(i, parts - 1), kind, i < before.size() ? before[i].second : "", now});
    }
  }

  // Of those that are numbered what is known of the first holds for all.
  void fillNumbered() {
    std::unordered_map<std::string, const KeywordNote*> known;
    static const std::regex kNumber("_[0-9]+(?=_|$)");
    const auto hasLabel = [](const KeywordNote& note) { return !note.parts.front().label.empty(); };
    for (const KeywordNote& note : list_.keywords) {
      if (hasLabel(note)) known.emplace(note.path, &note);
    }
    for (KeywordNote& note : list_.keywords) {
      if (hasLabel(note)) continue;
      const std::string name = nameOf(note.path);
      const std::string first = std::regex_replace(name, kNumber, "_1");
      const auto found = known.find(note.path.substr(0, note.path.size() - name.size()) + first);
      if (found == known.end()) continue;
      note.page = found->second->page;
      note.parts = found->second->parts;
      // "Fraction 1" of Fraction_1 is "Fraction 3" of Fraction_3.
      std::string& label = note.parts.front().label;
      const std::string number = name.substr(name.rfind('_') + 1);
      if (label.ends_with(" 1") && first == name.substr(0, name.size() - number.size()) + "1")
        label.replace(label.size() - 1, 1, number);
    }
  }

  static constexpr std::string_view kModuleSelection = "NESTED_MODEL_GLOBALS/MODULE_SELECTION/";
  static constexpr std::size_t kTurns = 4;
  static constexpr int kMostTries = 3;
  static constexpr std::size_t kEnoughEdits = 5;

  DialogHost host_;
  std::unique_ptr<CGridbayDoc> document_;
  KeywordList list_;
  std::unordered_set<std::string> seen_;  // paths of keywords, and of sections with a slash
  std::unordered_map<std::string, std::size_t> notes_;
  std::map<std::string, ListNote> lists_;
  CV27SetupFormView* shown_ = nullptr;
  std::string page_;                  // that is used
  std::set<std::string> linked_;      // places whose keywords have been found
  std::set<std::string> made_;        // choices that were made for what is behind them
  std::map<std::string, int> tried_;  // how often one was used to no avail
  std::map<std::pair<std::size_t, std::size_t>, Sureness> known_;  // by keyword and value
  std::size_t edits_ = 0;                                          // that have changed something
  std::size_t changes_ = 0;                                        // of keywords that were seen
  Snapshot before_;
  std::optional<std::uint64_t> stateBefore_;  // of the model that it was taken of
  std::unordered_map<std::string_view, const Keyword*> placesBefore_;
};

}  // namespace

KeywordList collectKeywords(const std::string& definition) {
  return Collector().collect(definition);
}

}  // namespace gridbay::python
