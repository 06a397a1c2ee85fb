#pragma once

#include <functional>
#include <map>
#include <optional>
#include <set>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "advice/advice.h"
#include "advice/data_file_facts.h"
#include "basic/grid_place.h"
#include "setup/global_kvs.h"

namespace gridbay {

class CBoundaryObjectKvs;

// A grid's place on a map: its projection, the easting and northing of its first point (metres), and its
// turn.
struct GridPlace {
  std::string projection;
  double easting = 0;
  double northing = 0;
  double rotation = 0;
};

// Points of a grid, the last ones with it.
struct GridRectangle {
  int firstJ, lastJ, firstK, lastK;

  bool contains(int j, int k) const { return firstJ <= j && j <= lastJ && firstK <= k && k <= lastK; }
};

// A keyword with the name of a file, as it stands on file.
struct FileKeyword {
  PagePlace place;
  std::string name;
  bool isResult = false;
};
// Those of a file that name one.
std::vector<FileKeyword> fileKeywordsOf(const KvsFile& file);

// What the rules look at, and where they leave what they find.
class AdviceContext {
 public:
  AdviceContext(CGlobalKvs& root, const std::string& path, const KvsFile* onDisk, DataFileFacts& dataFiles)
      : model(root), documentPath(path), source(onDisk), files(dataFiles) {}

  CGlobalKvs& model;
  const std::string& documentPath;  // empty for a setup that was never saved
  const KvsFile* source;            // the file as it stands on disk; null where that is not known
  DataFileFacts& files;
  std::function<std::optional<double>(const std::string& folder)> freeMegabytes;

  // The grid of area n, from 1; null where there is none, or as long as it is not known.
  const GridFacts* grid(int number);
  // The points of area n that areas embedded in it cover, by the grids that are known.
  std::vector<GridRectangle> coverOf(int number);
  // Whether the areas begin as a hot start says, whose files give the start of the run and its step as well:
  // others would last until the next check.
  bool isHotStart() const;
  // The item of the areas' files that has their elevations, from 1.
  std::size_t elevationItem() const;
  // Where it lies; nothing without a projection.
  std::optional<GridPlace> placeOf(int number);
  // Whether two texts name one projection.
  bool isSameProjection(const std::string& a, const std::string& b);
  // Points of a projection in grid spacings of area n from its first point; nothing where either has no place
  // on the earth, or the area's grid is not known.
  std::optional<std::vector<GridSpot>> spotsOn(int number, const std::string& projection,
                                               std::span<const AdviceSite::MapPoint> points);
  // A name in the setup's folder, as near to the given one as there is neither a file of nor another fix
  // with; of a setup that was never saved it is a name in the folder that the program runs in.
  std::string freeName(const std::string& name);
  // The keywords that name a data file, by its absolute name.
  std::vector<std::string> keywordsNaming(const std::string& path);
  // The setup as a save would write it, but for the points of dikes, of which there may be very many; null
  // where it can't be written.
  const KvsFile* written();
  // Its keywords that name a file; none where it can't be written.
  const std::vector<FileKeyword>& fileKeywords();

  void add(Advice advice) {
    advice.kind = kind;
    found.push_back(std::move(advice));
  }

  std::string_view kind;  // of the rule that looks now
  std::vector<Advice> found;

 private:
  std::map<int, const GridFacts*> grids_;
  std::set<std::string> names_;  // that the setup has, or a fix gives
  KvsHandle written_;
  bool isWritten_ = false;
  std::optional<std::vector<FileKeyword>> fileKeywords_;
};

struct AdviceRule {
  std::string_view kind;
  void (*look)(AdviceContext& context);
};
// All rules, in the order of their advice.
std::span<const AdviceRule> adviceRules();

// "area 2"
std::string thingOf(std::string_view what, int number);

// With a capital letter in front.
std::string capital(std::string_view text);

// A grid point as a keyword takes it: "3,14".
std::string valueOf(GridPoint point);

// The points of a boundary; nothing for a diagonal, which has none.
std::optional<GridRectangle> pointsOf(const CBoundaryObjectKvs& boundary);

// An entry of a page's list, by its number of so many.
PagePlace placeOfEntry(PageId page, std::string_view what, ListEntry entry, std::string keyword,
                       std::string_view column = {});

// Of areas and their grids.
void adviseAreaPositions(AdviceContext& context);
void adviseProjections(AdviceContext& context);
void adviseLandValues(AdviceContext& context);
// Of time, depths, and what an engine takes.
void adviseCourant(AdviceContext& context);
void adviseThresholds(AdviceContext& context);
void adviseWarmUp(AdviceContext& context);
void adviseCodes(AdviceContext& context);
// Of what is placed in the areas.
void adviseBoundaries(AdviceContext& context);
void adviseSources(AdviceContext& context);
void adviseStructures(AdviceContext& context);
// Of what is read and written.
void adviseSeries(AdviceContext& context);
// The seconds from the start of the run until the first of its series ends; infinite where none is known to
// end after the start.
double secondsOfSeries(AdviceContext& context);
void adviseFileNames(AdviceContext& context);
void adviseOutputSize(AdviceContext& context);

}  // namespace gridbay
