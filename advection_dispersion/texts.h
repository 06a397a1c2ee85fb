#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// Components.
inline constexpr Text componentName{"Component %d"};
inline constexpr Text componentSectionMissing{
    "Error in the KVS-FILE\nThe number of CNadComponentObjectKvs sections does not correspond to the number "
    "of Components"};
inline constexpr Text wrongComponentType{"Component description : Wrong component type"};
inline constexpr Text componentCount{"Illegal number of Components, should be between 1 and 16"};
inline constexpr Text oneHeatExchange{"Only 1 component can have the type 'Heat Exhange'"};
// Kept in the table; the scheme is chosen from a list and not checked.
inline constexpr Text adSchemeNotValid{"Not a valid AD scheme selected"};

// Starting conditions.
inline constexpr Text hotStartTypeNotValid{"Component %d in file %s is not a valid type"};

// What is asked of files.
inline constexpr Text conservativeRequest{"Conservative component"};
inline constexpr Text decayingRequest{"Decaying component"};
inline constexpr Text dissipatingRequest{"Dissipating component"};
inline constexpr Text exchangeRequest{"Exchange component"};
inline constexpr Text initialConcentrationRequest{"Initial Concentration"};
inline constexpr Text heatDissipationRequest{"Heat Dissipation"};
inline constexpr Text surfaceDepositionRequest{"Surface Deposition"};
inline constexpr Text soilDepositionRequest{"Soil Deposition"};

// Coefficients by component.
inline constexpr Text noSuchComponent{"No component corresponding to no. %d found"};

// Sections that a file lacks.
inline constexpr Text adDispersionSectionMissing{
    "Error in the KVS-FILE\nThe number of AD Dispertion coefficient sections does not correspond to the "
    "number of sub domaines"};
inline constexpr Text decaySectionMissing{
    "Error in the KVS-FILE\nThe number of Decay coefficient sections does not correspond to the number AD "
    "Components"};
inline constexpr Text heatDissipationSectionMissing{
    "Error in the KVS-FILE\nThe number of Heat Dissipation sections does not correspond to the number AD "
    "Components"};
inline constexpr Text adBoundarySectionMissing{
    "Error in the KVS-FILE\nThe number of AD Boundary sections does not correspond to the number of "
    "Boundaries"};
inline constexpr Text adSourceSectionMissing{
    "Error in the KVS-FILE\nThe number of AD Source Sink sections does not correspond to the number of "
    "Boundaries"};

// Heat exchange.
inline constexpr Text airTemperature{"Air temperature"};
inline constexpr Text relativeHumidity{"Relative humidity"};
inline constexpr Text clearnessCoefficient{"Clearness coefficient"};

// Feedback.
inline constexpr Text nothingVaries{"Either salinity or tempiture should be varying."};
inline constexpr Text sameFeedbackItem{"Same item can not be selected for both salinity and temperature"};
inline constexpr Text invalidSalinity{"Invalid salinity component selected"};
inline constexpr Text invalidTemperature{"Invalid tempeture component selected"};

}  // namespace gridbay::texts
