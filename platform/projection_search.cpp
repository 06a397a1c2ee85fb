#include "platform/projection_search.h"

#include <fmt/format.h>
#include <proj.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <memory>
#include <optional>
#include <span>
#include <tuple>

#include "platform/cartography/cartography.h"

namespace gridbay {
namespace {

struct FreeContext {
  void operator()(PJ_CONTEXT* context) const { proj_context_destroy(context); }
};
struct FreeParameters {
  void operator()(PROJ_CRS_LIST_PARAMETERS* parameters) const {
    proj_get_crs_list_parameters_destroy(parameters);
  }
};
struct FreeList {
  void operator()(PROJ_CRS_INFO** list) const { proj_crs_info_list_destroy(list); }
};

void ignoreLog(void*, int, const char*) {}

bool isLetter(char c) {
  return (c >= 'a' && c <= 'z') || static_cast<unsigned char>(c) >= 0x80;
}
bool isDigit(char c) {
  return c >= '0' && c <= '9';
}

// Its words in lower case, a blank before each; a number behind letters is a word of its own.
std::string wordsOf(std::string_view text) {
  std::string words;
  char before = ' ';
  for (char c : text) {
    if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    const bool isPart = isLetter(c) || isDigit(c);
    const bool begins =
        isPart && (!(isLetter(before) || isDigit(before)) || (isDigit(c) && isLetter(before)));
    if (begins) words += ' ';
    if (isPart) words += c;
    before = c;
  }
  return words;
}

// Each with the blank before it.
std::vector<std::string_view> eachOf(std::string_view words) {
  std::vector<std::string_view> each;
  while (!words.empty()) {
    const std::size_t end = std::min(words.find(' ', 1), words.size());
    each.push_back(words.substr(0, end));
    words.remove_prefix(end);
  }
  return each;
}

struct Entry {
  KnownProjection known;
  int authority;  // 0 for the EPSG's own
  int number;     // of its code
  bool isProjected;
  std::string nameWords;  // of name and code
  std::string areaWords;
};

std::optional<Entry> entryOf(const PROJ_CRS_INFO& info) {
  const bool isProjected = info.type == PJ_TYPE_PROJECTED_CRS;
  const std::string_view planet = info.celestial_body_name == nullptr ? "" : info.celestial_body_name;
  if ((!isProjected && info.type != PJ_TYPE_GEOGRAPHIC_2D_CRS) || info.deprecated != 0 || planet != "Earth")
    return std::nullopt;
  const std::string_view authority = info.auth_name;
  const std::string_view code = info.code;
  Entry entry{.known = {fmt::format("{}:{}", authority, code), info.name,
                        info.area_name == nullptr ? "" : info.area_name},
              .authority = authority == "EPSG" ? 0 : 1,
              .number = 0,
              .isProjected = isProjected,
              .nameWords = {},
              .areaWords = {}};
  std::from_chars(code.data(), code.data() + code.size(), entry.number);
  entry.nameWords = wordsOf(entry.known.name + ' ' + entry.known.code);
  entry.areaWords = wordsOf(entry.known.area);
  return entry;
}

std::vector<Entry> readDatabase() {
  const std::unique_ptr<PJ_CONTEXT, FreeContext> context(proj_context_create());
  proj_log_func(context.get(), nullptr, ignoreLog);
  const std::unique_ptr<PROJ_CRS_LIST_PARAMETERS, FreeParameters> parameters(
      proj_get_crs_list_parameters_create());
  const std::array<PJ_TYPE, 2> types{PJ_TYPE_PROJECTED_CRS, PJ_TYPE_GEOGRAPHIC_2D_CRS};
  parameters->types = types.data();
  parameters->typesCount = types.size();
  int count = 0;
  const std::unique_ptr<PROJ_CRS_INFO*, FreeList> list(
      proj_get_crs_info_list_from_database(context.get(), nullptr, parameters.get(), &count));
  std::vector<Entry> entries;
  for (int i = 0; i < count; ++i) {
    if (std::optional<Entry> entry = entryOf(*list.get()[i])) entries.push_back(std::move(*entry));
  }
  return entries;
}

const std::vector<Entry>& database() {
  static const std::vector<Entry> entries = readDatabase();
  return entries;
}

// How well an entry answers, less being better; nothing where it does not. First who has the number itself,
// then who has all words in code and name, as whole words rather than beginnings.
using Rank = std::tuple<bool, bool, int, int, bool, bool, std::size_t, int>;

std::optional<Rank> rankOf(const Entry& entry, std::span<const std::string_view> wanted) {
  bool isCode = false;
  int outsideName = 0;
  int begun = 0;
  for (const std::string_view word : wanted) {
    isCode = isCode || word.substr(1) == fmt::format_int(entry.number).c_str();
    std::string_view words = entry.nameWords;
    std::size_t at = words.find(word);
    if (at == words.npos) {
      words = entry.areaWords;
      at = words.find(word);
      if (at == words.npos) return std::nullopt;
      ++outsideName;
    }
    const std::size_t end = at + word.size();
    // "32" is the zone 32N as much as the zone 32.
    const bool isWhole =
        end == words.size() || words[end] == ' ' || (isDigit(word.back()) && isLetter(words[end]));
    if (!isWhole) ++begun;
  }
  return Rank{!isCode,
              entry.authority != 0,
              outsideName,
              begun,
              !entry.isProjected,
              !entry.known.name.starts_with("WGS 84"),
              entry.known.name.size(),
              entry.number};
}

}  // namespace

std::vector<KnownProjection> findProjections(std::string_view words, std::size_t most) {
  const std::string text = wordsOf(words);
  const std::vector<std::string_view> wanted = eachOf(text);
  if (wanted.empty()) return {};
  std::vector<std::pair<Rank, const Entry*>> found;
  for (const Entry& entry : database()) {
    if (const std::optional<Rank> rank = rankOf(entry, wanted)) found.emplace_back(*rank, &entry);
  }
  const std::size_t count = std::min(most, found.size());
  std::ranges::partial_sort(found, found.begin() + static_cast<std::ptrdiff_t>(count));
  std::vector<KnownProjection> best;
  for (std::size_t i = 0; i < count; ++i) best.push_back(found[i].second->known);
  return best;
}

Result<std::string> projectionText(std::string_view code) {
  if (CVdMapProjection::IsLocal(code)) return std::string(code);
  const bool isNumber = std::ranges::all_of(code, isDigit);
  const CVdMapProjection projection(isNumber ? fmt::format("EPSG:{}", code) : code);
  const Failure unknown{fmt::format("\"{}\" is no projection that is known", code)};
  if (!projection.IsValid()) return unknown;
  constexpr std::string_view kZone = "WGS 84 / UTM zone ";
  const std::string name = projection.Name();
  // The library takes a part of any name for the whole.
  if (!isNumber && !code.starts_with("UTM-") && code.find_first_of(":[+=") == code.npos &&
      wordsOf(code) != wordsOf(name))
    return unknown;
  if (name.starts_with(kZone) && name.ends_with('N'))
    return "UTM-" + name.substr(kZone.size(), name.size() - kZone.size() - 1);
  const std::string text = projection.GetProjectionString();
  if (CVdMapProjection(text).IsValid()) return text;
  return Failure{fmt::format("\"{}\" has no text that a file can hold", code)};
}

}  // namespace gridbay
