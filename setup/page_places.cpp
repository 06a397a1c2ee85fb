#include "setup/page_places.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <map>
#include <span>

#include "advection_dispersion/texts.h"
#include "basic/texts.h"
#include "ecology/texts.h"
#include "families/result_texts.h"
#include "families/texts.h"
#include "families/transport_texts.h"
#include "hydrodynamic/texts.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

// The sections that are edited on a page, by the beginning of their path without the numbers, and what the
// entries of its lists are called. Of several rows that fit the first one holds.
struct PageRow {
  PageId page;
  std::string_view path;
  std::array<std::string_view, 2> words = {};
};

constexpr PageRow kPages[] = {
    {PageId::moduleSelection, "NESTED_MODEL_GLOBALS/MODULE_SELECTION"},
    {PageId::bathymetry, "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION", {"area"}},
    {PageId::simulationPeriod, "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD"},
    {PageId::boundary, "NESTED_MODEL_GLOBALS/OPEN_BOUNDARY", {"boundary"}},
    {PageId::sourceAndSink, "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK", {"source"}},
    {PageId::massBudget, "NESTED_MODEL_GLOBALS/MASS_BUDGET", {"polygon"}},
    {PageId::floodAndDry, "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY"},

    {PageId::hdBoundary, "HYDRODYNAMIC_MODULE/OPEN_BOUNDARY", {"boundary"}},
    {PageId::hdSourceAndSink, "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK", {"source"}},
    {PageId::infiltration, "HYDRODYNAMIC_MODULE/INFILTRATION"},
    {PageId::windConditions, "HYDRODYNAMIC_MODULE/WIND_CONDITIONS"},
    {PageId::eddyViscosity, "HYDRODYNAMIC_MODULE/EDDY_VISCOSITY", {"area"}},
    {PageId::waveRadiation, "HYDRODYNAMIC_MODULE/WAVE_RADIATION", {"area"}},
    {PageId::surfaceElevation, "HYDRODYNAMIC_MODULE/SURFACE_ELEVATION", {"area"}},
    {PageId::resistance, "HYDRODYNAMIC_MODULE/RESISTANCE", {"area"}},
    {PageId::waves, "HYDRODYNAMIC_MODULE/WAVES"},
    {PageId::culverts, "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/CULVERTS", {"culvert"}},
    {PageId::weirs, "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE", {"weir"}},
    {PageId::dikes, "HYDRODYNAMIC_MODULE/STRUCTURES/DIKES", {"dike"}},
    {PageId::hdResult, "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES"},
    {PageId::hdResult, "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION", {"output"}},

    {PageId::adStartingConditions, "ADVECTION_DISPERSION_MODULE/STARTING_CONDITIONS", {"area"}},
    {PageId::adComponent, "ADVECTION_DISPERSION_MODULE/COMPONENT_SPECIFICATIONS", {"component"}},
    {PageId::adInitialConcentration,
     "ADVECTION_DISPERSION_MODULE/INITIAL_CONCENTRATIONS",
     {"component", "area"}},
    {PageId::adDispersionCoef, "ADVECTION_DISPERSION_MODULE/DISPERSION_CONDITIONS", {"area"}},
    {PageId::adDecaySpecification, "ADVECTION_DISPERSION_MODULE/DECAY_COEFFICIENTS", {"component"}},
    {PageId::adHeatDissipation, "ADVECTION_DISPERSION_MODULE/HEAT_DISSIPATION", {"component"}},
    {PageId::adBoundary, "ADVECTION_DISPERSION_MODULE/BOUNDARY_CONCENTRATIONS", {"boundary"}},
    {PageId::adSourceSink, "ADVECTION_DISPERSION_MODULE/SOURCE_CONCENTRATIONS", {"source"}},
    {PageId::adDepositionConcentration,
     "ADVECTION_DISPERSION_MODULE/DEPOSITION_CONCENTRATIONS",
     {"component", "area"}},
    {PageId::adHeatExchange, "ADVECTION_DISPERSION_MODULE/HEAT_EXCHANGE"},
    {PageId::adPrecipitation, "ADVECTION_DISPERSION_MODULE/PRECIPITATION_CONCENTRATIONS"},
    {PageId::adEvaporation, "ADVECTION_DISPERSION_MODULE/EVAPORATION_CONCENTRATIONS"},
    {PageId::adInfiltration, "ADVECTION_DISPERSION_MODULE/INFILTRATION_CONCENTRATIONS"},
    {PageId::adFeedback, "ADVECTION_DISPERSION_MODULE/AD_FEED_BACK_ON_HD_CALCULATIONS"},
    {PageId::adMassBudget, "ADVECTION_DISPERSION_MODULE/MASS_BUDGET", {"mass file"}},
    {PageId::adResult, "ADVECTION_DISPERSION_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES"},
    {PageId::adResult, "ADVECTION_DISPERSION_MODULE/OUTPUT_SPECIFICATION", {"output"}},
    {PageId::adResult, "ADVECTION_DISPERSION_MODULE"},
    {PageId::adLineDischarge, "", {"line"}},
    {PageId::adBoxSummation, "", {"box"}},

    {PageId::mtStartingConditions, "MUD_TRANSPORT_MODULE/STARTING_CONDITIONS", {"area"}},
    {PageId::mtInitialConcentration, "MUD_TRANSPORT_MODULE/INITIAL_CONCENTRATIONS", {"component", "area"}},
    {PageId::mtDispersionCoef, "MUD_TRANSPORT_MODULE/DISPERSION_CONDITIONS", {"area"}},
    {PageId::mtBoundary, "MUD_TRANSPORT_MODULE/BOUNDARY_CONCENTRATIONS", {"boundary"}},
    {PageId::mtSourceSink, "MUD_TRANSPORT_MODULE/SOURCE_CONCENTRATIONS", {"source"}},
    {PageId::mtSettlingAndDespositionBedComposition,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/SETTLING_AND_DEPOSITION/COMPONENT_/Initial_bed_composition",
     {"component", "area"}},
    {PageId::mtSettlingAndDespositionErosion,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/SETTLING_AND_DEPOSITION/COMPONENT_/EROSION_COEFFICIENTS",
     {"component", "area"}},
    {PageId::mtMfSettlingAndDeposition, "MUD_TRANSPORT_MODULE/MT_PARAMETERS/SETTLING_AND_DEPOSITION"},
    {PageId::mtWaveData, "MUD_TRANSPORT_MODULE/FORCING_FUNCTIONS/WAVE_DATA"},
    {PageId::mtMlSettlingAndDeposition, "", {"area"}},
    {PageId::mtErosionForEachLayerCritical,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER/"
     "CRITICAL_SHEARSTRESS_FOR_EROSION",
     {"layer", "area"}},
    {PageId::mtErosionForEachLayerFactor,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER/EROSION_COEFFICIENT_FACTOR",
     {"layer", "area"}},
    {PageId::mtErosionForEachLayerFactor1,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER/EROSION_COEFFICIENT_Factor1",
     {"layer", "area"}},
    {PageId::mtErosionForEachLayerFactor2,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER/EROSION_COEFFICIENT_FACTOR2",
     {"layer", "area"}},
    {PageId::mtErosionForEachLayerPower,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER/ALPHA_OR_POWER",
     {"layer", "area"}},
    {PageId::mtErosionForEachLayerDensity,
     "MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER/DENSITY_OF_BED_MATERIAL",
     {"layer", "area"}},
    {PageId::mtConstantSliding,
     "MUD_TRANSPORT_MODULE/SLIDING/CONSTANT_SLIDING_COEFFICIENT",
     {"layer", "area"}},
    {PageId::mtVariableSliding, "MUD_TRANSPORT_MODULE/SLIDING/VARIABLE_SLIDING_COEFFICIENT", {"area"}},
    {PageId::mtTransitionBetweenLayers,
     "MUD_TRANSPORT_MODULE/TRANSITION_OF_MUD_BETWEEN_LAYERS",
     {"layer", "area"}},
    {PageId::mtBedRoughness, "MUD_TRANSPORT_MODULE/FORCING_FUNCTIONS/BED_ROUGHNESS", {"area"}},
    {PageId::mtLineDischarge, "", {"line"}},
    {PageId::mtBoxSummation, "", {"box"}},
    {PageId::mtResult, "MUD_TRANSPORT_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES"},
    {PageId::mtResult, "MUD_TRANSPORT_MODULE/OUTPUT_SPECIFICATION", {"output"}},
    {PageId::mtResult, "MUD_TRANSPORT_MODULE"},

    {PageId::mtExpStartingConditions, "MUD_TRANSPORT_EXPANDED_MODULE/STARTING_CONDITIONS", {"area"}},
    {PageId::mtExpInitialConditions,
     "MUD_TRANSPORT_EXPANDED_MODULE/INITIAL_CONCENTRATIONS",
     {"fraction", "area"}},
    {PageId::mtExpInitialConditions,
     "MUD_TRANSPORT_EXPANDED_MODULE/INITIAL_BED_THICKNESS",
     {"layer", "area"}},
    {PageId::mtExpDispersionCoef, "MUD_TRANSPORT_EXPANDED_MODULE/DISPERSION_CONDITIONS", {"area"}},
    {PageId::mtExpSources, "MUD_TRANSPORT_EXPANDED_MODULE/SOURCE_CONCENTRATIONS", {"source"}},
    {PageId::mtExpBoundary, "MUD_TRANSPORT_EXPANDED_MODULE/BOUNDARY_CONCENTRATIONS", {"boundary"}},
    {PageId::mtExpTsvWaves, "MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/WAVE_DATA/TWOD_Wavefields"},
    {PageId::mtExpWaveDatabase,
     "MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/WAVE_DATA/WAVE_DATABASE_PARAMETERS",
     {"map"}},
    {PageId::mtExpDredgings, "MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/DREDGING", {"dredger"}},
    {PageId::mtExpDeposition,
     "MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters/DEPOSITION_PARAMETERS",
     {"fraction", "area"}},
    {PageId::mtExpSettlingPar,
     "MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters/FALL_VELOCITY_PARAMETERS",
     {"fraction", "area"}},
    {PageId::mtExpErosionCoefficient,
     "MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/EROSION_COEFFICIENTS",
     {"layer", "area"}},
    {PageId::mtExpCriticalShearStress,
     "MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/CRITICAL_SHEAR_STRESS_EROSION",
     {"layer", "area"}},
    {PageId::mtExpBedDensity,
     "MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/DENSITY_OF_BED_MATERIAL",
     {"layer", "area"}},
    {PageId::mtExpVarFrictionCoef,
     "MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/SLIDING/Variable_sliding_coefficient",
     {"area"}},
    {PageId::mtExpConstFrictionCoef,
     "MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/SLIDING/Constant_sliding_coefficient",
     {"layer", "area"}},
    {PageId::mtExpBedRoughness, "MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/BED_ROUGHNESS", {"area"}},
    {PageId::mtExpPowerOfErosion, "", {"layer", "area"}},
    {PageId::mtExpLineDischarge, "", {"line"}},
    {PageId::mtExpMassBudget, "", {"mass file"}},
    {PageId::mtExpResult, "MUD_TRANSPORT_EXPANDED_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES"},
    {PageId::mtExpResult, "MUD_TRANSPORT_EXPANDED_MODULE/OUTPUT_SPECIFICATION", {"output"}},
    {PageId::mtExpResult, "MUD_TRANSPORT_EXPANDED_MODULE"},

    {PageId::ecoModelDefinition, "BIO_RIG_MODULE/MODEL_DEFINITION"},
    {PageId::ecoStartingConditions, "BIO_RIG_MODULE/STARTING_CONDITIONS", {"area"}},
    {PageId::ecoInitialConditions, "BIO_RIG_MODULE/INITIAL_CONDITIONS", {"state variable", "area"}},
    {PageId::ecoConstants, "BIO_RIG_MODULE/CONSTANTS", {"constant", "area"}},
    {PageId::ecoForcings, "BIO_RIG_MODULE/FORCINGS", {"forcing"}},
    {PageId::ecoBoundary, "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/AD_BOUNDARY", {"boundary"}},
    {PageId::ecoDispersion, "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/AD_DISPERSION", {"area"}},
    {PageId::ecoSourceSink, "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/AD_SOURCESINK", {"source"}},
    {PageId::ecoPrecipitation, "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/PRECIPITATION"},
    {PageId::ecoEvaporation, "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/EVAPORATION"},
    {PageId::ecoInfiltration, "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/INFILTRATION"},
    {PageId::ecoDeposition,
     "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/AD_DEPOSITION",
     {"state variable", "area"}},
    {PageId::ecoMassBudget, "BIO_RIG_MODULE/MASS_BUDGET", {"mass file"}},
    {PageId::ecoResults, "BIO_RIG_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES"},
    {PageId::ecoResults, "BIO_RIG_MODULE/OUTPUT_SPECIFICATION", {"output"}},
    {PageId::ecoResults, "BIO_RIG_MODULE"},
};

// Pages on which a text means another field than on others.
constexpr PageId kResultPages[] = {PageId::hdResult, PageId::adResult, PageId::mtResult, PageId::mtExpResult,
                                   PageId::ecoResults};
constexpr PageId kSourcesPage[] = {PageId::hdSourceAndSink};
constexpr PageId kLinePages[] = {PageId::adLineDischarge, PageId::adBoxSummation, PageId::mtLineDischarge,
                                 PageId::mtBoxSummation, PageId::mtExpLineDischarge};

// The field that a text speaks of: the label of a control, or the header of a column where an entry is known;
// on some pages, or on all. Of several rows that fit the first one holds.
struct FieldRow {
  const Text& text;
  std::string_view field;
  int number = 1;
  std::span<const PageId> pages = {};
};

constexpr FieldRow kFields[] = {
    {texts::dryingAboveFlooding, "Drying depth:"},
    {texts::dryingNotPositive, "Drying depth:"},
    {texts::timeStepTooSmall, "Time step interval:"},
    {texts::negativeTimeSteps, "Last:"},
    {texts::negativeWarmUp, "Last:", 2},
    {texts::warmUpTooLong, "Last:", 2},
    {texts::bathymetryCount, "Number of areas"},
    {texts::landBelowZero, "Bathymetry"},
    {texts::outerNotValid, "Enclosing Area"},
    {texts::nestRatio, "Bathymetry"},
    {texts::nestJextr, "Bathymetry"},
    {texts::nestKextr, "Bathymetry"},
    {texts::nestPosition, "Origin"},
    {texts::overlap, "Origin"},
    {texts::lineNotParallel, "Last point"},
    {texts::sourceNoArea, "Source"},
    {texts::sourceOutside, "Source"},
    {texts::sourceCovered, "Source"},
    {texts::sourceOnLand, "Source"},
    {texts::sinkNoArea, "Sink"},
    {texts::sinkOutside, "Sink"},
    {texts::sinkCovered, "Sink"},
    {texts::sinkOnLand, "Sink"},

    {texts::infiltrationFileNotValid, "Data file:"},
    {texts::surfaceElevationType, "Given as:"},
    {texts::negativeEddyViscosity, "Viscosity"},
    {texts::negativeResistance, "Constant"},
    {texts::waveHeightLimitNotPositive, "Wave height/depth limit:"},
    {texts::updateFrequencyNotPositive, "Update frequency:"},
    {texts::updateFrequencyTooHigh, "Update frequency:"},
    {texts::negativeWindSpeed, "Speed:"},

    {texts::dataFileNotValid, "File name", 1, kSourcesPage},
    {texts::resultFileNotValid, "Data File"},
    {texts::associatedAreaMissing, "Area"},
    {texts::gridPointOutOfRange, "J", 1, kResultPages},
    {texts::gridPointOutOfRange, "Last", 1, kLinePages},
    {texts::firstPointNegative, "J", 1, kResultPages},
    {texts::firstPointNegative, "First", 1, kLinePages},
    {texts::firstPointNegative, "First point"},
    {texts::lastPointNegative, "Last point"},
    {texts::firstPointBehindLast, "J", 1, kResultPages},
    {texts::firstPointBehindLast, "Last", 1, kLinePages},
    {texts::intervalTooSmall, "J"},
    {texts::firstTimeStepNegative, "Time", 1, kResultPages},
    {texts::firstTimeStepNegative, "Period", 1, kLinePages},
    {texts::firstTimeStepNegative, "First:"},
    {texts::firstTimeStepAfterLast, "Time", 1, kResultPages},
    {texts::firstTimeStepAfterLast, "Period", 1, kLinePages},
    {texts::firstTimeStepAfterLast, "First:"},
    {texts::lastTimeStepOutOfRange, "Time", 1, kResultPages},
    {texts::lastTimeStepOutOfRange, "Period", 1, kLinePages},
    {texts::lastTimeStepOutOfRange, "Last:"},
    {texts::timeStepIntervalTooSmall, "Time"},
    {texts::wrongDimensionOfFile, "Data File"},
    {texts::outputCount, "Number of Output Areas"},
    {texts::lineWithoutArea, "Area"},
    {texts::boxWithoutArea, "Area"},
    {texts::lineCount, "Number of Lines"},
    {texts::boxCount, "Number of Boxes"},
    {texts::invalidPolygon, "Associated polygon"},
    {texts::timeRangeOutOfRange, "TRange"},
    {texts::noItemSelected, "Items..."},
    {texts::noOutputFile, "Filename"},

    {texts::tooMuchDispersion, "Proportionality factor in x- direction:"},
    {texts::maximumBelowMinimum, "Max. value:"},
    {texts::wrongComponentType, "Type"},
    {texts::componentCount, "Number of Components"},
    {texts::oneHeatExchange, "Components"},
    {texts::hotStartTypeNotValid, "Hot Start File"},
    {texts::nothingVaries, "Given as"},
    {texts::sameFeedbackItem, "Varying"},
    {texts::invalidSalinity, "Varying"},
    {texts::invalidTemperature, "Varying", 2},

    {texts::noModelDefinition, "File"},
    {texts::invalidUpdateFrequency, "Update Frequency"},
};

// What stands in a text for the first placeholder of a format; nothing for a text of another format.
std::optional<std::string> firstOf(std::string_view text, std::string_view format) {
  const std::size_t start = format.find('%');
  if (!text.starts_with(format.substr(0, start))) return std::nullopt;
  if (start == format.npos) return text == format ? std::optional<std::string>("") : std::nullopt;
  std::optional<std::string> first;
  text.remove_prefix(start);
  for (format.remove_prefix(start); !format.empty();) {
    // A placeholder with one letter, and what stands behind it.
    constexpr std::size_t kPlaceholder = 2;
    const std::size_t next = std::min(format.find('%', kPlaceholder), format.size());
    const std::string_view between = format.substr(kPlaceholder, next - kPlaceholder);
    const std::size_t end = between.empty() ? text.size() : text.find(between);
    if (end == text.npos) return std::nullopt;
    if (!first) first = text.substr(0, end);
    text.remove_prefix(end + between.size());
    format.remove_prefix(next);
  }
  return first;
}

// Whether a path lies in the place of a row; the numbers of its sections do not count.
bool isIn(std::string_view path, std::string_view place) {
  std::size_t at = 0;
  for (const char letter : place) {
    while (at < path.size() && path[at] != letter && (path[at] >= '0' && path[at] <= '9')) ++at;
    if (at >= path.size() || path[at++] != letter) return false;
  }
  return !place.empty() && at < path.size() && path[at] == '/';
}

std::string inWords(const std::array<std::string_view, 2>& words, const std::vector<ListEntry>& entries) {
  std::string thing;
  for (std::size_t i = 0; i < std::min(words.size(), entries.size()) && !words[i].empty(); ++i)
    thing += fmt::format("{}{} {}", i == 0 ? "" : ", ", words[i], entries[i].number);
  return thing;
}

// Of a page whose entries are columns the number leads to one; in it to a row, from 1, where that is known.
void layAcross(PagePlace& place, int row = 0) {
  if (place.page != PageId::massBudget || place.entries.empty()) return;
  place.column = place.entries.front().number;
  place.entries.clear();
  if (row > 0) place.entries = {{row, 0}};
}

// The rows of a mass budget's polygon: its area, the number of corners, the corners.
int rowOfPolygon(std::string_view text) {
  if (text == texts::invalidAssociatedArea.format) return 1;
  if (text == texts::tooFewCorners.format) return 2;
  return text == texts::pointOutsideGrid.format ? 3 : 0;
}

// What the keywords of a section have in common, by its path with a slash behind it, which is their keyword
// but for the name.
PagePlace placeOfSection(std::string path, const std::vector<ListEntry>& entries) {
  const auto* row = std::ranges::find_if(kPages, [&](const PageRow& each) { return isIn(path, each.path); });
  PagePlace place{.keyword = std::move(path)};
  if (row == std::end(kPages)) return place;
  place.page = row->page;
  for (std::size_t i = 0; i < std::min(row->words.size(), entries.size()) && !row->words[i].empty(); ++i)
    place.entries.push_back(entries[i]);
  place.thing = inWords(row->words, place.entries);
  layAcross(place);
  return place;
}

// A section of a list, "AREA_2", but for its number; like names that stand together are one, too.
std::string_view stemOf(std::string_view name) {
  const std::size_t end = name.find_last_not_of("0123456789");
  return end == name.npos ? name : name.substr(0, end + 1);
}

// Of a section by its path, which ends in a slash but for the target's own. A file may have very many
// keywords: where they stand is found once for all of a section.
void eachIn(const Node& section, const std::string& path, std::vector<ListEntry>& entries,
            const std::function<void(const PagePlace& place, const Node& keyword)>& tell) {
  struct Like {
    int seen = 0;
    int all = 0;
  };
  std::map<std::string_view, Like> named;
  std::map<std::string_view, int> stems;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (!node->isSection()) continue;
    ++named[node->name()].all;
    ++stems[stemOf(node->name())];
  }
  std::optional<PagePlace> place;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (!node->isSection()) {
      if (!place) place = placeOfSection(path, entries);
      place->keyword.replace(path.size(), std::string::npos, node->name());
      tell(*place, *node);
      continue;
    }
    std::string here = path + std::string(node->name());
    Like& like = named[node->name()];
    if (++like.seen > 1) here += fmt::format("[{}]", like.seen);
    here += '/';
    const std::string_view stem = stemOf(node->name());
    const bool isNumbered = stem.ends_with('_') && stem.size() < node->name().size();
    const bool isRepeated = like.all > 1 || node->name().ends_with("_data");
    if (isNumbered) {
      const int number = std::atoi(std::string(node->name().substr(stem.size())).c_str());
      entries.push_back({number, stems[stem]});
    } else if (isRepeated) {
      entries.push_back({like.seen, like.all});
    }
    eachIn(*node, here, entries, tell);
    if (isNumbered || isRepeated) entries.pop_back();
  }
}

}  // namespace

std::string thingOf(PageId page, const std::vector<ListEntry>& entries) {
  const auto* row = std::ranges::find_if(
      kPages, [&](const PageRow& each) { return each.page == page && !each.words[0].empty(); });
  return row == std::end(kPages) ? std::string() : inWords(row->words, entries);
}

PagePlace placeOfMessage(const CMessage& message) {
  PagePlace place{
      .page = message.page, .thing = thingOf(message.page, message.entries), .entries = message.entries};
  const auto* field = std::ranges::find_if(kFields, [&](const FieldRow& each) {
    const bool isOnPage =
        each.pages.empty() || std::ranges::find(each.pages, message.page) != each.pages.end();
    return isOnPage && firstOf(message.text, each.text.format).has_value();
  });
  if (field != std::end(kFields)) {
    place.field = field->field;
    place.fieldNumber = field->number;
  }
  // A result's file that belongs to no output is one of the hot start files.
  const bool isOnResultPage = std::ranges::find(kResultPages, message.page) != std::end(kResultPages);
  if (isOnResultPage && message.entries.empty() && firstOf(message.text, texts::resultFileNotValid.format))
    place.field = "Hot start files";
  for (const Text& text :
       {texts::dataFileNotValid, texts::waveOrGrainFileNotValid, texts::resultFileNotValid}) {
    if (const std::optional<std::string> name = firstOf(message.text, text.format)) place.value = *name;
  }
  layAcross(place, rowOfPolygon(message.text));
  return place;
}

void eachKeyword(const KvsFile& file,
                 const std::function<void(const PagePlace& place, const Node& keyword)>& tell) {
  std::vector<ListEntry> entries;
  if (const KvsSection target = kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1); target != nullptr)
    eachIn(*target, {}, entries, tell);
}

}  // namespace gridbay
