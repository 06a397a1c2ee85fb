#include "hydrodynamic/infiltration_page.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/page_texts.h"

namespace gridbay {

// The controls of a net rate are what shows without infiltration, then disabled.
void CHDInfiltrationDlg::DoDataExchange(Form& form) {
  using Infiltration = CNhdInfiltrationKvs;
  const auto object = objectOf(&HydrodynamicParts::nhdInfiltration);
  const auto isNetRate = [object] { return object().infiltrationType == Infiltration::kNetRate; };
  const auto isCapacity = [object] { return object().infiltrationType == Infiltration::kCapacity; };
  const auto isNoCapacity = [isCapacity] { return !isCapacity(); };
  const Choice constantInTime{Infiltration::kConstantInTime, "Constant in Time, Varying in Space"};
  const auto fileFor = [&](UTsbSelection Infiltration::*file,
                           void (Infiltration::*request)(CVdFileSelectorDlg&)) {
    return AddFile(
        form, "Data file:",
        fileOf([object](GridRow) { return &object(); }, file, texts::infiltrationFile,
               [object, request](CVdFileSelectorDlg& selector, GridRow) { (object().*request)(selector); }));
  };

  form.List("Infiltration type:",
            Choices{{Infiltration::kNone, "No Infiltration"},
                    {Infiltration::kNetRate, "Net Infiltration Rate"},
                    {Infiltration::kCapacity, "Constant Infiltration with Capacity"}},
            object, &Infiltration::infiltrationType);
  form.List("Infiltration format:",
            Choices{constantInTime, {Infiltration::kVaryingInTime, "Varying in Time and Space"}}, object,
            &Infiltration::infiltrationFormat)
      .EnabledIf(isNetRate)
      .VisibleIf(isNoCapacity);
  // A capacity has the one format, whatever is held for a net rate.
  form.List("Infiltration format:", Choices{constantInTime},
            Binding<std::int32_t>{.get = [] { return std::optional(+Infiltration::kConstantInTime); }})
      .VisibleIf(isCapacity);
  form.Radio("Groundwater depth:", Choices{{Infiltration::kDepth, "Depth"}, {Infiltration::kLevel, "Level"}},
             object, &Infiltration::groundwaterDepthType)
      .EnabledIf(isCapacity);
  form.Radio("Initial volume:",
             Choices{{Infiltration::kPercentage, "Percentage of the Capacity"},
                     {Infiltration::kWaterContent, "Water Content"}},
             object, &Infiltration::initialVolumeType)
      .EnabledIf(isCapacity);
  fileFor(&Infiltration::netRateFile, &Infiltration::RequestNetRate)
      .EnabledIf(isNetRate)
      .VisibleIf(isNoCapacity);
  fileFor(&Infiltration::capacityFile, &Infiltration::RequestCapacity)
      .EnabledIf(isCapacity)
      .VisibleIf(isCapacity);
}

}  // namespace gridbay
