#include "structures/weir_formula3_dialog.h"

#include "platform/units/units.h"
#include "structures/page_texts.h"

namespace gridbay {
namespace {

struct Field {
  const char* label;
  int quantity = 0;
};
constexpr std::array<Field, 14> kFields{{
    {"Width", item::kLevel},
    {"Height", item::kLevel},
    {"Crest level", item::kLevel},
    {"(hd/hu)i"},
    {"a"},
    {"b"},
    {"p"},
    {"Alpha"},
    {"Beta"},
    {"q"},
    {"Gamma"},
    {"Delta"},
    {"r"},
    {"(hd/hu)s"},
}};

}  // namespace

WeirFormula3Dialog::WeirFormula3Dialog(CVdDoc& document, const Parameters& parameters)
    : CV27SetupDialog(document, texts::weirFormula3Title.format), parameters_(parameters) {
  for (std::size_t place = 0; place < kFields.size(); ++place) {
    form().Number(kFields[place].label,
                  Binding<double>{.get = [this, place] { return parameters_[place]; },
                                  .set = [this, place](double value) { parameters_[place] = value; }},
                  kFields[place].quantity);
  }
  for (const Text& formula :
       {texts::weirFormula3Free, texts::weirFormula3Incomplete, texts::weirFormula3Submerged})
    form().Shown("", [formula] { return std::string(formula.format); });
}

}  // namespace gridbay
