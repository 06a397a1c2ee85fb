#pragma once

#include <nlohmann/json_fwd.hpp>
#include <span>
#include <string>

#include "advice/advice.h"
#include "cli/console.h"
#include "setup/setup_file.h"

namespace gridbay::cli {

// All advice on a setup, in the order in which its numbers count from 1.
std::vector<Advice> adviceOn(SetupFile& setup, const std::string& path);

// "page 27 (Bathymetry), area 2"
std::string placeText(const PagePlace& place);
// An advice by its number on lines of its own, with the command by which its fix is made.
std::string adviceText(const Advice& advice, std::size_t number, const std::string& path);
nlohmann::ordered_json adviceJson(const Advice& advice, std::size_t number);

}  // namespace gridbay::cli
