#pragma once

#include <cstdint>
#include <string>

#include "compare/compared_model.h"
#include "plugin/series_giver.h"
#include "plugin/series_places.h"
#include "setup/setup_doc.h"

namespace gridbay {

// A copy of a document whose buttons are pressed with nobody to see it, to give a time series to who asks
// for a file.
class SeriesRehearsal {
 public:
  // The document must outlive it.
  SeriesRehearsal(CV27SetupDoc& document, const std::string& file);

  ComparedModel& model() { return model_; }
  SeriesGiver& giver() { return giver_; }
  // A control of the place's page, which is there.
  Control& controlOf(const SeriesPlace& place, int control);
  // The table whose current row decides what the rest of the page shows; null for none.
  static CV27SetupGridWnd* masterOf(CV27SetupFormView& page);

  // Shows a page as it is with that row the current one; 0 for none.
  static void show(CV27SetupFormView& page, int currentRow);
  // Makes the choice of the place's format; false where it can't be made.
  bool choose(const SeriesPlace& place);
  // Presses the button of a place, of which the giver tells.
  void press(const SeriesPlace& place);
  // The copy is as the document again.
  void takeBack(const SeriesPlace& place);

  // Whether the series can be given to the place: it is in the copy then.
  bool give(const SeriesPlace& place);

 private:
  CV27SetupDoc& document_;
  SeriesGiver giver_;
  KvsHandle file_;
  ComparedModel model_;
};

}  // namespace gridbay
