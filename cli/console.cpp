#include "cli/console.h"

#include <fmt/format.h>

namespace gridbay::cli {

int Console::fail(std::string_view why) const {
  note(why);
  return kCouldNotDoIt;
}

void Console::note(std::string_view text) const {
  err << text << '\n' << std::flush;
}

std::string shellText(std::string_view word) {
  constexpr std::string_view kPlain =
      "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789_-./:=,+@%";
  if (!word.empty() && word.find_first_not_of(kPlain) == word.npos) return std::string(word);
  std::string text = "'";
  for (const char c : word) text += c == '\'' ? std::string("'\\''") : std::string(1, c);
  return text + "'";
}

std::string messageLine(const CMessage& message) {
  return fmt::format("page {}, severity {}: {}", static_cast<int>(message.page),
                     static_cast<int>(message.severity), message.text);
}

int saveSetup(SetupFile& setup, const std::string& path, const Console& console) {
  for (const std::string& section : setup.unknownSections()) {
    console.note("Warning: this version does not know section " + section +
                 ", which is left out of the saved file");
  }
  if (const Outcome saved = setup.save(path); !saved) return console.fail(saved.error());
  return kClean;
}

}  // namespace gridbay::cli
