#pragma once

#include <string>

#include "pages/cell_grid.h"

namespace gridbay {

// The values of all entries by area: a title row for each entry, and below it a row for each area. `Entry` is
// an AreaValuesKvs.
template <class Entry>
class AreaValuesGrid : public BandedGrid {
 public:
  RowLook GetRowLook(int row) override {
    constexpr double kTitleHeight = 1.5;
    RowLook look = BandedGrid::GetRowLook(row);
    if (rowAt(row).sub == 0) look.height = kTitleHeight;
    return look;
  }

 protected:
  virtual int EntryCount() = 0;
  virtual Entry* EntryAt(int number) = 0;
  // The item code of the entry's values.
  virtual int Quantity(int number) = 0;
  // The tool tip of a value; empty for that of its quantity.
  virtual std::string ValueTip(int) { return {}; }
  // Whether there is a column with the unit of the values, and what it says.
  virtual bool HasUnits() { return false; }
  virtual std::string UnitOf(int) { return {}; }
  // What a value is given as, the constant first; and the kind of the file for any other.
  virtual Choices Formats() = 0;
  virtual FileKind KindOfFile(std::int32_t format) = 0;
  // The row whose format and constant hold in this one.
  virtual GridRow FormatRow(GridRow row) { return row; }

  int BandSize(int item) override {
    const Entry* entry = EntryAt(item);
    return entry == nullptr ? 0 : entry->GetCount();
  }
  // All have a value for each area, so that a row is found at once in a list of many.
  int dataRows() override { return EntryCount() * (1 + BandSize(1)); }
  GridRow rowAt(int n) override {
    const int size = 1 + BandSize(1);
    return {(n - 1) / size + 1, (n - 1) % size};
  }
  std::string CornerHeader() override { return "Area"; }
  int RowHeaderWidth() override { return 50; }

 private:
  void LayOut() override {
    Rows([this] { return EntryCount(); });
    const auto value = [this](GridRow row) {
      Entry* entry = EntryAt(row.item);
      return entry == nullptr ? nullptr : entry->GetItem(row.sub);
    };
    using AreaValue = std::remove_pointer_t<decltype(value(GridRow{}))>;
    const auto given = [this, value](GridRow row) { return value(FormatRow(row)); };
    const auto isFile = [given, formats = Formats()](GridRow row) {
      const AreaValue* held = given(row);
      return held != nullptr && formats.placeOf(held->format) > 0;
    };
    const auto kind = [this, given](GridRow row) { return KindOfFile(given(row)->format); };
    const auto request = [value](CVdFileSelectorDlg& selector, GridRow row) {
      value(row)->RequestDataFile(selector, row.item, row.sub);
    };
    List("Type", 100, given, &AreaValue::format, Formats());
    Column& constant =
        Number("Value", 60, given, &AreaValue::value, [this](GridRow row) {
          return Quantity(row.item);
        }).EnabledIf([given](GridRow row) { return given(row)->format == AreaValue::kConstant; });
    constant.Tip([this, ofQuantity = constant.tip](GridRow row) {
      const std::string tip = ValueTip(row.item);
      return tip.empty() ? ofQuantity(row) : tip;
    });
    if (HasUnits()) Shown("Unit", 60, [this](GridRow row) { return UnitOf(row.item); });
    File({.file = fileOf(value, &AreaValue::file, kind, request), .enabled = isFile});
  }
};

}  // namespace gridbay
