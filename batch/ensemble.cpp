#include "batch/ensemble.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <filesystem>
#include <map>
#include <set>

#include "core/edition.h"
#include "core/kvs.h"
#include "core/nearest.h"
#include "platform/files/may_write.h"
#include "platform/files/paths.h"
#include "platform/files/save_file.h"
#include "platform/side_by_side.h"
#include "setup/member_keyword.h"
#include "setup/setting.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

namespace fs = std::filesystem;

constexpr std::size_t kMostErrors = 20;  // that are told

// A keyword of the common setup that names a file which the engine makes.
struct ResultName {
  std::string path;
  std::string name;
};

void listResultNames(const Node& section, const std::string& prefix, std::vector<ResultName>& names) {
  std::map<std::string, int, std::less<>> seen;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    const int number = ++seen[lowered(node->name()) + (node->isSection() ? "/" : "")];
    std::string path = prefix + std::string(node->name());
    if (number > 1) path += fmt::format("[{}]", number);
    if (node->isSection()) {
      listResultNames(*node, path + "/", names);
    } else if (node->values().size() == 1 && node->values().front().kind() == ValueKind::resultFileName &&
               !node->values().front().text().empty()) {
      names.push_back({std::move(path), std::string(node->values().front().text())});
    }
  }
}

std::vector<ResultName> resultNamesOf(const KvsFile& tree) {
  std::vector<ResultName> names;
  if (const Node* target = kvsTargetByNameNum(tree, CGlobalKvs::kTarget, 1); target != nullptr)
    listResultNames(*target, {}, names);
  return names;
}

// The files that the engine makes of a setup, each once.
std::vector<std::string> resultsOf(const KvsFile& tree, const std::string& setup) {
  std::set<std::string> files;
  for (const ResultName& result : resultNamesOf(tree))
    files.insert(absolutePath(result.name, folderOfFile(setup)));
  return {files.begin(), files.end()};
}

// Makes one member after the other in the model of the common setup, which it brings back each time.
class MemberMaker {
 public:
  MemberMaker(const Ensemble& ensemble, SetupFile base) : ensemble_(ensemble), setup_(std::move(base)) {
    resultNames_ = resultNamesOf(*setup_.tree(ensemble.base));
    // What a check reads of the data files is read again for each member.
    plain_.AssignState(setup_.model());
    hasOptions_ = std::ranges::any_of(ensemble.table.paths, isOption);
    if (hasOptions_) plainSource_ = withValues(setup_.source(), nullptr, {});
    for (const std::string& path : ensemble.table.paths)
      columns_.push_back({.key = lowered(withoutTarget(path))});
  }

  SetupFile& setup() { return setup_; }

  // A path that no member gives a value would pass whatever it says.
  Outcome findUnused() {
    const EnsembleTable& table = ensemble_.table;
    for (std::size_t i = 0; i < columns_.size(); ++i) {
      const bool isUsed = std::ranges::any_of(
          table.members, [i](const EnsembleTable::Member& member) { return !member.values[i].empty(); });
      if (isUsed) continue;
      const KvsHandle tree = setup_.tree(ensemble_.base);
      const Result<const Node*> found =
          findPath(isOption(table.paths[i]) ? setup_.source() : *tree, table.paths[i]);
      if (!found)
        return Failure{
            fmt::format("{}, column {}: {}", table.path, table.firstPathColumn + i, found.error())};
    }
    return {};
  }

  // Gives the model the member's values; the error of the first one that can't be set has its place.
  Outcome set(const EnsembleTable::Member& member) {
    setup_.model().AssignState(plain_);
    if (hasOptions_) setup_.replaceSource(withValues(*plainSource_, nullptr, {}));
    const std::string file = ensemble_.fileOf(member);
    std::set<std::string_view> named;
    for (std::size_t i = 0; i < columns_.size(); ++i) {
      const std::string& value = member.values[i];
      if (value.empty()) continue;
      const Setting setting{ensemble_.table.paths[i], value};
      const std::string& start = isResult(columns_[i], setting.path) ? file : ensemble_.base;
      if (const Outcome done = applySetting(setup_, setting, start); !done)
        return Failure{fmt::format("{}: {}", ensemble_.table.placeOf(member, i), done.error())};
      named.insert(columns_[i].key);
    }
    for (const ResultName& result : resultNames_) {
      if (!named.contains(lowered(result.path))) giveOwnName(result, member.name, file);
    }
    return {};
  }

  // Writes the model as the member's file, and checks that file as it would be read.
  MemberReport make(const EnsembleTable::Member& member) {
    MemberReport report;
    if (const Outcome done = set(member); !done) {
      report.error = done.error();
      return report;
    }
    try {
      const std::string file = ensemble_.fileOf(member);
      KvsHandle saved = kvsCreate();
      setup_.model().Save(*saved, file);
      const Result<std::string> text = saved->text();
      const Outcome written =
          text ? saveFile(file, *text, FileSave::Flush::withOthers) : Outcome(Failure{text.error()});
      if (!written) {
        report.error = fmt::format("{}: {}", ensemble_.table.placeOf(member), written.error());
        return report;
      }
      CollectingMessageHost host;
      report.results = resultsOf(*saved, file);
      SetupFile setup = SetupFile::fromTree(std::move(saved), file, &host);
      report.notes = std::move(host.texts);
      checkInto(report, setup);
    } catch (const std::exception& fault) {
      report.error =
          fmt::format("{}: the setup cannot be written: {}", ensemble_.table.placeOf(member), fault.what());
    }
    return report;
  }

  // The folders of files that the members' engines make, below that of the members.
  std::set<std::string> resultFolders() const {
    std::set<std::string> folders;
    for (const ResultName& result : resultNames_) {
      if (const fs::path name(result.name); isInside(name) && name.has_parent_path())
        folders.insert((fs::path(ensemble_.folder) / name.parent_path()).string());
    }
    return folders;
  }

 private:
  struct Column {
    std::string key;  // its path as all its spellings have it
    std::optional<bool> isResult = std::nullopt;
  };

  // Whether a column has the names of files that the engine makes: known once a member has its keyword.
  bool isResult(Column& column, const std::string& path) {
    if (!column.isResult && !isOption(path)) {
      if (const Result<MemberKeyword> keyword = findKeyword(setup_.model(), path, ensemble_.base)) {
        const std::span<const Value> values = keyword->node().values();
        column.isResult = !values.empty() && values.front().kind() == ValueKind::resultFileName;
      }
    }
    return column.isResult.value_or(false);
  }

  static bool isInside(const fs::path& name) {
    return name.is_relative() && *name.lexically_normal().begin() != "..";
  }

  // Without it the members' engines would write the same file. A member may lack the keyword.
  void giveOwnName(const ResultName& result, const std::string& member, const std::string& file) {
    const fs::path shared(result.name);
    const fs::path own = shared.parent_path() / (member + "_" + shared.filename().string());
    const std::string& start = isInside(shared) ? file : ensemble_.base;
    Result<MemberKeyword> keyword = findKeyword(setup_.model(), result.path, start);
    if (!keyword) return;
    ParameterTree keeper;
    keyword->set({keeper.makeValue(ValueKind::resultFileName, keeper.keep(own.string()))});
  }

  const Ensemble& ensemble_;
  SetupFile setup_;
  CGlobalKvs plain_;
  bool hasOptions_ = false;
  KvsHandle plainSource_;
  std::vector<Column> columns_;
  std::vector<ResultName> resultNames_;
};

Outcome mayWriteAll(const Ensemble& ensemble) {
  const std::array<std::string, 2> inputs{ensemble.base, ensemble.table.path};
  for (const std::string& report : {ensemble.csvReport(), ensemble.jsonReport()}) {
    if (const Outcome may = mayWrite(report, ensemble.mayReplace, inputs, "--force"); !may) return may;
  }
  for (const EnsembleTable::Member& member : ensemble.table.members) {
    if (const Outcome may = mayWrite(ensemble.fileOf(member), ensemble.mayReplace, inputs, "--force"); !may)
      return Failure{fmt::format("{}: {}", ensemble.table.placeOf(member), may.error())};
  }
  return {};
}

// Setups in the folder that are none of its members, as of an ensemble that was there before.
std::size_t othersIn(const Ensemble& ensemble) {
  std::set<std::string> own;
  for (const EnsembleTable::Member& member : ensemble.table.members)
    own.insert(fs::path(ensemble.fileOf(member)).filename().string());
  std::error_code error;
  std::size_t others = 0;
  const std::string kind = fmt::format(".{}", theEdition.fileKind);
  for (fs::directory_iterator at(ensemble.folder, error), end; !error && at != end; at.increment(error)) {
    const fs::path name = at->path().filename();
    if (name.extension() == kind && !own.contains(name.string())) ++others;
  }
  return others;
}

// Notes with each member the files that others make, too, and gives a warning for each such file.
std::vector<std::string> tellShared(std::vector<MemberReport>& members) {
  std::map<std::string, std::vector<MemberReport*>> makers;
  for (MemberReport& member : members) {
    for (const std::string& result : member.results) makers[result].push_back(&member);
  }
  std::vector<std::string> warnings;
  for (const auto& [file, sharers] : makers) {
    if (sharers.size() < 2) continue;
    const std::string who = sharers.size() == members.size()
                                ? fmt::format("all {} members", sharers.size())
                                : fmt::format("{} members ({}, {}{})", sharers.size(), sharers[0]->name,
                                              sharers[1]->name, sharers.size() > 2 ? ", ..." : "");
    warnings.push_back(fmt::format("{} make \"{}\": each run replaces what another one made", who, file));
    for (MemberReport* member : sharers)
      member->notes.push_back(fmt::format("Warning: {} other member{} make{} \"{}\", too", sharers.size() - 1,
                                          sharers.size() == 2 ? "" : "s", sharers.size() == 2 ? "s" : "",
                                          file));
  }
  return warnings;
}

Outcome makeFolder(const std::string& folder) {
  std::error_code error;
  fs::create_directories(folder, error);
  if (!error && fs::is_directory(folder, error)) return {};
  return Failure{fmt::format("cannot make the folder \"{}\": {}", folder,
                             error ? error.message() : "a file has that name")};
}

// Tries all values with no file written.
Outcome tryAll(const Ensemble& ensemble, MemberMaker& maker, const BatchWatch& watch) {
  const std::vector<EnsembleTable::Member>& members = ensemble.table.members;
  std::map<std::size_t, std::string> errors;
  std::size_t done = 0;
  const Outcome ran =
      SideBySide{.count = members.size(),
                 .work =
                     [&](std::size_t i) {
                       const Outcome set = maker.set(members[i]);
                       return set ? std::string() : set.error();
                     },
                 .took =
                     [&](std::size_t i, const std::optional<std::string>& error) {
                       ++done;
                       if (!error)
                         errors[i] = fmt::format("{}: cannot be set", ensemble.table.placeOf(members[i]));
                       if (error && !error->empty()) errors[i] = *error;
                     },
                 .isStopped = [&] { return watch.isStopped() || errors.size() > kMostErrors; }}
          .run();
  if (!ran) return ran;
  if (errors.empty()) return done < members.size() ? Failure{"Stopped"} : Outcome();
  std::string text;
  std::size_t told = 0;
  for (const auto& [i, error] : errors) {
    if (++told > kMostErrors) {
      text += "\n...";
      break;
    }
    text += (text.empty() ? "" : "\n") + error;
  }
  return Failure{text};
}

}  // namespace

std::string Ensemble::fileOf(const EnsembleTable::Member& member) const {
  return (fs::path(folder) / fmt::format("{}.{}", member.name, theEdition.fileKind)).string();
}
std::string Ensemble::csvReport() const {
  return (fs::path(folder) / "report.csv").string();
}
std::string Ensemble::jsonReport() const {
  return (fs::path(folder) / "report.json").string();
}

Result<EnsembleResult> makeEnsemble(const Ensemble& ensemble, MessageHost& host, const BatchWatch& watch) {
  Result<SetupFile> base = SetupFile::open(ensemble.base, &host);
  if (!base) return Failure{base.error()};
  if (const Outcome may = mayWriteAll(ensemble); !may) return Failure{may.error()};
  for (const std::string& section : base->unknownSections())
    host.show("Warning: this version does not know section " + section + ", which the members do not have");
  MemberMaker maker(ensemble, std::move(*base));
  if (const Outcome found = maker.findUnused(); !found) return Failure{found.error()};
  if (const Outcome tried = tryAll(ensemble, maker, watch); !tried) return Failure{tried.error()};
  if (const Outcome made = makeFolder(ensemble.folder); !made) return Failure{made.error()};
  for (const std::string& folder : maker.resultFolders()) {
    if (const Outcome made = makeFolder(folder); !made) return Failure{made.error()};
  }

  // A look at the data files here serves all copies of this process.
  ValidationList dropped;
  maker.setup().model().Validate(dropped, 1);
  const std::vector<EnsembleTable::Member>& members = ensemble.table.members;
  std::vector<std::optional<MemberReport>> reports(members.size());
  std::string error;
  std::size_t done = 0;
  const Outcome ran = SideBySide{.count = members.size(),
                                 .work = [&](std::size_t i) { return packed(maker.make(members[i])); },
                                 .took =
                                     [&](std::size_t i, const std::optional<std::string>& text) {
                                       MemberReport report;
                                       if (text)
                                         unpack(*text, report);
                                       else
                                         report.error = std::filesystem::exists(ensemble.fileOf(members[i]))
                                                            ? "the check ended by a crash"
                                                            : "it was not made: its process ended by a crash";
                                       if (text && !report.error.empty()) {
                                         if (error.empty()) error = report.error;
                                         return;
                                       }
                                       report.name = members[i].name;
                                       report.file = ensemble.fileOf(members[i]);
                                       reports[i] = std::move(report);
                                       watch.reached(++done);
                                     },
                                 .isStopped = [&] { return watch.isStopped() || !error.empty(); }}
                          .run();
  if (!ran) return Failure{ran.error()};

  EnsembleResult result;
  result.others = othersIn(ensemble);
  for (std::optional<MemberReport>& report : reports) {
    if (report) result.members.push_back(*std::move(report));
  }
  result.isStopped = done < members.size();
  result.warnings = tellShared(result.members);
  const Outcome csv = saveFile(ensemble.csvReport(), reportAsCsv(result.members));
  const Outcome json = saveFile(ensemble.jsonReport(), reportAsJson(result.members));
  for (const Outcome& saved : {csv, json, flushFiles(ensemble.folder)}) {
    if (error.empty() && !saved) error = saved.error();
  }
  if (!error.empty())
    return Failure{fmt::format("{}\n{} of {} members were made", error, done, members.size())};
  return result;
}

}  // namespace gridbay
