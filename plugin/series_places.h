#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace gridbay {

// Where a setup takes a time series: a page, and there the button by which its user would choose the file.
struct SeriesPlace {
  // What is to be chosen in a list first: "From file"; empty where a series is asked for as it is.
  struct Format {
    std::string choice = {};
    int control = 0;  // as of the place
    int column = 0;
  };

  std::int32_t page = 0;
  std::string name = {};   // "Flow, Boundary: Boundary 1, data"
  std::string item = {};   // of the file, by its name; empty where the place takes the file as a whole
  std::string doubt = {};  // why the file does not fit all the same, as for its period; empty for none
  int currentRow = 0;      // of the table that decides what the rest of the page shows; 0 for none
  int control = 0;         // from 0: the button, or the table that it is in
  int row = 0;             // in the table, as is `column`; 0 for none
  int column = 0;
  std::vector<std::uint32_t> items = {};  // of the file, from 1
  Format format = {};
};

struct SeriesPlaces {
  std::vector<SeriesPlace> places;  // those that ask for a series as they are first
  // Of pages that ask for series of other quantities, a line for each: "Wind Conditions: Wind speed".
  std::vector<std::string> others;
};

class CV27SetupDoc;

// The places where a setup takes the time series in a file (an absolute path): as it is now, or once another
// format was chosen there.
SeriesPlaces findSeriesPlaces(CV27SetupDoc& document, const std::string& file);
// Puts the file there, with its item and the format that it takes, as one step by the name of the edit; what
// is wrong, or empty.
std::string putSeries(CV27SetupDoc& document, const std::string& file, const SeriesPlace& place);

}  // namespace gridbay
