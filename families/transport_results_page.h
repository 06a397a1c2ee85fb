#pragma once

#include <functional>
#include <string_view>

#include "families/result_pages.h"
#include "families/transport_results.h"

namespace gridbay {

// The outputs of a transport module, one in each row.
class TransportOutputColumns : public ResultFileGrid {
 protected:
  using Output = std::function<TransportOutput*(GridRow)>;
  // Where it is, when, and in which file.
  void ListOutput(const Output& output);
};

// The same with nothing further to choose. `results` is the member of a room that holds the outputs.
template <auto results>
class TransportOutputGrid final : public TransportOutputColumns {
  using Room = decltype(result_pages_detail::roomOf(results));

  void LayOut() override {
    const auto outputs = [this]() -> auto& {
      return (parts<Room>().*results)->outputs;
    };
    Rows([outputs] { return outputs().GetCount(); });
    ListOutput([outputs](GridRow row) { return outputs().GetItem(row.item); });
  }
};

// The controls of the outputs, and those of the hot start files. `results()` gives a TransportResultsKvs.
void listOutputControls(Form& form, auto results, std::string_view sizeLabel, CV27SetupGridWnd& grid) {
  const auto outputs = [results]() -> auto& {
    return results().outputs;
  };
  form.Count("Number of Output Areas", countOf(outputs),
             std::remove_reference_t<decltype(results())>::kMostOnPage);
  form.Shown(sizeLabel, [results] { return formatted(texts::megabytes, results().OutputSizeMB()); }).Beside();
  form.Grid("Output areas", grid);
}
void listHotStartControls(Form& form, auto results, std::string_view label, CV27SetupGridWnd& grid) {
  using Results = std::remove_reference_t<decltype(results())>;
  form.Check(label, results, &Results::generateHotStart);
  form.Group("Generate hot start", [&] { form.Grid("Hot start files", grid); }).Caption([results] {
    return hotStartCaption("Generate hot start", results().generateHotStart, results().HotStartSizeMB());
  });
}

}  // namespace gridbay
