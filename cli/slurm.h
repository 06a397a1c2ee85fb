#pragma once

#include <cstddef>
#include <map>
#include <string>

#include "cli/run_folder.h"
#include "platform/result.h"

namespace gridbay::cli::slurm {

// Whether jobs can be handed in from this machine.
bool isThere();

// Hands all members of a run in as one job array, and notes the job's number in the folder. Where an array
// takes fewer tasks than there are members, each task has several, one after the other. Wishes as a partition
// or a time limit come from the environment (SBATCH_PARTITION, SBATCH_TIMELIMIT and so on).
Outcome submit(RunFolder& folder, const std::string& engine);

// The tasks of a job that have not ended, by their number from 1, each with its state as Slurm names it. None
// of a job that it has forgotten, as it does some time after its end.
Result<std::map<std::size_t, std::string>> tasksOf(const std::string& job);

// How many tasks the members of a run were shared out to, by turns.
Result<std::size_t> taskCount(const RunFolder& folder);

}  // namespace gridbay::cli::slurm
