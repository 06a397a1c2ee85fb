#include "shell/map/map_tools.h"

#include <QCoreApplication>
#include <algorithm>
#include <array>

namespace gridbay::shell {
namespace {

constexpr MapClicks kDragged{};
constexpr MapClicks kOne{1, 1};
constexpr MapClicks kBoth{2, 2};
constexpr MapClicks kLine{2, MapClicks::kAny};
constexpr MapClicks kPolygon{3, MapClicks::kAny};

constexpr const char* kRectangle = QT_TRANSLATE_NOOP("Map", "draw a rectangle");
constexpr const char* kPlace = QT_TRANSLATE_NOOP("Map", "click on its place");
constexpr const char* kEnd = QT_TRANSLATE_NOOP("Map", "click on one end");
constexpr const char* kOtherEnd = QT_TRANSLATE_NOOP("Map", "click on the other end");
constexpr const char* kFirst = QT_TRANSLATE_NOOP("Map", "click on the first point");
constexpr const char* kNext = QT_TRANSLATE_NOOP("Map", "click on the next point");

constexpr std::array kTools{
    PlacingTool{MapTool::nestedArea, std::nullopt, kDragged, QT_TRANSLATE_NOOP("Map", "Nested area"), "N",
                kRectangle, "", true},
    PlacingTool{MapTool::source, MapKind::source, kOne, QT_TRANSLATE_NOOP("Map", "Source"), "Q", kPlace, ""},
    PlacingTool{MapTool::pair, MapKind::source, kBoth, QT_TRANSLATE_NOOP("Map", "Source and sink"), "P",
                QT_TRANSLATE_NOOP("Map", "click on the source"),
                QT_TRANSLATE_NOOP("Map", "click on the sink")},
    PlacingTool{MapTool::boundary, MapKind::boundary, kBoth, QT_TRANSLATE_NOOP("Map", "Open boundary"), "B",
                QT_TRANSLATE_NOOP("Map", "click on one end, at the border of area 1"), kOtherEnd},
    PlacingTool{MapTool::massBudget, MapKind::massBudget, kPolygon,
                QT_TRANSLATE_NOOP("Map", "Mass budget polygon"), "M",
                QT_TRANSLATE_NOOP("Map", "click on the first corner"),
                QT_TRANSLATE_NOOP("Map", "click on the next corner"), true},
    PlacingTool{MapTool::dike, MapKind::dike, kLine, QT_TRANSLATE_NOOP("Map", "Dike"), "D", kFirst, kNext},
    PlacingTool{MapTool::weir, MapKind::weir, kLine, QT_TRANSLATE_NOOP("Map", "Weir"), "W", kFirst, kNext},
    PlacingTool{MapTool::culvert, MapKind::culvert, kLine, QT_TRANSLATE_NOOP("Map", "Culvert"), "C", kFirst,
                kNext, true},
    PlacingTool{MapTool::outputPoint, MapKind::outputPoints, kOne, QT_TRANSLATE_NOOP("Map", "Output point"),
                "O", kPlace, ""},
    PlacingTool{MapTool::outputLine, MapKind::outputLine, kBoth, QT_TRANSLATE_NOOP("Map", "Output line"), "L",
                kEnd, kOtherEnd},
    PlacingTool{MapTool::outputArea, MapKind::outputMap, kDragged, QT_TRANSLATE_NOOP("Map", "Output area"),
                "A", kRectangle, "", true},
    PlacingTool{MapTool::moduleOutputPoint, MapKind::outputPoints, kOne,
                QT_TRANSLATE_NOOP("Map", "Module output point"), "Shift+O", kPlace, ""},
    PlacingTool{MapTool::moduleOutputLine, MapKind::outputLine, kBoth,
                QT_TRANSLATE_NOOP("Map", "Module output line"), "Shift+L", kEnd, kOtherEnd},
    PlacingTool{MapTool::moduleOutputArea, MapKind::outputMap, kDragged,
                QT_TRANSLATE_NOOP("Map", "Module output area"), "Shift+A", kRectangle, ""},
    PlacingTool{MapTool::discharge, MapKind::discharge, kBoth, QT_TRANSLATE_NOOP("Map", "Discharge line"),
                "F", kEnd, kOtherEnd},
    PlacingTool{MapTool::box, MapKind::box, kDragged, QT_TRANSLATE_NOOP("Map", "Box"), "X", kRectangle, ""}};

QString translated(const char* text) {
  return QCoreApplication::translate("Map", text);
}

}  // namespace

std::span<const PlacingTool> placingTools() {
  return kTools;
}

const PlacingTool* placingTool(MapTool tool) {
  const auto found = std::ranges::find(kTools, tool, &PlacingTool::tool);
  return found == kTools.end() ? nullptr : &*found;
}

QString hintOf(const QString& name, const QString& action, MapClicks clicks, std::size_t made) {
  QString hint = QString("%1: %2. ").arg(name, action);
  if (made > 0 && made >= clicks.least) hint += translated("Return ends. ");
  return hint + (made > 0 ? translated("Backspace takes the last click back, Esc all.")
                          : translated("Esc puts it down."));
}

QString hintOf(const PlacingTool& tool, std::size_t made) {
  return hintOf(translated(tool.name), translated(made == 0 ? tool.first : tool.next), tool.clicks, made);
}

}  // namespace gridbay::shell
