// Runs independent jobs in processes of their own, a bounded number at a time.
#pragma once

#include <functional>

// Each job runs in a copy of this process, made when its turn comes; its answer (0 to 255) is its exit
// status. What a job writes to standard error is held back and written in the order of the jobs, so that jobs
// do not mix. `finished` is told of each job in order. A job that dies counts as 3. False when a process
// cannot be started.
bool runInPool(int jobs, int processes, const std::function<int(int job)>& work,
               const std::function<void(int job, int status)>& finished);
