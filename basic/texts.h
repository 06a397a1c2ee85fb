#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// Flood and dry.
inline constexpr Text dryingAboveFlooding{"Drying depth must be smaller that flooding depth"};
inline constexpr Text dryingNotPositive{"Drying depth must be positive"};

// Simulation period.
inline constexpr Text timeStepTooSmall{"Time step interval must be at least 0.01"};
inline constexpr Text negativeTimeSteps{"Number of time steps can not be negative"};
inline constexpr Text negativeWarmUp{"Warm-up period can not be negative"};
inline constexpr Text warmUpTooLong{"Warm up period exceeds the simulation period"};

// Bathymetries.
inline constexpr Text bathymetrySectionMissing{
    "Error in the KVS-FILE\nThe number of Bathymetry sections does not correspond to the number of sub "
    "domaines"};
inline constexpr Text landBelowZero{"True land defined in the bathymetry is less than zero"};
inline constexpr Text bathymetryCount{"Number of bathymetries should be between 1 and 9"};
inline constexpr Text outerNotValid{"Not a valid outer bathymetry chosen"};
inline constexpr Text overlap{"Bathymetries%s and %s Overlap"};
inline constexpr Text nestRatio{
    "Can not nest file %s in file %s.  Ratio between gridpoint spacing is not 3."};
inline constexpr Text nestJextr{"Can not nest file %s in file %s.  Grid dimension incorrect (jextr)."};
inline constexpr Text nestKextr{"Can not nest file %s in file %s.  Grid dimension incorrect (kextr)."};
inline constexpr Text nestPosition{"Can not nest file %s in file %s.  Illegal position of area."};
// Kept in the table; the depths in common points are not compared.
inline constexpr Text nestDepths{
    " Can not nest file \"%s\" in file \"%s\"  .Water depths in common points are not equal.\";\n"};

// The fine bathymetry of the overland solver.
inline constexpr Text fineBathymetryFile{"Fine bathymetry file"};
inline constexpr Text fineFirstItemOnly{"Please select the first item only."};
inline constexpr Text fineAxis{"2D Equidistant spatial axis required."};
inline constexpr Text fineCellsJ{
    "The number of cells in J-dir. must be a multiple of the number of cells in area1."};
inline constexpr Text fineCellsK{
    "The number of cells in K-dir. must be a multiple of the number of cells in area1."};
inline constexpr Text fineSpacingJ{
    "The grid spacing in J-dir. must be a multiple of the grid spacing in area1."};
inline constexpr Text fineSpacingK{
    "The grid spacing in K-dir. must be a multiple of the grid spacing in area1."};

// Open boundaries.
inline constexpr Text boundaryText{"(%d,%d) - (%d,%d)"};
inline constexpr Text boundarySectionMissing{
    "Error in the KVS-FILE\nThe number of Boundary sections does not correspond to the number of sub "
    "domaines"};
inline constexpr Text firstPointNegative{"First point coordinates can not be negative"};
inline constexpr Text lastPointNegative{"Last point coordinates can not be negative"};
inline constexpr Text lineNotParallel{"Line must be parallel to either X- or Y-axis"};

// Sources and sinks.
inline constexpr Text sourceText{"(%d,%d)->"};
inline constexpr Text sinkText{"->(%d,%d)"};
inline constexpr Text sourceSinkText{"(%d,%d)->(%d,%d) "};
inline constexpr Text sourceSectionMissing{
    "Error in the KVS-FILE\nThe number of Source Sink sections does not correspond to the given number"};
// Says 256 where the limit is 1024.
inline constexpr Text sourceCount{"Number of source/sinks should be between 0 and 256"};
inline constexpr Text sourceNoArea{"Source no.%d is not embedded in a valid area"};
inline constexpr Text sourceOutside{"Source no.%d is outside of grid"};
inline constexpr Text sourceCovered{"Source no.%d is in a point that is covered by an embedded area"};
inline constexpr Text sourceOnLand{"Source no.%d is on land"};
inline constexpr Text sinkNoArea{"Sink no.%d is not embedded in a valid area"};
inline constexpr Text sinkOutside{"Sink no.%d is outside of grid"};
inline constexpr Text sinkCovered{"Sink no.%d is in a point that is covered by an embedded area"};
inline constexpr Text sinkOnLand{"Sink no.%d is on land"};

// Mass budget.
inline constexpr Text invalidAssociatedArea{"Invalid associated area"};
inline constexpr Text tooFewCorners{"To few corner points in polygon"};
inline constexpr Text pointOutsideGrid{"Point is outside of grid"};

}  // namespace gridbay::texts
