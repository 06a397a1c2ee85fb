#include "conversion/table_headings.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>

#include "conversion/table_reader.h"
#include "core/nearest.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Fields = std::vector<std::string_view>;

// Bytes that are no UTF-8 are taken for Latin-1.
std::string utf8Of(std::string_view text) {
  std::string clean;
  for (std::size_t i = 0; i < text.size();) {
    std::size_t length = 1;
    const auto byte = static_cast<unsigned char>(text[i]);
    const auto follows = [&](std::size_t n) {
      return i + n < text.size() && (static_cast<unsigned char>(text[i + n]) & 0xC0) == 0x80;
    };
    if (byte >= 0xC2 && byte < 0xE0 && follows(1)) length = 2;
    if (byte >= 0xE0 && byte < 0xF0 && follows(1) && follows(2)) length = 3;
    if (byte >= 0xF0 && byte < 0xF5 && follows(1) && follows(2) && follows(3)) length = 4;
    if (byte < 0x80 || length > 1) {
      clean += text.substr(i, length);
    } else {
      clean += static_cast<char>(0xC0 | (byte >> 6));
      clean += static_cast<char>(0x80 | (byte & 0x3F));
    }
    i += length;
  }
  return clean;
}

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(" \t_,;:#");
  if (first == text.npos) return {};
  return text.substr(first, text.find_last_not_of(" \t_,;:") - first + 1);
}

std::string_view withoutBrackets(std::string_view text) {
  const bool has = text.size() > 1 && ((text.front() == '[' && text.back() == ']') ||
                                       (text.front() == '(' && text.back() == ')'));
  return has ? trimmed(text.substr(1, text.size() - 2)) : text;
}

// "yyyy-mm-dd hh:mm" and the like.
bool isDatePattern(std::string_view text) {
  const std::string small = lowered(text);
  return small.find_first_not_of("ymdhs:/.- t") == small.npos && small.size() > 2;
}

bool isUnits(const Fields& fields) {
  bool hasUnit = false;
  for (const std::string_view field : fields) {
    const std::string_view text = withoutBrackets(trimmed(field));
    const bool isUnit = !unitOfHeading(utf8Of(text)).empty();
    if (!isUnit && !text.empty() && text != "-" && !isDatePattern(text)) return false;
    hasUnit = hasUnit || isUnit;
  }
  return hasUnit;
}

// "Q [m3/s]", "level (m)" and "Flow m3/s" into name and unit.
ColumnHeading headingOf(std::string_view text) {
  text = trimmed(text);
  for (const std::string_view brackets : {"[]", "()"}) {
    const std::size_t open = text.rfind(brackets[0]);
    if (open == text.npos || open == 0 || text.back() != brackets[1]) continue;
    return {std::string(trimmed(text.substr(0, open))),
            std::string(trimmed(text.substr(open + 1, text.size() - open - 2)))};
  }
  const std::size_t blank = text.rfind(' ');
  if (blank != text.npos && text.find('/', blank) != text.npos &&
      !unitOfHeading(text.substr(blank + 1)).empty())
    return {std::string(trimmed(text.substr(0, blank))), std::string(text.substr(blank + 1))};
  return {std::string(text), {}};
}

// Between blanks a heading has words that are parted by one and columns that are parted by more, or else each
// word is a column's.
Fields headingFields(std::string_view line, char separator, std::size_t columns) {
  const std::size_t mark = line.find_first_not_of(" \t#");
  if (mark != line.npos && line.substr(0, mark).find('#') != line.npos) line.remove_prefix(mark);
  Fields fields = tableFields(line, separator, 2);
  if (fields.size() != columns) fields = tableFields(line, separator, 1);
  return fields;
}

struct Word {
  std::string_view part;  // of a name in small letters, between ends of words
  int itemType;
};

// What modellers and gauges call things.
constexpr std::array kWords{
    Word{"water level", item::kWaterLevel},
    Word{"waterlevel", item::kWaterLevel},
    Word{"wl", item::kWaterLevel},
    Word{"stage", item::kWaterLevel},
    Word{"tide", item::kWaterLevel},
    Word{"level", item::kWaterLevel},
    Word{"surface elevation", item::kSurfaceElevation},
    Word{"discharge", item::kDischarge},
    Word{"flow", item::kDischarge},
    Word{"inflow", item::kDischarge},
    Word{"runoff", item::kDischarge},
    Word{"q", item::kDischarge},
    Word{"rain", item::kPrecipitationRate},
    Word{"rainfall", item::kPrecipitationRate},
    Word{"precipitation", item::kPrecipitationRate},
    Word{"evaporation", item::kEvaporationRate},
    Word{"wind speed", item::kWindSpeed},
    Word{"wind velocity", item::kWindVelocity},
    Word{"wind direction", item::kWindDirection},
    Word{"wind dir", item::kWindDirection},
    Word{"water temperature", item::kTemperature},
    Word{"temperature", item::kTemperature},
    Word{"temp", item::kTemperature},
    Word{"salinity", item::kSalinity},
    Word{"air pressure", item::kAirPressure},
    Word{"pressure", item::kAirPressure},
    Word{"significant wave height", item::kSignificantWaveHeight},
    Word{"hs", item::kSignificantWaveHeight},
    Word{"hm 0", item::kSignificantWaveHeight},
    Word{"wave height", item::kWaveHeight},
    Word{"wave period", item::kWavePeriod},
    Word{"tp", item::kWavePeriod},
    Word{"mean wave direction", item::kMeanWaveDirection},
    Word{"wave direction", item::kWaveDirection},
    Word{"current speed", item::kCurrentSpeed},
    Word{"speed", item::kCurrentSpeed},
    Word{"concentration", item::kConcentration},
};

// For a unit alone.
constexpr std::array kByUnit{item::kDischarge,    item::kWaterLevel,        item::kCurrentSpeed,
                             item::kTemperature,  item::kPrecipitationRate, item::kAirPressure,
                             item::kConcentration};

bool fits(int itemType, std::string_view unit) {
  const QunUnit* base = qunBaseUnit(itemType);
  return unit.empty() || (base != nullptr && qunAreEquivalent(unit, base->text));
}

// In small letters, one blank around each word.
std::string wordsOf(std::string_view name) {
  std::string words = " ";
  for (const char c : lowered(name)) {
    const bool isLetter = (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || static_cast<signed char>(c) < 0;
    if (isLetter) {
      words += c;
    } else if (words.back() != ' ') {
      words += ' ';
    }
  }
  return words.back() == ' ' ? words : words + ' ';
}

}  // namespace

std::vector<ColumnHeading> columnHeadings(std::span<const std::string_view> lines, char separator,
                                          std::size_t columns) {
  std::vector<ColumnHeading> headings(columns);
  Fields units;
  for (auto line = lines.rbegin(); line != lines.rend(); ++line) {
    Fields fields = headingFields(*line, separator, columns);
    // Tabs may stand between values below a heading that was set by blanks.
    if (fields.size() == 1 && separator == '\t') fields = headingFields(*line, ' ', columns);
    if (fields.size() != columns) continue;
    if (units.empty() && isUnits(fields)) {
      units = fields;
      continue;
    }
    for (std::size_t i = 0; i < columns; ++i) headings[i] = headingOf(utf8Of(fields[i]));
    break;
  }
  for (std::size_t i = 0; i < columns; ++i) {
    if (!units.empty()) headings[i].unit = withoutBrackets(trimmed(utf8Of(units[i])));
    if (headings[i].name.empty()) headings[i].name = fmt::format("Column {}", i + 1);
  }
  return headings;
}

std::string timeUnitOfHeading(std::string_view name, std::string_view unit) {
  constexpr std::array<std::pair<std::string_view, std::string_view>, 14> kUnits{{{"s", "s"},
                                                                                  {"sec", "s"},
                                                                                  {"secs", "s"},
                                                                                  {"seconds", "s"},
                                                                                  {"min", "min"},
                                                                                  {"mins", "min"},
                                                                                  {"minutes", "min"},
                                                                                  {"h", "h"},
                                                                                  {"hr", "h"},
                                                                                  {"hrs", "h"},
                                                                                  {"hours", "h"},
                                                                                  {"d", "d"},
                                                                                  {"day", "d"},
                                                                                  {"days", "d"}}};
  for (const auto& [text, known] : kUnits) {
    if (lowered(unit) == text ||
        (text.size() > 1 && wordsOf(name).find(fmt::format(" {} ", text)) != std::string::npos))
      return std::string(known);
  }
  return {};
}

std::string unitOfHeading(std::string_view text) {
  struct Change {
    std::string_view from;
    std::string_view to;
  };
  constexpr std::array<Change, 7> kParts{Change{"\xc2\xb2", "2"},
                                         Change{"\xc2\xb3", "3"},
                                         Change{"\xc2\xb0"
                                                "C",
                                                "degC"},
                                         Change{"\xc2\xb0", "degree"},
                                         Change{"/hr", "/h"},
                                         Change{"/sec", "/s"},
                                         Change{"/day", "/d"}};
  constexpr std::array<Change, 6> kWholes{Change{"cumecs", "m3/s"}, Change{"cumec", "m3/s"},
                                          Change{"cms", "m3/s"},    Change{"cfs", "ft3/s"},
                                          Change{"psu", "g/kg"},    Change{"deg", "degree"}};
  std::string unit = utf8Of(text);
  for (const auto& [from, to] : kParts) {
    for (std::size_t at = unit.find(from); at != std::string::npos; at = unit.find(from, at + to.size()))
      unit.replace(at, from.size(), to);
  }
  for (const auto& [from, to] : kWholes) {
    if (lowered(unit) == from) unit = to;
  }
  return !unit.empty() && unit != "-" && qunIsUnit(unit) ? unit : std::string();
}

int itemTypeOfHeading(std::string_view name, std::string_view unit) {
  const std::string small = lowered(name);
  // "Level" is an item type of its own, and seldom meant.
  for (const auto& [part, itemType] : kWords) {
    if (part == small && fits(itemType, unit)) return itemType;
  }
  for (const QunItem& quantity : qunItems()) {
    if (lowered(quantity.name) == small && fits(quantity.code, unit)) return quantity.code;
  }
  const std::string words = wordsOf(name);
  for (const auto& [part, itemType] : kWords) {
    if (words.find(fmt::format(" {} ", part)) != std::string::npos && fits(itemType, unit)) return itemType;
  }
  if (unit.empty()) return 0;
  for (const int itemType : kByUnit) {
    if (fits(itemType, unit)) return itemType;
  }
  return 0;
}

}  // namespace gridbay
