#include "basic/source_sink_page.h"

#include "basic/basic_parts.h"
#include "basic/source_sink.h"

namespace gridbay {

void CSourceSinkGrid::LayOut() {
  constexpr int kTypeWidth = 125;
  constexpr int kWidth = 75;
  using Entry = CSourceSinkObjectKvs;
  const auto entry = RowsOf(&BasicParts::sourceSink);
  const auto end = [&](const char* header, GridPoint Entry::*point, std::int32_t Entry::*area,
                       std::int32_t offType) {
    const auto isOn = [entry, offType](GridRow row) { return entry(row)->type != offType; };
    // A place on a map has an area too, the finest there.
    const auto wanted = [=](GridRow row) {
      const Entry& held = *entry(row);
      return std::optional(CellPick{.of = CellPick::Of::finest,
                                    .area = held.*area,
                                    .held = {{.area = held.*area, .point = held.*point}}});
    };
    const auto take = [=](GridRow row, std::span<const PickedPlace> places) {
      entry(row)->*point = places.front().point;
      entry(row)->*area = places.front().area;
      return Stored::taken;
    };
    Point(header, kWidth, entry, point)
        .EnabledIf(isOn)
        .SubHeader("Point")
        .HeaderSpan(2)
        .Picks({wanted, take});
    PlainInteger("", kWidth, entry, area).Static().EnabledIf(isOn).SubHeader("Area");
  };
  List("Type", kTypeWidth, entry, &Entry::type,
       Choices::numbered({"Isolated Source", "Isolated Sink", "Source and Sink pair"}));
  end("Source", &Entry::source, &Entry::sourceArea, Entry::kIsolatedSink);
  end("Sink", &Entry::sink, &Entry::sinkArea, Entry::kIsolatedSource);
}

void CSourceSinkDlg::DoDataExchange(Form& form) {
  constexpr int kMost = 65535;
  constexpr int kHighestSpin = 32767;
  form.Count("Number of source sink pairs", countOf(objectOf(&BasicParts::sourceSink)), kMost, kHighestSpin);
  form.Grid("Sources and sinks", grid_);
}

}  // namespace gridbay
