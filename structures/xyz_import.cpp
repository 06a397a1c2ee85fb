#include "structures/xyz_import.h"

#include <fast_float/fast_float.h>
#include <fmt/format.h>

#include <charconv>
#include <cmath>

#include "platform/files/line_reader.h"
#include "structures/page_texts.h"

namespace gridbay {
namespace {

bool isWhite(char c) {
  return c == ' ' || (c >= '\t' && c <= '\r');
}

bool isHexadecimal(std::string_view text) {
  return text.size() >= 2 && text[0] == '0' && (text[1] | 0x20) == 'x';
}

// A hexadecimal number behind its "0x"; what is too large is infinite, what is too small is 0.
std::from_chars_result hexadecimal(const char* first, const char* last, double& number) {
  constexpr std::string_view kStarts = "0123456789abcdefABCDEF.";
  if (first == last || kStarts.find(*first) == kStarts.npos) return {first, std::errc::invalid_argument};
  const std::from_chars_result read = std::from_chars(first, last, number, std::chars_format::hex);
  if (read.ec == std::errc::result_out_of_range) {
    const std::string_view text(first, static_cast<std::size_t>(read.ptr - first));
    number = text.find("p-") == text.npos && text.find("P-") == text.npos ? HUGE_VAL : 0.0;
  }
  return read;
}

// Numbers at the front of a line, one after the other, as the form "%lf %lf %lf %[^\n]" has them.
class NumberScan {
 public:
  explicit NumberScan(std::string_view line) : at_(line.data()), end_(line.data() + line.size()) {}

  // False, with the number as it was, where there is none.
  bool next(double& number) {
    while (at_ != end_ && isWhite(*at_)) ++at_;
    const char* digits = at_;
    const bool isNegative = digits != end_ && *digits == '-';
    if (digits != end_ && (*digits == '-' || *digits == '+')) ++digits;
    if (digits == end_ || *digits == '-') return false;
    double read = 0;
    const char* rest = nullptr;
    std::errc error{};
    if (isHexadecimal({digits, static_cast<std::size_t>(end_ - digits)})) {
      const std::from_chars_result result = hexadecimal(digits + 2, end_, read);
      rest = result.ptr;
      error = result.ec;
    } else {
      const fast_float::from_chars_result result = fast_float::from_chars(digits, end_, read);
      rest = result.ptr;
      error = result.ec;
    }
    if (error == std::errc::invalid_argument) return false;
    number = isNegative ? -read : read;
    at_ = rest;
    return true;
  }
  bool isAtEnd() const { return at_ == end_; }

 private:
  const char* at_;
  const char* end_;
};

UnitScale scaleTo(int itemCode, int fromUnit) {
  const QunUnit* base = qunBaseUnit(itemCode);
  if (base == nullptr || base->code == fromUnit) return {};
  const CVdUnitConverter converter(fromUnit, base->code);
  const double offset = converter.Convert(0);
  return {converter.Convert(1) - offset, offset};
}

std::int32_t chosenUnit(const UnitChoices& units, int itemCode) {
  const QunUnit* unit = units.unitOf(itemCode);
  return unit == nullptr ? 0 : unit->code;
}

Choices unitsOf(int itemCode) {
  Choices choices;
  for (const int code : qunFindItem(itemCode)->units) {
    const QunUnit* unit = qunFindUnit(code);
    choices.Add({code, fmt::format("{} ({})", unit->name, unit->symbol)});
  }
  return choices;
}

}  // namespace

XyzScales xyzScales(int xyUnit, int zUnit) {
  return {scaleTo(item::kGeographicalCoordinate, xyUnit), scaleTo(item::kElevation, zUnit)};
}

XyzOutcome importXyz(const std::string& path, const XyzScales& scales, SharedArray<DikePoint>& points,
                     const Progress& progress) {
  Result<LineReader> reader = LineReader::open(path, progress);
  if (!reader) return XyzOutcome::success;
  SharedArray<DikePoint> all = points;
  while (const std::optional<std::string_view> line = reader->next()) {
    NumberScan scan(*line);
    DikePoint point;
    if (!scan.next(point.x) || !scan.next(point.y)) return XyzOutcome::illegal;
    scan.next(point.z);
    if (reader->isCut() && scan.isAtEnd()) return XyzOutcome::illegal;
    all.push_back({scales.xy(point.x), scales.xy(point.y), scales.z(point.z)});
  }
  if (reader->isStopped()) return XyzOutcome::stopped;
  if (reader->hasFailed()) return XyzOutcome::illegal;
  points = std::move(all);
  return XyzOutcome::success;
}

CXyzGeoConvertDlg::CXyzGeoConvertDlg(const UnitChoices& units)
    : xyUnit_(chosenUnit(units, item::kGeographicalCoordinate)),
      zUnit_(chosenUnit(units, item::kBathymetry)) {
  const auto held = [](std::int32_t& unit) {
    return Binding<std::int32_t>{.get = [&unit] { return std::optional(unit); },
                                 .set = [&unit](std::int32_t code) { unit = code; }};
  };
  form_.List("Unit of X and Y:", unitsOf(item::kGeographicalCoordinate), held(xyUnit_));
  form_.List("Unit of Z:", unitsOf(item::kBathymetry), held(zUnit_));
  form_.SetDefaultHandler([this] {
    form_.store({});
    form_.save();
  });
}

int CXyzGeoConvertDlg::DoModal(SetupHost& host) {
  form_.load();
  form_.show({});
  const FileQuestion question{texts::xyzTitle.format, texts::xyzFile.filter, texts::xyzFile.extension, "xyz"};
  return host.chooseFileWithForm(question, form_, &fileName_) ? 1 : 0;
}

}  // namespace gridbay
