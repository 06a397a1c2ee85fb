#include <fmt/format.h>

#include <algorithm>
#include <map>

#include "cli/commands.h"
#include "core/nearest.h"
#include "platform/units/units.h"
#include "setup/setup_file.h"
#include "setup/setup_path.h"

namespace gridbay::cli {
namespace {

struct CompletionOptions {
  std::string shell;
};

// What each shell runs to ask the tool about the words before the cursor, with names for @tool@, for the word
// that asks, and for a function.
constexpr std::string_view kBash = R"script(# Completion of @tool@ for bash.
@function@() {
  local line
  COMPREPLY=()
  while IFS= read -r line; do
    COMPREPLY+=("$(printf %q "${line%%$'\t'*}")")
  done < <("$1" @ask@ "${COMP_WORDS[@]:1:COMP_CWORD}" 2>/dev/null)
  if [ ${#COMPREPLY[@]} -eq 1 ]; then
    case ${COMPREPLY[0]} in */ | *=) compopt -o nospace 2>/dev/null ;; esac
  fi
}
complete -o default -F @function@ @tool@
)script";

constexpr std::string_view kZsh = R"script(#compdef @tool@
# Completion of @tool@ for zsh.
@function@() {
  local line word
  local -a ended open
  for line in "${(@f)$("${words[1]}" @ask@ "${(@)words[2,CURRENT]}" 2>/dev/null)}"; do
    [[ -z $line ]] && continue
    word=${line%%$'\t'*}
    case $word in
      */ | *=) open+=("$word") ;;
      *)
        if [[ $line = *$'\t'* ]]; then
          ended+=("${word//:/\\:}:${line#*$'\t'}")
        else
          ended+=("${word//:/\\:}")
        fi
        ;;
    esac
  done
  (( $#ended )) && _describe -t words @tool@ ended
  (( $#open )) && compadd -S '' -- "${open[@]}"
  (( $#ended + $#open )) || _files
}
if [ "$funcstack[1]" = _@tool@ ]; then @function@ "$@"; else compdef @function@ @tool@; fi
)script";

constexpr std::string_view kFish = R"script(# Completion of @tool@ for fish.
function @function@
  set -l words (commandline -opc)
  set -l found ($words[1] @ask@ $words[2..-1] (commandline -ct) 2>/dev/null)
  if test (count $found) -gt 0
    printf '%s\n' $found
  else
    __fish_complete_path (commandline -ct)
  end
end
complete -c @tool@ -f -a '(@function@)'
)script";

constexpr std::pair<std::string_view, std::string_view> kShells[] = {
    {"bash", kBash}, {"fish", kFish}, {"zsh", kZsh}};

void replaceAll(std::string& text, std::string_view what, std::string_view by) {
  for (std::size_t at = 0; (at = text.find(what, at)) != text.npos; at += by.size())
    text.replace(at, what.size(), by);
}

int printScript(const CompletionOptions& options, const Console& console) {
  std::string script(
      std::ranges::find(kShells, options.shell, [](const auto& s) { return s.first; })->second);
  std::string function = fmt::format("_{}_complete", toolName());
  std::ranges::replace(function, '-', '_');
  replaceAll(script, "@function@", function);
  replaceAll(script, "@tool@", toolName());
  replaceAll(script, "@ask@", kCompleteWords);
  console.out << script;
  return kClean;
}

// The candidates that begin as the word does, case aside.
class Candidates {
 public:
  Candidates(std::string_view word, std::ostream& out) : word_(lowered(word)), out_(out) {}

  void add(std::string_view text, std::string_view what = {}) const {
    if (!lowered(text).starts_with(word_)) return;
    out_ << text;
    if (!what.empty()) out_ << '\t' << what.substr(0, what.find('\n'));
    out_ << '\n';
  }

 private:
  std::string word_;
  std::ostream& out_;
};

// The next step of each path that begins with the word: sections end in a slash, keywords as they are to.
void addPaths(const std::string& file, std::string_view word, std::string_view end, std::ostream& out) {
  struct Silence final : MessageHost {
    void show(const std::string&) override {}
  } silence;
  Result<SetupFile> setup = SetupFile::open(file, &silence);
  if (!setup) return;
  const KvsHandle tree = setup->tree(file);
  const std::size_t slash = word.rfind('/');
  const std::string parent(word.substr(0, slash == word.npos ? 0 : slash));
  const Result<const Node*> section = findPath(*tree, parent);
  if (!section || !(*section)->isSection()) return;
  const Candidates candidates(word, out);
  std::map<std::string, int, std::less<>> seen;
  for (const Node* node = (*section)->first(); node != nullptr; node = node->next()) {
    std::string step = parent.empty() ? std::string() : parent + '/';
    step += node->name();
    if (const int number = ++seen[lowered(node->name())]; number > 1) step += fmt::format("[{}]", number);
    candidates.add(step + std::string(node->isSection() ? "/" : end));
  }
}

void addOptions(const CLI::App& command, const Candidates& candidates) {
  for (const CLI::Option* option : command.get_options()) {
    for (const std::string& name : option->get_lnames())
      candidates.add("--" + name, option->get_description());
  }
}

}  // namespace

void printCompletions(const CLI::App& tool, std::span<const char* const> words, std::ostream& out) {
  if (words.empty()) return;
  const std::string_view word = words.back();
  const Candidates candidates(word, out);
  const CLI::App* command = &tool;
  const CLI::Option* wanting = nullptr;  // the option whose value comes next
  std::vector<std::string> positionals;
  for (const char* const text : words.first(words.size() - 1)) {
    if (wanting != nullptr) {
      wanting = nullptr;
    } else if (*text == '-') {
      const CLI::Option* option = command->get_option_no_throw(text);
      if (option != nullptr && option->get_items_expected_max() > 0) wanting = option;
    } else if (const auto inner =
                   command->get_subcommands([text](const CLI::App* each) { return each->check_name(text); });
               !inner.empty()) {
      command = inner.front();
    } else {
      positionals.emplace_back(text);
    }
  }
  if (wanting != nullptr) {
    if (wanting->check_lname("item-type")) {
      for (const QunItem& quantity : qunItems()) candidates.add(quantity.name);
    }
    return;
  }
  if (word.starts_with('-')) return addOptions(*command, candidates);
  for (const CLI::App* const inner : command->get_subcommands([](const CLI::App*) { return true; }))
    candidates.add(inner->get_name(), inner->get_description());
  std::vector<const CLI::Option*> places;
  for (const CLI::Option* option : command->get_options()) {
    if (option->get_positional()) places.push_back(option);
  }
  if (places.empty()) return;
  const std::string place = places[std::min(positionals.size(), places.size() - 1)]->get_name();
  if (place == "SHELL") {
    for (const auto& [shell, script] : kShells) candidates.add(shell);
  } else if (!positionals.empty() && place.starts_with("PATH")) {
    addPaths(positionals.front(), word, place.substr(std::string_view("PATH").size(), 1), out);
  }
}

void addCompletion(CLI::App& tool, Action& action) {
  std::shared_ptr<CompletionOptions> options;
  CLI::App& command =
      addCommand(tool, action, "completion", "Prints what makes a shell complete this tool's command lines",
                 printScript, options);
  std::vector<std::string> shells;
  for (const auto& [shell, script] : kShells) shells.emplace_back(shell);
  command.add_option("SHELL", options->shell, "The shell")->required()->check(CLI::IsMember(shells));
}

}  // namespace gridbay::cli
