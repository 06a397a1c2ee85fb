#include "cli/commands.h"
#include "cli/console_conversion.h"
#include "conversion/series_conversion.h"

namespace gridbay::cli {
namespace {

struct SeriesConversionOptions {
  SeriesConversion conversion;
  std::string dateOrder;  // empty for none
};

int doConvertSeries(const SeriesConversionOptions& options, const Console& console) {
  SeriesConversion conversion = options.conversion;
  if (!options.dateOrder.empty()) conversion.dateOrder = dateOrderNames().at(options.dateOrder);
  return convertWith(convertSeries, std::move(conversion), console);
}

}  // namespace

void addConvertSeries(CLI::App& convert, Action& action) {
  std::shared_ptr<SeriesConversionOptions> given;
  CLI::App& command = addCommand(convert, action, "series", "Makes a time series (tsb0) from delimited text",
                                 doConvertSeries, given);
  SeriesConversion* options = &given->conversion;
  command
      .add_option("IN", options->in, "Lines of a time and values, between commas, semicolons, tabs or blanks")
      ->required();
  command.add_option("OUT", options->out, "The time series to write (*.tsb0)")->required();
  addItemType(command, options->itemTypes,
              "the values, which are in its base unit; once for all columns, or once for each (default: as "
              "their names and units say)")
      ->allow_extra_args(false);
  command.add_option("--start", options->start,
                     "The moment of time 0, \"YYYY-MM-DD hh:mm:ss\"; the first column has the times then "
                     "(default: dates, names and units of the table are recognised)");
  command.add_option("--time-unit", options->timeUnit, "Unit of the times: s, min, h, d")
      ->capture_default_str();
  command.add_option("--skip-lines", options->skipLines, "Heading lines; the last one names the columns")
      ->check(finite(0))
      ->capture_default_str();
  command
      .add_option(
          "--missing", options->missing,
          "A number that stands for missing values; may be given several times (default: -9999 and the "
          "like are recognised; with --start no value may be missing)")
      ->allow_extra_args(false);
  command.add_option("--dates", given->dateOrder, "The order of dates that do not tell it themselves")
      ->transform(CLI::IsMember(dateOrderNames(), CLI::ignore_case));
  addForce(command, options->force);
}

}  // namespace gridbay::cli
