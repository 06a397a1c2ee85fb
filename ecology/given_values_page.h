#pragma once

#include <string>

#include "ecology/ecology_parts.h"
#include "ecology/page_texts.h"
#include "ecology/variable_headers.h"
#include "pages/cell_grid.h"

namespace gridbay {

// The columns that constants and forcings have in common, over `list`, a member of the module's parts. What
// belongs to the areas below an item stands in rows of their own (`sub` from 1).
template <class Grid>
class GivenGrid : public Grid {
 protected:
  std::string CornerHeader() override { return "No."; }
  int RowHeaderWidth() override { return 40; }

  // How an item is given when it is the user's.
  template <class Item>
  void ListDeclared(Item* (*item)(EcologyParts&, int), const std::function<Choices(Item&)>& choices) {
    // Null in the rows of areas.
    const auto ofRow = [this, item](GridRow row) -> Item* {
      return row.sub == 0 ? item(this->template parts<EcologyParts>(), row.item) : nullptr;
    };
    const auto declaration = [ofRow](GridRow row) -> const CSolverItem* {
      const Item* held = ofRow(row);
      return held == nullptr ? nullptr : held->Declaration();
    };
    const auto isUsers = [ofRow](GridRow row) {
      const Item* held = ofRow(row);
      return held != nullptr && held->IsUserSpecified();
    };
    const auto isChosen = [ofRow, choices](GridRow row) {
      Item* held = ofRow(row);
      return held != nullptr && held->IsUserSpecified() && choices(*held).texts().size() > 1;
    };
    const auto isConstant = [ofRow, isUsers](GridRow row) {
      return isUsers(row) && ofRow(row)->IsConstant();
    };
    const auto shown = [declaration](std::string CSolverItem::*text) {
      return [declaration, text](GridRow row) {
        const CSolverItem* declared = declaration(row);
        return declared == nullptr ? std::string() : declared->*text;
      };
    };

    this->Shown("Symbol", 90,
                [shown](GridRow row) {
                  return row.sub == 0 ? shown(&CSolverItem::symbol)(row) : formatted(texts::areaRow, row.sub);
                })
        .Tip([shown](GridRow row) {
          return CVdDoc::GetToolTipsString(shown(&CSolverItem::documentation)(row));
        });
    this->Shown("Description", 200, shown(&CSolverItem::description)).Tip([shown](GridRow row) {
      return CVdDoc::GetToolTipsString(shown(&CSolverItem::onlineHelp)(row));
    });
    this->List("Type", 80, ofRow, &Item::format,
               [ofRow, choices](GridRow row) {
                 Item* held = ofRow(row);
                 if (held == nullptr) return Choices();
                 return held->IsUserSpecified() ? choices(*held)
                                                : Choices{{Item::kConstant, "Built-in"}}.Otherwise(0);
               })
        .ReadOnlyIf([isChosen](GridRow row) { return !isChosen(row); });
    this->Number("Value", 60, ofRow, &Item::value,
                 [declaration](GridRow row) {
                   const CSolverItem* declared = declaration(row);
                   return declared == nullptr ? 0 : declared->Quantity();
                 })
        .EnabledIf(isConstant)
        .Tip([this, declaration](GridRow row) {
          return rangeTip(declaration(row), this->document().units());
        });
    this->Shown(
            "Unit", 70,
            [this, declaration](GridRow row) { return unitText(declaration(row), this->document().units()); })
        .EnabledIf(isUsers)
        .Tip(
            [this, declaration](GridRow row) { return unitTip(declaration(row), this->document().units()); });
  }
};

}  // namespace gridbay
