// What two setups have made of a third, together.

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>
#include <nlohmann/json.hpp>

#include "cli/commands.h"
#include "compare/setup_merge.h"
#include "platform/files/may_write.h"

namespace gridbay::cli {
namespace {

using Json = nlohmann::ordered_json;

struct MergeOptions {
  std::string base;
  std::string own;
  std::string other;
  std::string out;
  bool takesOwn = false;
  bool takesOther = false;
  bool asWritten = false;
  bool force = false;
  bool json = false;
};

Result<SetupOnDisk> open(const std::string& path, const MergeOptions& options, MessageHost& host) {
  const std::string& start = options.asWritten ? options.out : path;
  Result<SetupFile> setup = SetupFile::open(path, &host, start);
  if (!setup) return Failure{setup.error()};
  return SetupOnDisk{std::move(*setup), path};
}

// What a merge leaves out is told of each file that has it.
void tellUnknown(SetupOnDisk& source, const Console& console) {
  for (const std::string& section : source.setup.unknownSections())
    console.note(
        fmt::format("{}: this version does not know {}, and a merge leaves it out", source.path, section));
}

std::string lineOf(const MergeQuestion& question) {
  const std::string base =
      question.base
          ? fmt::format("{} in the base", question.base->empty() ? "nothing" : shortened(*question.base))
          : std::string("not in the base");
  return fmt::format("{}{}{}: {}, {}\n", question.pageName, question.pageName.empty() ? "" : ": ",
                     question.thing, wordsOf(shortened(question.own), shortened(question.other), "A", "B"),
                     base);
}

Json jsonOf(const MergeQuestion& question) {
  const auto value = [](const std::optional<std::string>& text) {
    return text ? Json(*text) : Json(nullptr);
  };
  return {{"path", question.path},     {"page", question.page},        {"pageName", question.pageName},
          {"thing", question.thing},   {"base", value(question.base)}, {"a", value(question.own)},
          {"b", value(question.other)}};
}

// What the check of the result found.
unsigned tellFaults(SetupFile& result, const Console& console) {
  ValidationList messages;
  const unsigned faults = result.model().Validate(messages, 1);
  for (const CMessage& message : messages) console.note(messageLine(message));
  return faults;
}

int merge(const MergeOptions& options, const Console& console) {
  if (const Outcome may = mayWrite(options.out, options.force, {}, "--force"); !may)
    return console.fail(may.error());
  const std::string names[] = {options.base, options.own, options.other, options.out};
  if (const Outcome one = areOfOneEdition(names); !one) return console.fail(one.error());
  ConsoleMessageHost host(console);
  Result<SetupOnDisk> base = open(options.base, options, host);
  if (!base) return console.fail(base.error());
  Result<SetupOnDisk> own = open(options.own, options, host);
  if (!own) return console.fail(own.error());
  Result<SetupOnDisk> other = open(options.other, options, host);
  if (!other) return console.fail(other.error());
  MergeSources sources{std::move(*base), std::move(*own), std::move(*other)};
  tellUnknown(sources.own, console);
  tellUnknown(sources.other, console);

  const MergeSide side = options.takesOther ? MergeSide::other : MergeSide::own;
  MergedTree merged = mergeSetups(sources, options.out, [side](const MergeConflict&) { return side; });
  const std::vector<MergeQuestion> questions =
      questionsOf(merged.conflicts, *sources.base.setup.tree(options.out),
                  *sources.own.setup.tree(options.out), *sources.other.setup.tree(options.out), options.out);
  const bool isWritten = questions.empty() || options.takesOwn || options.takesOther;
  const std::size_t count = questions.size();
  const std::size_t taken = merged.takenFromOther + (options.takesOther ? count : 0);
  unsigned faults = 0;
  if (isWritten) {
    SetupFile result = SetupFile::fromTree(std::move(merged.file), options.out, &host);
    if (const int status = saveSetup(result, options.out, console); status != kClean) return status;
    faults = tellFaults(result, console);
  }
  if (options.json) {
    Json report{{"base", options.base}, {"a", options.own},           {"b", options.other},
                {"out", options.out},   {"conflicts", Json::array()}, {"takenFromB", taken},
                {"written", isWritten}};
    for (const MergeQuestion& question : questions) report["conflicts"].push_back(jsonOf(question));
    if (isWritten) report["faults"] = faults;
    console.out << report.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
    return questions.empty() ? kClean : kFaultsFound;
  }
  for (const MergeQuestion& question : questions) console.out << lineOf(question);
  if (!isWritten) {
    console.note(fmt::format("{} conflict{}; nothing is written without --ours (A) or --theirs (B)", count,
                             count == 1 ? "" : "s"));
  } else {
    console.out << fmt::format("{}: {} change{} taken from B, {} conflict{}, {} fault{}\n", options.out,
                               taken, taken == 1 ? "" : "s", count, count == 1 ? "" : "s", faults,
                               faults == 1 ? "" : "s");
  }
  return count == 0 ? kClean : kFaultsFound;
}

}  // namespace

void addMerge(CLI::App& tool, Action& action) {
  std::shared_ptr<MergeOptions> options;
  CLI::App& command = addCommand(
      tool, action, "merge",
      "Makes one setup of two that come from a third; exit status 0 for a clean merge, 1 for conflicts, 2 "
      "for trouble",
      merge, options);
  command.add_option("BASE", options->base, "The setup that both come from")->required();
  command.add_option("A", options->own, "A setup")->required();
  command.add_option("B", options->other, "Another one")->required();
  command.add_option("-o,--out", options->out, "The setup to write")->required();
  CLI::Option* ours = command.add_flag("--ours", options->takesOwn, "In conflicts what A has");
  command.add_flag("--theirs", options->takesOther, "In conflicts what B has")->excludes(ours);
  command.add_flag("--as-written", options->asWritten,
                   "Take file names as they are written, as if all lay in the folder of the result");
  addForce(command, options->force);
  command.add_flag("--json", options->json, "The conflicts and the outcome as JSON");
}

}  // namespace gridbay::cli
