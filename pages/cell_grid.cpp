#include "pages/cell_grid.h"

#include <fmt/format.h>

#include <algorithm>
#include <charconv>
#include <utility>

#include "pages/part_pick.h"
#include "pages/scan.h"

namespace gridbay {
namespace {

// The look of a button in a column of files: a row that has no file has no button.
auto blankWithout(const FileChoice& file) {
  return [file](GridRow row, CellStyle& style) {
    if (file.file(row).name != nullptr) return;
    style.kind = CellKind::label;
    style.value.clear();
    style.enabled = false;
  };
}

}  // namespace

Column& Column::OfArea(std::function<std::int32_t(GridRow)> area) {
  pick.wanted = [area = std::move(area), before = std::move(pick.wanted)](GridRow row) {
    std::optional<CellPick> wanted = before(row);
    if (wanted) wanted->area = area(row);
    return wanted;
  };
  return *this;
}

Column& Column::OnBorder() {
  pick.wanted = [before = std::move(pick.wanted)](GridRow row) {
    std::optional<CellPick> wanted = before(row);
    if (wanted) wanted->of = CellPick::Of::border;
    return wanted;
  };
  return *this;
}

const std::vector<std::deque<Column>>& CellGrid::lines() {
  const int key = LayoutKey();
  if (std::exchange(stale_, false) || key != key_) {
    key_ = key;
    lines_.assign(1, {});
    LayOut();
  }
  return lines_;
}

Column& CellGrid::Add(Column column) {
  return lines_.back().emplace_back(std::move(column));
}

Column& CellGrid::Shown(std::string_view header, int width, std::function<std::string(GridRow)> text) {
  return Add({.header = std::string(header), .width = width, .get = std::move(text)});
}

Column& CellGrid::Label(ByRow<std::string> text) {
  return Add({.kind = CellKind::label, .get = std::move(text)});
}

Column& CellGrid::Button(std::string_view face, int width, std::function<void(GridRow)> press) {
  return Add({.width = width,
              .kind = CellKind::button,
              .get = [text = std::string(face)](GridRow) { return text; },
              .press = std::move(press)});
}

// A text that still shows the number keeps all of its digits.
Column& CellGrid::Number(std::string_view header, int width, RealGetter get, RealSetter set,
                         ByRow<int> quantity) {
  const auto style = [this, quantity](GridRow row) {
    return CVdEditStyle(document().units()).SetQunUnitBaseGroup(quantity(row));
  };
  const auto shown = [get, style](GridRow row) {
    const std::optional<double> held = get(row);
    return held ? style(row).Text(*held) : std::string();
  };
  const auto store = [get, set, style, shown](GridRow row, std::string_view text) {
    if (!get(row)) return Stored::refused;
    if (text == shown(row)) return Stored::taken;
    const std::optional<double> typed = scannedReal(text);
    if (!typed || !set(row, style(row).UnitConvertFromBase(*typed, 0))) return Stored::refused;
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .get = shown,
              .set = store,
              .enabled = [get](GridRow row) { return get(row).has_value(); },
              .tip = [style](GridRow row) { return style(row).GetQunToolTipText(); }})
      .Right();
}

Column& CellGrid::addInteger(std::string_view header, int width, Getter get, Setter set, bool plainly) {
  const auto store = [get, set, plainly](GridRow row, std::string_view text) {
    const std::optional<std::int32_t> typed = plainly ? plainInteger(text) : scannedInteger(text);
    if (!typed || !get(row)) return Stored::refused;
    set(row, *typed);
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .get =
                  [get](GridRow row) {
                    const std::optional<std::int32_t> held = get(row);
                    return held ? std::to_string(*held) : std::string();
                  },
              .set = store,
              .enabled = [get](GridRow row) { return get(row).has_value(); }});
}

Column& CellGrid::addText(std::string_view header, int width, std::function<std::string*(GridRow)> text) {
  const auto store = [text](GridRow row, std::string_view typed) {
    std::string* held = text(row);
    if (held == nullptr) return Stored::refused;
    *held = typed;
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .get =
                  [text](GridRow row) {
                    const std::string* held = text(row);
                    return held == nullptr ? std::string() : *held;
                  },
              .set = store,
              .enabled = [text](GridRow row) { return text(row) != nullptr; }});
}

Column& CellGrid::List(std::string_view header, int width, Getter get, Setter set, ByRow<Choices> choices) {
  const auto store = [get, set, choices](GridRow row, std::string_view text) {
    const Choices offered = choices(row);
    const int place = offered.placeOfText(text);
    if (place < 0 || !get(row)) return Stored::refused;
    set(row, *offered.valueAt(place));
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .kind = CellKind::dropDown,
              .get =
                  [get, choices](GridRow row) {
                    const std::optional<std::int32_t> held = get(row);
                    return held ? choices(row).textOf(*held) : std::string();
                  },
              .set = store,
              .choices = choices,
              .enabled = [get](GridRow row) { return get(row).has_value(); }});
}

Column& CellGrid::MultiChoice(std::string_view header, int width, std::function<std::int64_t(GridRow)> get,
                              std::function<void(GridRow, std::int64_t)> set, ByRow<Choices> choices) {
  const auto store = [set, choices](GridRow row, std::string_view text) {
    constexpr std::size_t kMostBits = 62;
    std::int64_t bits = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), bits);
    const std::size_t offered = std::min(choices(row).texts().size(), kMostBits);
    const bool isSum = error == std::errc() && end == text.data() + text.size();
    if (!isSum || bits < 0 || bits >= std::int64_t{1} << offered) return Stored::refused;
    set(row, bits);
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .kind = CellKind::multiChoice,
              .get = [get](GridRow row) { return std::to_string(get(row)); },
              .set = store,
              .choices = std::move(choices)});
}

Column& CellGrid::addCheck(std::string_view header, int width, Getter get, Setter set) {
  const auto store = [get, set](GridRow row, std::string_view text) {
    if (!get(row) || (text != "0" && text != "1")) return Stored::refused;
    set(row, text == "1" ? 1 : 0);
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .kind = CellKind::checkBox,
              .get = [get](GridRow row) { return get(row).value_or(0) != 0 ? "1" : "0"; },
              .set = store,
              .enabled = [get](GridRow row) { return get(row).has_value(); }});
}

Column& CellGrid::addPoint(std::string_view header, int width, std::function<GridPoint*(GridRow)> point) {
  const auto store = [point](GridRow row, std::string_view text) {
    const std::optional<GridPoint> typed = scannedPoint(text);
    GridPoint* held = point(row);
    if (!typed || held == nullptr) return Stored::refused;
    *held = *typed;
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .get =
                  [point](GridRow row) {
                    const GridPoint* held = point(row);
                    return held == nullptr ? std::string() : pointText(*held);
                  },
              .set = store,
              .enabled = [point](GridRow row) { return point(row) != nullptr; }})
      .Picks({.wanted =
                  [point](GridRow row) {
                    const GridPoint* held = point(row);
                    return held == nullptr ? std::nullopt
                                           : std::optional(CellPick{.held = {{.point = *held}}});
                  },
              .take =
                  [point](GridRow row, std::span<const PickedPlace> places) {
                    *point(row) = places.front().point;
                    return Stored::taken;
                  }});
}

Column::Pick CellGrid::partPick(std::function<USubArea*(GridRow)> part,
                                std::function<std::int32_t(GridRow)> area,
                                std::function<bool(GridRow)> isLine) {
  const auto wanted = [part, area](GridRow row) { return std::optional(pickOfPart(*part(row), area(row))); };
  const auto take = [part, isLine](GridRow row, std::span<const PickedPlace> places) {
    takePart(*part(row), places, isLine && isLine(row));
    return Stored::taken;
  };
  return {wanted, take};
}

Column& CellGrid::Range(std::string_view header, int width, RangeGetter get,
                        std::function<void(GridRow, const USubLine&)> set, bool hasInterval) {
  const auto shown = [get, hasInterval](GridRow row) {
    const std::optional<USubLine> held = get(row);
    if (!held) return std::string();
    return hasInterval ? fmt::format("{}-{},{}", held->first, held->last, held->interval)
                       : fmt::format("{}-{}", held->first, held->last);
  };
  const auto store = [get, set, hasInterval](GridRow row, std::string_view text) {
    std::optional<USubLine> typed = scannedRange(text);
    const std::optional<USubLine> held = get(row);
    if (!typed || !held) return Stored::refused;
    if (!hasInterval) typed->interval = held->interval;
    set(row, *typed);
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .get = shown,
              .set = store,
              .enabled = [get](GridRow row) { return get(row).has_value(); }});
}

Column& CellGrid::FileName(std::string_view header, int width, const FileChoice& file) {
  const auto store = [this, file](GridRow row, std::string_view text) {
    file.type(text, row, document());
    return Stored::taken;
  };
  return Add({.header = std::string(header),
              .width = width,
              .get = [file](GridRow row) { return file.text(row); },
              .set = store,
              .enabled = [file](GridRow row) { return file.file(row).name != nullptr; }})
      .Look([](GridRow, CellStyle& style) {
        if (style.toolTip.empty()) style.toolTip = CVdDoc::GetToolTipsString(style.value);
      });
}

Column& CellGrid::Browse(std::string_view face, int width, const FileChoice& file) {
  const auto choose = [this, file](GridRow row) {
    if (file.choose(row, document())) UpdateDoc();
  };
  return Button(face, width, choose).Look(blankWithout(file));
}

Column& CellGrid::View(std::string_view face, int width, const FileChoice& file, Column::Rule enabled) {
  return Button(face, width, [this, file](GridRow row) { file.view(row, document()); })
      .Look(blankWithout(file))
      .EnabledIf([file, enabled = std::move(enabled)](GridRow row) {
        return (!enabled || enabled(row)) && file.canView(row);
      });
}

Column& CellGrid::File(const FileColumns& columns) {
  Column& name = FileName(columns.header, columns.width, columns.file);
  if (columns.enabled) name.EnabledIf(columns.enabled);
  Browse(columns.browse, columns.browseWidth, columns.file).EnabledIf(columns.enabled);
  if (columns.viewWidth > 0) View(columns.view, columns.viewWidth, columns.file, columns.enabled);
  return name;
}

Column& CellGrid::ResultFile(std::string_view header, int width, const FileChoice& file) {
  Column& column = FileName(header, width, file);
  column.kind = CellKind::resultFile;
  column.fileKind = file.kind;
  return column;
}

bool CellGrid::styleOf(int row, int col, CellStyle& style) {
  const auto [cell, at] = placeOf(row, col);
  if (cell == nullptr) return false;
  style.kind = cell->kind;
  style.align = cell->align;
  if (cell->choices) style.choices = cell->choices(at).texts();
  if (cell->get) style.value = cell->get(at);
  if (cell->tip) style.toolTip = cell->tip(at);
  if (cell->enabled && !cell->enabled(at)) SetDisabled(style);
  const bool isPlain = style.kind != CellKind::button && style.kind != CellKind::label;
  if ((cell->readOnly && cell->readOnly(at)) || (!cell->set && isPlain)) SetReadOnly(style);
  if (cell->look) cell->look(at, style);
  return true;
}

Stored CellGrid::storeCell(int row, int col, std::string_view text) {
  const auto [cell, at] = placeOf(row, col);
  if (cell == nullptr || !cell->set) return Stored::refused;
  const auto [set, follows] = std::pair(cell->set, cell->stored);
  const Stored stored = set(at, text);
  if (stored == Stored::taken && follows) follows(at);
  return stored;
}

void CellGrid::buttonPressed(int row, int col) {
  const auto [cell, at] = placeOf(row, col);
  if (cell == nullptr || !cell->press) return;
  const auto press = cell->press;  // which may have the grid laid out anew
  press(at);
}

std::optional<CellPick> CellGrid::pickOf(int row, int col) {
  const auto [cell, at] = placeOf(row, col);
  return cell == nullptr || !cell->pick.wanted ? std::nullopt : cell->pick.wanted(at);
}

Stored CellGrid::storePick(int row, int col, std::span<const PickedPlace> places) {
  const auto [cell, at] = placeOf(row, col);
  const auto take = cell->pick.take;
  return take(at, places);
}

void CellGrid::setUpResultFile(int row, int col, CVdGridResultFileEditCtrl& control) {
  const auto [cell, at] = placeOf(row, col);
  const FileKind kind = cell->fileKind(at);
  control.SetDialogPara(kind.filter, kind.extension);
}

int ColumnGrid::headerRows() {
  for (const Column& it : columns()) {
    if (!it.subHeader.empty()) return 1;
  }
  return 0;
}

std::string ColumnGrid::GetRowHeader(int row) {
  return row <= headerRows() ? std::string() : RowHeader(rowAt(row - headerRows()));
}

int ColumnGrid::GetColWidth(int col) {
  if (col == 0) return RowHeaderWidth();
  const Column& it = column(col);
  return it.widthNow ? it.widthNow() : it.width;
}

int ColumnGrid::GetHeaderSpan(int col) {
  for (int before = 1; before < col; ++before) {
    if (before + column(before).headerSpan > col) return 0;
  }
  return col == 0 ? 1 : column(col).headerSpan;
}

bool ColumnGrid::styleOf(int row, int col, CellStyle& style) {
  if (row > headerRows()) return CellGrid::styleOf(row, col, style);
  style.kind = CellKind::label;
  style.isHeader = true;
  style.readOnly = true;
  style.value = column(col).subHeader;
  return true;
}

std::optional<CellPick> ColumnGrid::pickOf(int row, int col) {
  return row > headerRows() ? CellGrid::pickOf(row, col) : std::nullopt;
}

Stored ColumnGrid::storeCell(int row, int col, std::string_view text) {
  return row > headerRows() ? CellGrid::storeCell(row, col, text) : Stored::refused;
}

int BandedGrid::dataRows() {
  int rows = 0;
  for (int item = 1; item <= ItemCount(); ++item) rows += 1 + BandSize(item);
  return rows;
}

GridRow BandedGrid::rowAt(int n) {
  int item = 1;
  for (const int items = ItemCount(); item <= items; ++item) {
    const int size = 1 + BandSize(item);
    if (n <= size) break;
    n -= size;
  }
  return {item, n - 1};
}

RowLook BandedGrid::GetRowLook(int row) {
  if (row <= headerRows()) return {};
  const GridRow at = rowAt(row - headerRows());
  return {.lineBelow = at.sub == BandSize(at.item)};
}

bool BandedGrid::styleOf(int row, int col, CellStyle& style) {
  if (!isTitle(row)) return ColumnGrid::styleOf(row, col, style);
  style.kind = CellKind::label;
  style.isHeading = col == 1;
  style.readOnly = true;
  if (col == 1) {
    style.value = BandTitle(rowAt(row - headerRows()).item);
    style.span = GetColCount();
  }
  return true;
}

GridRow BlockGrid::rowAt(int row) {
  const int size = static_cast<int>(lines().size());
  return {(row - 1) / size + 1, (row - 1) % size + 1};
}

CellGrid::Place BlockGrid::placeOf(int row, int col) {
  static const Column kBlank{.kind = CellKind::label};
  const GridRow at = rowAt(row);
  const std::deque<Column>& line = lines()[static_cast<std::size_t>(at.sub) - 1];
  const auto place = static_cast<std::size_t>(col) - 1;
  return {place < line.size() ? &line[place] : &kBlank, at};
}

}  // namespace gridbay
