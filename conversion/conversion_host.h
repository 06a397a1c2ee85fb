#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace gridbay {

// Who asks for a conversion: is told how it goes and may stop it, and knows what its user calls things.
class ConversionHost {
 public:
  virtual ~ConversionHost() = default;

  // What the user may want to know, as that a file holds further rasters.
  virtual void note(const std::string& /*text*/) {}
  // How far the work is, in rows or time steps; false stops it, and nothing is written then.
  virtual bool reached(std::size_t /*done*/, std::size_t /*total*/) { return true; }
  // The option by its name in words of lower case with hyphens, as "nodata-as"; `placeholder` stands for its
  // value, where it has one.
  virtual std::string option(std::string_view name, std::string_view placeholder = {}) const = 0;
  // Where the user finds the list of all item types, as a clause: "... lists them".
  virtual std::string itemTypeList() const = 0;
};

// The error of a conversion that its host has stopped.
inline constexpr std::string_view kConversionStopped = "The conversion was stopped; nothing is written";

}  // namespace gridbay
