#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// HD boundary conditions.
inline constexpr Text hdBoundarySectionMissing{
    "Error in the KVS-FILE\nThe number of Hydrodynamic Boundary sections does not correspond to the number "
    "of Boundaries"};
inline constexpr Text noBoundaryDataItem{" No Boundary Data item "};
inline constexpr Text tiltingPointOutside{"Tilting point is outside of boundary line"};
inline constexpr Text boundaryRequest{"Boundary"};
inline constexpr Text flowDirectionRequest{"Flow direction"};

// Sources and sinks, rain and evaporation.
inline constexpr Text hdSourceSectionMissing{
    "Error in the KVS-FILE\nThe number of Hydrodynamic Source Sink sections does not correspond to the "
    "number of Boundaries"};
inline constexpr Text rainfallRequest{"Rainfall rate"};
inline constexpr Text magnitudeRequest{"Magnitude"};
inline constexpr Text velocityRequest{"Velocity"};

// Infiltration.
inline constexpr Text infiltrationFileNotValid{"File is not valid"};
inline constexpr Text infiltrationRequest{"Infiltration"};
inline constexpr Text porosityRequest{"Porosity"};
inline constexpr Text depthBelowGroundRequest{"Depth Below Ground"};
inline constexpr Text groundwaterElevationRequest{"Elevation"};
inline constexpr Text leakageRequest{"Leakage"};
inline constexpr Text percentageRequest{"Percentage"};
inline constexpr Text waterContentRequest{"Volumetric Water Content"};

// Surface elevation.
inline constexpr Text surfaceElevationSectionMissing{
    "Error in the KVS-FILE\nThe number of Surface Elevation sections does not correspond to the number of "
    "sub "
    "domaines"};
inline constexpr Text surfaceElevationCountDiffers{
    "Surface Elevation: Number of surface elevation objects does not correspond to number of subdomains"};
inline constexpr Text surfaceElevationType{
    "Initial Surface Elevation : Type of initial surface elevation has to be either constant value (1) of "
    "from file (2): "};
inline constexpr Text surfaceElevationRequest{"Surface elevation"};

// Eddy viscosity; wave radiation shows the first text too.
inline constexpr Text eddyViscositySectionMissing{
    "Error in the KVS-FILE\nThe number of Eddy Viscosity sections does not correspond to the number of sub "
    "domaines"};
inline constexpr Text eddyViscosityCountDiffers{
    "Eddy Viscocity: Number of eddy viscocity objects does not correspond to number of subdomains"};
inline constexpr Text negativeEddyViscosity{"Negative Eddy Viscosity"};
inline constexpr Text eddyViscosityRequest{"Eddy viscocity"};

// Resistance.
inline constexpr Text resistanceSectionMissing{
    "Error in the Hydrodynamic section of the KVS-FILE\nThe number of Resistance sections does not "
    "correspond to the number of sub domaines"};
inline constexpr Text negativeResistance{"Negative Bed resistance"};
inline constexpr Text waveHeightLimitNotPositive{"The Wave height/depth limit must be specified positive"};
inline constexpr Text updateFrequencyNotPositive{"The update frequency for must be positive and non-zero"};
inline constexpr Text updateFrequencyTooHigh{
    "The update frequency for cannot be greater than the number of timesteps"};
inline constexpr Text waveOrGrainFileNotValid{"Data file \"%s\" is not valid"};
inline constexpr Text resistanceRequest{"Resistance"};
inline constexpr Text pierResistanceRequest{"Pier Resistance"};
inline constexpr Text waveHeightRequest{"Wave height"};
inline constexpr Text wavePeriodRequest{"Wave period"};
inline constexpr Text waveDirectionRequest{"Wave direction"};
inline constexpr Text grainDiameterRequest{"Sediment grain diameter"};

// Wind.
inline constexpr Text negativeWindSpeed{"Wind speed cannot be negative"};
inline constexpr Text windSpeedRequest{"Wind speed"};
inline constexpr Text windDirectionRequest{"Wind direction"};
inline constexpr Text airPressureRequest{"Air Pressure"};
inline constexpr Text windXRequest{"Wind X-component"};
inline constexpr Text windYRequest{"Wind Y-component"};

// Wave radiation.
inline constexpr Text waveRadiationCountDiffers{
    "Number of wave radiation objects does not correspond to number of subdomains"};

// Outputs.
inline constexpr Text saturationLast{
    "Saturation is the last item of the output \"%s\", and there is no infiltration: such a list can't be "
    "saved. Without the item it can."};

}  // namespace gridbay::texts
