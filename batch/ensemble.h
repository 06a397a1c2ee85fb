#pragma once

#include <string>
#include <vector>

#include "batch/check_setups.h"
#include "batch/ensemble_table.h"
#include "batch/member_report.h"
#include "platform/result.h"

namespace gridbay {

// An ensemble: setups that differ from a common one in what a table says.
struct Ensemble {
  EnsembleTable table;
  std::string base;         // the file of the common setup
  std::string folder;       // where the members lie; it is made where it is not there
  bool mayReplace = false;  // files that are there already, but for those that are read here

  // The file of a member, beside which the files that it makes lie.
  std::string fileOf(const EnsembleTable::Member& member) const;
  std::string csvReport() const;
  std::string jsonReport() const;
};

struct EnsembleResult {
  std::vector<MemberReport> members;  // those that were made, in the order of the table
  bool isStopped = false;             // before all of them were
  std::size_t others = 0;             // setups in the folder that are none of the table's members
  std::vector<std::string> warnings;  // of files that the engines of several members make
};

// Makes the members and checks them, side by side on as many cores as there are, and writes both reports.
// A member's values are set from the first column to the last, as `applySetting` does. Its data files are
// those of the common setup, by names that hold from its own folder; names of data files in the table start
// from the folder of the common setup. A file that the engine makes gets the member's name before its own,
// lies as it did relative to the setup, and has the name of the table, from the member, where that has one.
//
// All values are tried before the first file is written: where one can't be set, no file is. The error tells
// of each one its line and column. Then each file is whole or not there, whatever happens. A file that can't
// be written ends the work; what was made until then is kept and reported. That the engines of several
// members make the same file, as by a name in the table, is a warning, and a note of each of them. `host` is
// shown what the load of the common setup has to say.
Result<EnsembleResult> makeEnsemble(const Ensemble& ensemble, MessageHost& host, const BatchWatch& watch);

}  // namespace gridbay
