#pragma once

// The names by which reader and writer of data files know each other's variables and attributes.
namespace gridbay::tsb {

inline constexpr const char* kTime = "time";
inline constexpr const char* kAxes[] = {"x", "y"};
inline constexpr const char* kProjection = "projection";
inline constexpr const char* kCustomBlocks = "custom_blocks";
inline constexpr const char* kDataType = "data_type";
inline constexpr const char* kTitle = "title";
inline constexpr const char* kHistory = "history";
inline constexpr const char* kAxisType = "axis_type";
inline constexpr const char* kFirst = "first_value";
inline constexpr const char* kStep = "step";
inline constexpr const char* kItemType = "item_type";
inline constexpr const char* kItemNumber = "item_number";
inline constexpr const char* kBlockName = "block_name";
inline constexpr const char* kProjectionName = "projection_name";
inline constexpr const char* kLongitude = "longitude_of_first_point";
inline constexpr const char* kLatitude = "latitude_of_first_point";
inline constexpr const char* kRotation = "rotation";

}  // namespace gridbay::tsb
