#include "cli/console.h"

#include <algorithm>

namespace gridbay::cli {

int Console::fail(std::string_view why) const {
  note(why);
  return kCouldNotDoIt;
}

void Console::note(std::string_view text) const {
  err << text << '\n' << std::flush;
}

void ConsoleMessageHost::show(const std::string& text) {
  std::string line = text;
  std::ranges::replace(line, '\n', ' ');
  if (++counts_[line] == 1) order_.push_back(line);
}

void ConsoleMessageHost::flush() {
  for (const std::string& line : order_) {
    const int count = counts_[line];
    console_.note(count == 1 ? line : line + " (" + std::to_string(count) + " times)");
  }
  order_.clear();
  counts_.clear();
}

int saveSetup(SetupFile& setup, const std::string& path, const Console& console) {
  for (const std::string& section : setup.unknownSections(path)) {
    console.note("Warning: this version does not know section " + section +
                 ", which is left out of the saved file");
  }
  if (const Outcome saved = setup.save(path); !saved) return console.fail(saved.error());
  return kClean;
}

}  // namespace gridbay::cli
