#include "hydrodynamic/sine_series_dialog.h"

#include "hydrodynamic/page_texts.h"
#include "pages/scan.h"

namespace gridbay {

using Object = CNhdBoundaryObjectKvs;

std::string sineText(const Object& object, const CVdEditStyle& style) {
  return formatted(texts::sineText, style.UnitConvertFromBase(object.range / 2, 1), double{object.phase},
                   double{object.period}, style.UnitConvertFromBase(object.referenceLevel, 1));
}

Stored storeSineText(Object& object, std::string_view text, const CVdEditStyle& style) {
  float amplitude = 0;
  float reference = 0;
  const int read =
      scan(text, texts::sineForm.format, {&amplitude, &object.phase, &object.period, &reference});
  object.range = static_cast<float>(style.UnitConvertFromBase(2.0 * amplitude, 0));
  object.referenceLevel = static_cast<float>(style.UnitConvertFromBase(reference, 0));
  return read == 4 ? Stored::taken : Stored::partly;
}

CNhdSineSeriesDlg::CNhdSineSeriesDlg(CVdDoc& document, const Object& object)
    : CV27SetupDialog(document, texts::sineTitle.format) {
  copy_.copyWhole(object);
  const auto copy = [this]() -> Object& { return copy_; };
  form().Number("Reference level:", copy, &Object::referenceLevel, object.quantity());
  form().Number("Range", copy, &Object::range, object.quantity());
  form().Number("Period", copy, &Object::period);
  form().Number("Phase", copy, &Object::phase);
}

void CNhdSineSeriesDlg::OnOK(Object& object) const {
  for (float Object::*value : {&Object::referenceLevel, &Object::range, &Object::period, &Object::phase})
    object.*value = copy_.*value;
}

}  // namespace gridbay
