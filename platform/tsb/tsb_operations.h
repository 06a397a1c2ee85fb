#pragma once

#include <memory>
#include <span>
#include <string>

#include "platform/tsb/tsb_file.h"

// The operations on a data file in the form in which the model asks for them. A status is 0 for success.
// Items count from 1, time steps from 0.

namespace gridbay {

// An open data file and the place in it at which the next value is read.
struct TsbHeader {
  std::unique_ptr<TsbFile> file;
  std::size_t step = 0;
  std::size_t item = 1;
};

// Opens the file; on failure the reason is in `error`, where one is given.
int tsbFileRead(const std::string& path, TsbHeader* header, std::string* error = nullptr);
int tsbGetNoOfItems(const TsbHeader& header);
// The item itself; null when there is none.
const TsbItem* tsbItemD(const TsbHeader& header, int item);
int tsbGetItemInfo(const TsbHeader& header, int item, int* type, std::string* name, std::string* unit);
TsbAxisType tsbGetItemAxisType(const TsbHeader& header, int item);
// Points and spacing (in the axis's unit) of a two-dimensional item.
int tsbGetItemAxisEqD2(const TsbHeader& header, int item, int* noJ, int* noK, float* dx, float* dy);
// Goes to the first time step, and to an item of a time step.
int tsbFindBlockDynamic(TsbHeader* header);
int tsbFindItemDynamic(TsbHeader* header, int step, int item);
// Reads the item at the place, all points, x fastest.
int tsbReadItemTimeStep(const TsbHeader& header, std::span<float> values);
// Start of an equidistant calendar axis as "%d-%d-%d" and "%d:%d:%d", and its step in seconds.
int tsbGetEqCalendarAxis(const TsbHeader& header, std::string* date, std::string* time, double* step);
// The first custom block, and from a block to the next: null at the end.
int tsbGetCustomBlockRef(const TsbHeader& header, const TsbCustomBlock** block);
int tsbGetCustomBlock(const TsbHeader& header, const TsbCustomBlock** block, std::string* name,
                      std::span<const float>* values);
// 1 for a file that has a place on a map, else 0.
int tsbGetGeoInfoType(const TsbHeader& header);
int tsbGetGeoInfoUTMProj(const TsbHeader& header, std::string* projection, double* longitude,
                         double* latitude, double* rotation);
void tsbFileClose(TsbHeader* header);
void tsbHeaderDestroy(TsbHeader* header);

}  // namespace gridbay
