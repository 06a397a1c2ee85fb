#include <algorithm>
#include <array>

#include "platform/units/units.h"

namespace gridbay {
namespace {

// The units, by group of dimension; the codes of a group follow each other.
constexpr QunUnit kUnits[] = {
    {1000, "m", "metre", "m"},
    {1001, "km", "kilometre", "km"},
    {1002, "cm", "centimetre", "cm"},
    {1003, "mm", "millimetre", "mm"},
    {1004, "µm", "micrometre", "um"},
    {1010, "ft", "foot", "ft"},
    {1011, "in", "inch", "in"},
    {1012, "yd", "yard", "yd"},
    {1013, "mi", "mile", "mi"},
    {1014, "ftUS", "US survey foot", "US_survey_foot"},
    {1100, "-", "ratio", "1"},
    {1101, "%", "per cent", "%"},
    {1102, "PSU", "practical salinity unit", "1e-3"},
    {1400, "s", "second", "s"},
    {1401, "min", "minute", "min"},
    {1402, "h", "hour", "h"},
    {1403, "d", "day", "d"},
    {1500, "°", "degree", "degree"},
    {1501, "rad", "radian", "rad"},
    {1600, "°C", "degree Celsius", "degC"},
    {1601, "°F", "degree Fahrenheit", "degF"},
    {1602, "K", "kelvin", "K"},
    {1610, "Δ°C", "difference of degrees Celsius", "K"},
    {1611, "Δ°F", "difference of degrees Fahrenheit", "degR"},
    {1700, "m/s", "metre per second", "m s-1"},
    {1701, "ft/s", "foot per second", "ft s-1"},
    {1702, "km/h", "kilometre per hour", "km h-1"},
    {1703, "mph", "mile per hour", "mi h-1"},
    {1704, "kn", "knot", "knot"},
    {1705, "mm/s", "millimetre per second", "mm s-1"},
    {1800, "m³/s", "cubic metre per second", "m3 s-1"},
    {1801, "ft³/s", "cubic foot per second", "ft3 s-1"},
    {1802, "l/s", "litre per second", "l s-1"},
    {1803, "m³/d", "cubic metre per day", "m3 d-1"},
    {1804, "Mgal/d", "million US gallons per day", "1e6 US_liquid_gallon d-1"},
    {1850, "m²/s", "square metre per second", "m2 s-1"},
    {1851, "ft²/s", "square foot per second", "ft2 s-1"},
    {1900, "mm/d", "millimetre per day", "mm d-1"},
    {1901, "mm/h", "millimetre per hour", "mm h-1"},
    {1902, "in/d", "inch per day", "in d-1"},
    {1903, "in/h", "inch per hour", "in h-1"},
    {2000, "hPa", "hectopascal", "hPa"},
    {2001, "Pa", "pascal", "Pa"},
    {2002, "kPa", "kilopascal", "kPa"},
    {2003, "inHg", "inch of mercury", "inHg"},
    {2004, "psi", "pound-force per square inch", "psi"},
    {2010, "N/m²", "newton per square metre", "N m-2"},
    {2011, "lbf/ft²", "pound-force per square foot", "lbf ft-2"},
    {2100, "m^½/s", "Chezy number", "1"},
    {2101, "ft^½/s", "Chezy number in feet", "0.55208694967369 1"},
    {2110, "m^⅓/s", "Manning number", "1"},
    {2111, "ft^⅓/s", "Manning number in feet", "0.67295009631617 1"},
    {2200, "mg/l", "milligram per litre", "mg l-1"},
    {2201, "kg/m³", "kilogram per cubic metre", "kg m-3"},
    {2202, "g/m³", "gram per cubic metre", "g m-3"},
    {2203, "lb/ft³", "pound per cubic foot", "lb ft-3"},
    {2300, "/d", "per day", "d-1"},
    {2301, "/h", "per hour", "h-1"},
    {2302, "/s", "per second", "s-1"},
    {2400, "g/m²/d", "gram per square metre and day", "g m-2 d-1"},
    {2401, "kg/m²/s", "kilogram per square metre and second", "kg m-2 s-1"},
    {2402, "lb/ft²/d", "pound per square foot and day", "lb ft-2 d-1"},
    {2403, "g/m²/s", "gram per square metre and second", "g m-2 s-1"},
    {2500, "kg/s", "kilogram per second", "kg s-1"},
    {2501, "t/h", "tonne per hour", "t h-1"},
    {2502, "lb/s", "pound per second", "lb s-1"},
};

constexpr std::array kLength{1000, 1001, 1002, 1003, 1010, 1011, 1012, 1014};
constexpr std::array kCoordinate{1000, 1001, 1010, 1013, 1014};
constexpr std::array kWaveHeight{1000, 1002, 1010};
constexpr std::array kGrain{1003, 1004, 1000, 1011};
constexpr std::array kRatio{1100, 1101};
constexpr std::array kPercent{1101, 1100};
constexpr std::array kCount{1100};
constexpr std::array kSalinity{1102};
constexpr std::array kTime{1400, 1401, 1402, 1403};
constexpr std::array kAngle{1500, 1501};
constexpr std::array kTemperature{1600, 1601, 1602};
constexpr std::array kTemperatureDifference{1610, 1611};
constexpr std::array kSpeed{1700, 1701, 1702, 1703, 1704};
constexpr std::array kDischarge{1800, 1801, 1802, 1803, 1804};
constexpr std::array kAreaPerTime{1850, 1851};
constexpr std::array kRainPerDay{1900, 1901, 1902, 1903};
constexpr std::array kRainPerHour{1901, 1900, 1903, 1902};
constexpr std::array kPressure{2000, 2001, 2002, 2003, 2004};
constexpr std::array kChezy{2100, 2101};
constexpr std::array kManning{2110, 2111};
constexpr std::array kConcentration{2200, 2201, 2202, 2203};
constexpr std::array kSediment{2201, 2200, 2202, 2203};
constexpr std::array kDecay{2300, 2301, 2302};
constexpr std::array kDeposition{2400, 2401, 2402};
constexpr std::array kFall{1700, 1705, 1701};
constexpr std::array kShearStress{2010, 2001, 2011};
constexpr std::array kErosion{2401, 2403, 2402};
constexpr std::array kErosionInGrams{2403, 2401, 2402};
constexpr std::array kDensity{2201, 2202, 2203};
constexpr std::array kDensityInGrams{2202, 2201, 2203};
constexpr std::array kRoughness{1000, 1003, 1010};
constexpr std::array kMassRate{2500, 2501, 2502};

constexpr QunItem kItems[] = {
    {999, "Undefined", kCount, 1100},
    {100000, "Water level", kLength, 1010, "water_surface_height_above_reference_datum"},
    {100001, "Discharge", kDischarge, 1801, "water_volume_transport_in_river_channel"},
    {100002, "Wind velocity", kSpeed, 1703},
    {100003, "Wind direction", kAngle, 1500, "wind_from_direction"},
    {100006, "Temperature", kTemperature, 1601},
    {100016, "Flow velocity", kSpeed, 1701},
    {100024, "Salinity", kSalinity, 1102, "sea_water_salinity"},
    {100030, "Manning number", kManning, 2111},
    {100032, "Chezy number", kChezy, 2101},
    {100061, "Infiltration", kRainPerHour, 1903},
    {100062, "Infiltration rate", kRainPerDay, 1902},
    {100069, "Elevation", kLength, 1010},
    {100070, "Precipitation rate", kRainPerHour, 1903, "lwe_precipitation_rate"},
    {100078, "Surface elevation", kLength, 1010, "water_surface_height_above_reference_datum"},
    {100079, "Bathymetry", kLength, 1010},
    {100080, "Flow flux", kAreaPerTime, 1851},
    {100084, "Wave height", kWaveHeight, 1010},
    {100085, "Wave period", kTime, 1400},
    {100088, "Evaporation and precipitation", kRainPerDay, 1902},
    {100095, "Mean wave direction", kAngle, 1500},
    {100097, "Significant wave height", kWaveHeight, 1010, "sea_surface_wave_significant_height"},
    {100123, "Eddy viscosity", kAreaPerTime, 1851},
    {100127, "Grain diameter", kGrain, 1011},
    {100142, "Level", kLength, 1010},
    {100144, "Soil porosity", kRatio, 1100},
    {100153, "Dispersion coefficient", kAreaPerTime, 1851},
    {100180, "Ground elevation", kLength, 1010},
    {100183, "Geographical coordinate", kCoordinate, 1010},
    {100191, "Temperature difference", kTemperatureDifference, 1611},
    {100196, "Barometric pressure", kPressure, 2003, "air_pressure"},
    {100201, "Concentration", kConcentration, 2203},
    {100212, "Time step", kTime, 1400},
    {100239, "Percentage", kPercent, 1101},
    {100242, "Speed of current", kSpeed, 1701, "sea_water_speed"},
    {100272, "Layer thickness", kLength, 1010},
    {100274, "Wind speed", kSpeed, 1703, "wind_speed"},
    {100280, "Flooding and drying depth", kLength, 1010},
    {100292, "Porosity coefficient", kRatio, 1100},
    {100366, "Depth below ground", kLength, 1010},
    {100369, "Net infiltration rate", kRainPerHour, 1903},
    {100370, "Number of steps", kCount, 1100},
    {100375, "Effective porosity", kRatio, 1100},
    {100377, "Volumetric water content", kRatio, 1100},
    {100379, "Infiltration capacity", kRainPerHour, 1903},
    {100403, "Suspended sediment concentration", kSediment, 2203,
     "mass_concentration_of_suspended_matter_in_sea_water"},
    {100406, "Median grain diameter", kGrain, 1011},
    {100407, "Wave direction", kAngle, 1500},
    {100408, "Flow direction", kAngle, 1500, "sea_water_velocity_to_direction"},
    {100409, "Air pressure", kPressure, 2003, "air_pressure"},
    {100410, "Decay coefficient", kDecay, 2300},
    {100427, "Deposition rate", kDeposition, 2402},
    {100430, "Flow rate", kDischarge, 1801},
    {100431, "Rainfall rate", kRainPerHour, 1903, "rainfall_rate"},
    {100432, "Evaporation rate", kRainPerDay, 1902, "lwe_water_evaporation_rate"},
    {100442, "Level difference", kLength, 1010},
    {100450, "Atmospheric pressure", kPressure, 2003, "air_pressure"},
    {100456, "Porosity", kRatio, 1100},
    {100461, "Sediment grain diameter", kGrain, 1011},
    {100504, "Dredged mass rate", kMassRate, 2502},
    {100505, "Dredging spill", kPercent, 1101},
    {100516, "Saturation", kPercent, 1101},
    {110025, "Wave height over depth", kRatio, 1100},
    {110033, "Crest level", kLength, 1010},
    {110257, "Leakage", kRainPerHour, 1903},
    {130001, "Shear stress", kShearStress, 2011},
    {130002, "Settling velocity", kFall, 1701},
    {130003, "Erosion rate", kErosion, 2402},
    {130004, "Erosion rate in grams", kErosionInGrams, 2402},
    {130005, "Density of bed", kDensity, 2203},
    {130006, "Density of bed in grams", kDensityInGrams, 2203},
    {130007, "Roughness height", kRoughness, 1010},
};

template <class Entry>
const Entry* findCode(std::span<const Entry> entries, int code) {
  const auto found = std::ranges::lower_bound(entries, code, {}, &Entry::code);
  return found != entries.end() && found->code == code ? &*found : nullptr;
}

}  // namespace

std::span<const QunItem> qunItems() {
  return kItems;
}
std::span<const QunUnit> qunUnits() {
  return kUnits;
}
const QunItem* qunFindItem(int code) {
  return findCode(qunItems(), code);
}
const QunUnit* qunFindUnit(int code) {
  return findCode(qunUnits(), code);
}

const QunUnit* qunBaseUnit(int itemCode) {
  const QunItem* found = qunFindItem(itemCode);
  return found == nullptr ? nullptr : qunFindUnit(found->units.front());
}

}  // namespace gridbay
