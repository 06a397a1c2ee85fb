#pragma once

#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace gridbay {

// A unit of the library. Units are known by their codes; the text is UDUNITS-2's, and what data files hold.
struct QunUnit {
  int code;
  std::string_view symbol;  // as shown: "m³/s"
  std::string_view name;    // "cubic metre per second"
  std::string_view text;    // "m3 s-1"
};

enum class UnitSystem { metric, us };

// A quantity that a value or an item of a data file can be. The first unit is the base unit, in which models
// and setups hold the value.
struct QunItem {
  int code;
  std::string_view name;
  std::span<const int> units;
  int usUnit;  // the unit to show where US units are chosen
  // The name that the CF conventions have for just this quantity; empty where they have none.
  std::string_view standardName = {};
};

namespace unit {
inline constexpr int kMetre = 1000;
inline constexpr int kSecond = 1400;
inline constexpr int kDay = 1403;
}  // namespace unit

namespace item {
inline constexpr int kUndefined = 999;
inline constexpr int kWaterLevel = 100000;
inline constexpr int kDischarge = 100001;
inline constexpr int kWindVelocity = 100002;
inline constexpr int kWindDirection = 100003;
inline constexpr int kTemperature = 100006;
inline constexpr int kFlowVelocity = 100016;
inline constexpr int kSalinity = 100024;
inline constexpr int kManningNumber = 100030;
inline constexpr int kChezyNumber = 100032;
inline constexpr int kInfiltration = 100061;
inline constexpr int kInfiltrationRate = 100062;
inline constexpr int kElevation = 100069;
inline constexpr int kPrecipitationRate = 100070;
inline constexpr int kSurfaceElevation = 100078;
inline constexpr int kBathymetry = 100079;
inline constexpr int kFlowFlux = 100080;
inline constexpr int kWaveHeight = 100084;
inline constexpr int kWavePeriod = 100085;
inline constexpr int kRainAndEvaporation = 100088;
inline constexpr int kMeanWaveDirection = 100095;
inline constexpr int kSignificantWaveHeight = 100097;
inline constexpr int kEddyViscosity = 100123;
inline constexpr int kGrainDiameter = 100127;
inline constexpr int kLevel = 100142;
inline constexpr int kSoilPorosity = 100144;
inline constexpr int kDispersionCoefficient = 100153;
inline constexpr int kGroundElevation = 100180;
inline constexpr int kGeographicalCoordinate = 100183;
inline constexpr int kTemperatureDifference = 100191;
inline constexpr int kBarometricPressure = 100196;
inline constexpr int kConcentration = 100201;
inline constexpr int kTimeStep = 100212;
inline constexpr int kPercentage = 100239;
inline constexpr int kCurrentSpeed = 100242;
inline constexpr int kLayerThickness = 100272;
inline constexpr int kWindSpeed = 100274;
inline constexpr int kFloodDepth = 100280;
inline constexpr int kPorosityCoefficient = 100292;
inline constexpr int kDepthBelowGround = 100366;
inline constexpr int kNetInfiltrationRate = 100369;
inline constexpr int kNumberOfSteps = 100370;
inline constexpr int kEffectivePorosity = 100375;
inline constexpr int kVolumetricWaterContent = 100377;
inline constexpr int kInfiltrationCapacity = 100379;
inline constexpr int kSuspendedSediment = 100403;
inline constexpr int kMedianGrainDiameter = 100406;
inline constexpr int kWaveDirection = 100407;
inline constexpr int kFlowDirection = 100408;
inline constexpr int kAirPressure = 100409;
inline constexpr int kDecayCoefficient = 100410;
inline constexpr int kDepositionRate = 100427;
inline constexpr int kFlowRate = 100430;
inline constexpr int kRainfallRate = 100431;
inline constexpr int kEvaporationRate = 100432;
inline constexpr int kLevelDifference = 100442;
inline constexpr int kAtmosphericPressure = 100450;
inline constexpr int kPorosity = 100456;
inline constexpr int kSedimentGrainDiameter = 100461;
inline constexpr int kDredgedMassRate = 100504;
inline constexpr int kDredgingSpill = 100505;
inline constexpr int kSaturation = 100516;
inline constexpr int kWaveHeightOverDepth = 110025;
inline constexpr int kCrestLevel = 110033;
inline constexpr int kLeakage = 110257;
// Of the sediment in the water and on the bed. Where mud transport counts in grams, its quantity does.
inline constexpr int kShearStress = 130001;
inline constexpr int kSettlingVelocity = 130002;
inline constexpr int kErosionRate = 130003;
inline constexpr int kErosionRateInGrams = 130004;
inline constexpr int kBedDensity = 130005;
inline constexpr int kBedDensityInGrams = 130006;
inline constexpr int kRoughnessHeight = 130007;
}  // namespace item

// The catalogues, by rising code.
std::span<const QunItem> qunItems();
std::span<const QunUnit> qunUnits();
// The entry of a code, or null.
const QunItem* qunFindItem(int code);
const QunUnit* qunFindUnit(int code);
// The base unit of an item; null for an item that is not in the catalogue.
const QunUnit* qunBaseUnit(int itemCode);

// A value of one unit in another. Units of different dimensions give nothing.
std::optional<double> qunConvertUnit(int fromUnit, int toUnit, double value);
// Whether two unit texts name the same dimension; false for a text that is no unit.
bool qunAreEquivalent(std::string_view unitText, std::string_view otherText);
bool qunIsUnit(std::string_view unitText);

// Converts between two units, found once.
class CVdUnitConverter {
 public:
  CVdUnitConverter(int fromUnit, int toUnit);
  // Between units by their texts, as data files have them.
  CVdUnitConverter(std::string_view fromText, std::string_view toText);
  CVdUnitConverter(CVdUnitConverter&&) noexcept;
  CVdUnitConverter& operator=(CVdUnitConverter&&) noexcept;
  ~CVdUnitConverter();

  // False when there is no way from the one unit to the other; such a converter changes nothing.
  bool IsValid() const;
  double Convert(double value) const;

 private:
  struct State;
  std::unique_ptr<State> state_;
};

}  // namespace gridbay
