#include "advection_dispersion/feedback_page.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/feedback.h"
#include "platform/units/units.h"

namespace gridbay {

// The components by their names, in their order. One without a name has that of a new one.
Choices CNadFeedbackDlg::components() {
  const CNadComponentKvs& list = *parts<AdvectionDispersionParts>().nadComponent;
  Choices choices;
  for (int number = 1; number <= list.GetCount(); ++number) {
    const std::string& name = list.GetItem(number)->name;
    choices.Add({number, name.empty() ? formatted(texts::componentName, number) : name});
  }
  return choices;
}

void CNadFeedbackDlg::DoDataExchange(Form& form) {
  using Feedback = CNadFeedbackKvs;
  const auto feedback = objectOf(&AdvectionDispersionParts::nadFeedback);
  const auto isIncluded = [feedback] { return feedback().isIncluded; };
  const auto term = [&](const char* caption, std::int32_t Feedback::*description, float Feedback::*constant,
                        int quantity, std::int32_t Feedback::*component) {
    const auto is = [feedback, description](std::int32_t wanted) {
      return [feedback, description, wanted] { return feedback().*description == wanted; };
    };
    form.Group(caption,
               [&] {
                 form.Radio("Given as", Choices::numbered({"Constant", "Varying"}), feedback, description);
                 form.Number("Constant", feedback, constant, quantity).EnabledIf(is(Feedback::kConstant));
                 form.List(
                         "Varying", [this] { return components(); }, memberOf(feedback, component))
                     .EnabledIf(is(Feedback::kVarying));
               })
        .EnabledIf(isIncluded);
  };
  form.Radio("HD Density Terms", Choices::numbered({"Exclude", "Include"}), feedback, &Feedback::isIncluded);
  term("Salinity", &Feedback::salinityDescription, &Feedback::constantSalinity, item::kSalinity,
       &Feedback::salinityComponent);
  term("Temperature", &Feedback::temperatureDescription, &Feedback::constantTemperature, item::kTemperature,
       &Feedback::temperatureComponent);
}

}  // namespace gridbay
