#pragma once

#include <optional>
#include <string>

#include "cli/console.h"
#include "cli/progress.h"
#include "conversion/conversion_host.h"

namespace gridbay::cli {

// Tells on standard error how a conversion goes.
class ConsoleConversion : public ConversionHost {
 public:
  explicit ConsoleConversion(const Console& console) : console_(console) {}

  void note(const std::string& text) override { console_.note(text); }
  bool reached(std::size_t done, std::size_t total) override;
  std::string option(std::string_view name, std::string_view placeholder) const override;
  std::string itemTypeList() const override;

 private:
  const Console& console_;
  std::optional<Progress> progress_;
};

// Does a conversion and shows what it has made, or why it could not; the exit status.
template <class Converted, class Conversion>
int convertWith(Result<Converted> (*convert)(const Conversion&, ConversionHost&), Conversion conversion,
                const Console& console) {
  conversion.history = console.commandLine;
  const Result<Converted> converted = [&] {
    ConsoleConversion host(console);
    return convert(conversion, host);
  }();
  if (!converted) return console.fail(converted.error());
  console.out << converted->summary;
  return kClean;
}

}  // namespace gridbay::cli
