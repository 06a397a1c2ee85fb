#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// The model definition.
inline constexpr Text noModelDefinition{"None or Invalid Model Definition File"};
inline constexpr Text invalidUpdateFrequency{"Invalid Update Frequency"};
// The last choice of the models.
inline constexpr Text fromFile{"From File ..."};
inline constexpr Text definitionNotRead{
    "%s\nThe ecological model has no state variables, constants and forcings until its file is read, and a "
    "save leaves out their values."};
inline constexpr Text definitionTooLarge{
    "The model definition \"%s\" is not read: it is larger than %d MB, which no model needs"};
inline constexpr Text noDefinitionTarget{
    "\"%s\" is not a model definition: it has no BIO_RIG_SETUP. Choose the .biorig file of an ecological "
    "model"};
inline constexpr Text tooManyDeclarations{
    "The model definition \"%s\" is not read: it declares more than %d items, which no model needs"};

// Values, by their place in the list or by what is named.
inline constexpr Text numberOutOfRange{"%d: Value Out of Range"};
inline constexpr Text valueOutOfRange{"%s: Value Out of Range"};
inline constexpr Text variableInArea{"%s: Area %d"};

// What is asked of files.
inline constexpr Text constantsRequest{"Constants"};
inline constexpr Text forcingsRequest{"Forcings"};
inline constexpr Text initialConditionsRequest{"Initial Conditions"};

}  // namespace gridbay::texts
