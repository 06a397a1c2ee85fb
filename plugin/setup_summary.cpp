#include "plugin/setup_summary.h"

#include <fmt/format.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "platform/units/units.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

using Line = SetupSummary::Line;

Line line(PageId page, std::string subject, std::string text, bool isKnown = true) {
  return {static_cast<std::int32_t>(page), std::move(subject), std::move(text), isKnown};
}

std::string spacingOf(const CBathymetryObjectKvs& area) {
  return area.dx == area.dy ? fmt::format("{:.6g} m apart", area.dx)
                            : fmt::format("{:.6g} m and {:.6g} m apart", area.dx, area.dy);
}

Line lineOf(const CBathymetryObjectKvs& area, int number) {
  const std::string subject = fmt::format("Area {}", number);
  if (area.fileName.empty()) return line(PageId::bathymetry, subject, "no file chosen", false);
  const std::string place = number == 1 ? ""
                                        : fmt::format(", from ({},{}) of Area {}", area.origin.j,
                                                      area.origin.k, area.enclosingArea);
  if (!area.isRead())
    return line(PageId::bathymetry, subject, area.fileName.text() + place + ", not read yet", false);
  return line(PageId::bathymetry, subject,
              fmt::format("{} x {} points, {}{}, {}", area.noJ, area.noK, spacingOf(area), place,
                          area.fileName.text()));
}

Line periodOf(const CSimulationPeriodKvs& period, const UnitChoices& units) {
  const CVdEditStyle style = CVdEditStyle(units).SetQunUnitBaseGroup(item::kTimeStep);
  const QunUnit* unit = units.unitOf(item::kTimeStep);
  const std::int64_t steps = std::int64_t{period.noPointsInTime} - 1;
  return line(PageId::simulationPeriod, "Period",
              fmt::format("{} to {}, {} step{} of {:.6g} {}", dateTimeText(period.start),
                          dateTimeText(period.End()), steps, steps == 1 ? "" : "s",
                          style.UnitConvertFromBase(double{period.timeStepInterval}, 1), unit->symbol));
}

Line courantOf(const CBathymetryKvs& areas, const CSimulationPeriodKvs& period, bool gridsAreRead) {
  constexpr const char* kSubject = "Greatest Courant number";
  if (!gridsAreRead)
    return line(PageId::simulationPeriod, kSubject, "not known until the grids are read", false);
  double courant = 0;
  int area = 0;
  areas.GetMaxCourant(double{period.timeStepInterval}, &courant, &area);
  if (area == 0) return line(PageId::simulationPeriod, kSubject, "no point lies below 0", false);
  return line(PageId::simulationPeriod, kSubject, fmt::format("{:.3g} in Area {}", courant, area));
}

// The texts of a list's first items, and how many there are besides.
std::string firstOf(const auto& list) {
  constexpr int kMost = 3;
  std::string text;
  for (int number = 1; number <= std::min(kMost, list.GetCount()); ++number)
    text += (number == 1 ? ": " : ", ") + list.GetItem(number)->Text();
  while (text.ends_with(' ')) text.pop_back();
  if (list.GetCount() > kMost) text += fmt::format(" and {} more", list.GetCount() - kMost);
  return text;
}

}  // namespace

SetupSummary summaryOf(CGlobalKvs& model, const UnitChoices& units) {
  SetupSummary summary;
  const CBathymetryKvs& areas = *model.bathymetry;
  summary.gridsAreRead = areas.GetCount() > 0;
  for (int number = 1; number <= areas.GetCount(); ++number) {
    summary.lines.push_back(lineOf(*areas.GetItem(number), number));
    summary.gridsAreRead = summary.gridsAreRead && areas.GetItem(number)->isRead();
  }
  summary.period = {model.simulationPeriod->start, model.simulationPeriod->End()};
  summary.lines.push_back(periodOf(*model.simulationPeriod, units));
  summary.lines.push_back(courantOf(areas, *model.simulationPeriod, summary.gridsAreRead));
  const CBoundaryKvs& boundaries = *model.boundary;
  summary.lines.push_back(
      line(PageId::boundary, "Open boundaries",
           fmt::format("{}, {}{}", boundaries.GetCount(),
                       boundaries.defaultPosition == 0 ? "user specified" : "program detected",
                       firstOf(boundaries))));
  const CSourceSinkKvs& sources = *model.sourceSink;
  summary.lines.push_back(line(PageId::sourceAndSink, "Sources and sinks",
                               fmt::format("{}{}", sources.GetCount(), firstOf(sources))));
  return summary;
}

}  // namespace gridbay
