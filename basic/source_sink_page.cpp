#include "basic/source_sink_page.h"

#include <algorithm>
#include <array>

#include "basic/basic_parts.h"
#include "basic/source_sink.h"

namespace gridbay {
namespace {

constexpr int kMostOnPage = 65535;
constexpr int kHighestSpin = 32767;
constexpr std::array<const char*, 5> kSubHeaders{"", "Point", "Area", "Point", "Area"};
const std::vector<std::string>& typeTexts() {
  static const std::vector<std::string> texts{"Isolated Source", "Isolated Sink", "Source and Sink pair"};
  return texts;
}

}  // namespace

void CSourceSinkGrid::Initialize() {
  constexpr int kTypeWidth = 125;
  constexpr int kWidth = 75;
  const auto entry = [this](int n) -> CSourceSinkObjectKvs& {
    return *parts<BasicParts>().sourceSink->GetItem(n);
  };
  const auto isNot = [entry](std::int32_t type) {
    return [entry, type](int n) { return entry(n).type != type; };
  };
  const auto pointColumn = [&](const char* header, GridPoint CSourceSinkObjectKvs::*point,
                               std::int32_t offType) {
    Column column =
        PointColumn(header, kWidth, [entry, point](int n) -> GridPoint& { return entry(n).*point; });
    column.enabled = isNot(offType);
    return column;
  };
  const auto areaColumn = [&](std::int32_t CSourceSinkObjectKvs::*area, std::int32_t offType) {
    return Column{.header = "",
                  .width = kWidth,
                  .kind = CellKind::label,
                  .get = [entry, area](int n) { return std::to_string(entry(n).*area); },
                  .set =
                      [entry, area](int n, std::string_view text) {
                        entry(n).*area = plainInteger(text);
                        return true;
                      },
                  .enabled = isNot(offType)};
  };
  Column type{.header = "Type",
              .width = kTypeWidth,
              .kind = CellKind::dropDown,
              .get =
                  [entry](int n) {
                    const auto t = static_cast<std::size_t>(entry(n).type);
                    return t < typeTexts().size() ? typeTexts()[t] : std::string();
                  },
              .set =
                  [entry](int n, std::string_view text) {
                    const auto found = std::ranges::find(typeTexts(), text);
                    if (found == typeTexts().end()) return false;
                    entry(n).type = static_cast<std::int32_t>(found - typeTexts().begin());
                    return true;
                  },
              .choices = typeTexts()};
  SetColumns(30, {std::move(type),
                  pointColumn("Source", &CSourceSinkObjectKvs::source, CSourceSinkObjectKvs::kIsolatedSink),
                  areaColumn(&CSourceSinkObjectKvs::sourceArea, CSourceSinkObjectKvs::kIsolatedSink),
                  pointColumn("Sink", &CSourceSinkObjectKvs::sink, CSourceSinkObjectKvs::kIsolatedSource),
                  areaColumn(&CSourceSinkObjectKvs::sinkArea, CSourceSinkObjectKvs::kIsolatedSource)});
}

int CSourceSinkGrid::ItemCount() {
  return parts<BasicParts>().sourceSink->GetCount();
}

bool CSourceSinkGrid::styleOf(int row, int col, CellStyle& style) {
  if (row > 1) return ColumnGrid::styleOf(row - 1, col, style);
  style.kind = CellKind::label;
  style.readOnly = true;
  style.value = kSubHeaders[static_cast<std::size_t>(col) - 1];
  return true;
}

bool CSourceSinkGrid::storeCell(int row, int col, std::string_view text) {
  return ColumnGrid::storeCell(row - 1, col, text);
}

void CSourceSinkDlg::DoDataExchange(Form& form) {
  AddCount(form, "Number of source sink pairs", number_, kHighestSpin,
           [this] { return parts<BasicParts>().sourceSink->GetCount(); });
  form.DDX_Control("Sources and sinks", grid_);
}

int CSourceSinkDlg::Initialize() {
  SetUpGrid("Sources and sinks");
  return 1;
}

void CSourceSinkDlg::SetData() {
  number_ = parts<BasicParts>().sourceSink->GetCount();
  UpdateData(false);
}

int CSourceSinkDlg::GetData() {
  if (!UpdateData(true)) return 0;
  if (number_ >= 0 && number_ <= kMostOnPage) parts<BasicParts>().sourceSink->SetNoSources(number_);
  return 1;
}

}  // namespace gridbay
