#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "core/date_time.h"
#include "core/file_name.h"
#include "core/grid_point.h"
#include "core/kvs.h"
#include "core/selections.h"

// How the types of members stand on file, as the values of one keyword.

namespace gridbay {

inline void putValue(KvsFile& file, std::string_view name, const auto& value, const std::string&) {
  kvsPutParam(file, name, value);
}
inline void putValue(KvsFile& file, std::string_view name, const std::string& value, const std::string&) {
  kvsPutParam(file, name, std::string_view(value));
}
inline void putValue(KvsFile& file, std::string_view name, const GridPoint& value, const std::string&) {
  kvsPutListParam(file, name, "ii", value.j, value.k);
}
// A range is first, last and interval.
inline void putValue(KvsFile& file, std::string_view name, const USubLine& value, const std::string&) {
  kvsPutListParam(file, name, "iii", value.first, value.last, value.interval);
}
inline void putValue(KvsFile& file, std::string_view name, const DateTime& value, const std::string&) {
  const auto [year, month, day, hour, minute, second] =
      value.parts().value_or(std::array{-1, -1, -1, -1, -1, -1});
  kvsPutListParam(file, name, "iiiiii", year, month, day, hour, minute, second);
}
inline void putValue(KvsFile& file, std::string_view name, const UFileName& value,
                     const std::string& documentPath) {
  value.Save(file, documentPath, name);
}
inline void putValue(KvsFile& file, std::string_view name, const UResultFileName& value,
                     const std::string& documentPath) {
  value.Save(file, documentPath, name);
}
inline void addValue(KvsFile& file, std::int32_t value) {
  kvsAddInt(file, value);
}
inline void addValue(KvsFile& file, float value) {
  kvsAddFloat(file, value);
}
inline void addValue(KvsFile& file, double value) {
  kvsAddDouble(file, value);
}
// A fixed number of numbers.
template <class T, std::size_t n>
void putValue(KvsFile& file, std::string_view name, const std::array<T, n>& values, const std::string&) {
  kvsAddKeyword(file, name);
  for (const T value : values) addValue(file, value);
}
// A list of numbers, as many as there are.
template <class T>
void putValue(KvsFile& file, std::string_view name, const std::vector<T>& values, const std::string&) {
  kvsAddKeyword(file, name);
  for (const T value : values) addValue(file, value);
}

inline void getValue(KvsSection from, std::string_view name, auto& value, const std::string&) {
  kvsGetParam(from, name, &value, 1, 1);
}
inline void getValue(KvsSection from, std::string_view name, GridPoint& value, const std::string&) {
  kvsGetListParam(from, name, 1, "ii", &value.j, &value.k);
}
inline void getValue(KvsSection from, std::string_view name, USubLine& value, const std::string&) {
  kvsGetListParam(from, name, 1, "iii", &value.first, &value.last, &value.interval);
}
inline void getValue(KvsSection from, std::string_view name, DateTime& value, const std::string&) {
  if (kvsKeywordByNameNum(from, name, 1) == nullptr) return;
  std::array parts{-1, -1, -1, -1, -1, -1};
  kvsGetListParam(from, name, 1, "iiiiii", &parts[0], &parts[1], &parts[2], &parts[3], &parts[4], &parts[5]);
  value = DateTime::of(parts);
}
inline void getValue(KvsSection from, std::string_view name, UFileName& value,
                     const std::string& documentPath) {
  value.Load(from, documentPath, name);
}
inline void getValue(KvsSection from, std::string_view name, UResultFileName& value,
                     const std::string& documentPath) {
  value.Load(from, documentPath, name);
}
// Numbers that the keyword lacks stay as they are.
template <class T, std::size_t n>
void getValue(KvsSection from, std::string_view name, std::array<T, n>& values, const std::string&) {
  for (std::size_t i = 0; i < n; ++i) kvsGetParam(from, name, &values[i], 1, static_cast<int>(i) + 1);
}
inline void takeValue(KvsParam param, std::int32_t& value) {
  value = kvsGetInt(param);
}
inline void takeValue(KvsParam param, float& value) {
  value = kvsGetFloat(param);
}
inline void takeValue(KvsParam param, double& value) {
  value = kvsGetDouble(param);
}
// The list becomes what stands there; a keyword that is missing leaves it alone.
template <class T>
void getValue(KvsSection from, std::string_view name, std::vector<T>& values, const std::string&) {
  const KvsKeyword keyword = kvsKeywordByNameNum(from, name, 1);
  if (keyword == nullptr) return;
  values.resize(static_cast<std::size_t>(kvsGetNoParams(keyword)));
  for (std::size_t i = 0; i < values.size(); ++i) {
    takeValue(kvsParamByNum(keyword, static_cast<int>(i) + 1), values[i]);
  }
}

}  // namespace gridbay
