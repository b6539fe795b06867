#pragma once

#include <fstream>
#include <malloc.h>
#include <string>
#include <sys/wait.h>
#include <unistd.h>

// Peak resident memory of the work in a process of its own, above what was resident before it, in bytes.
template <class Work>
double peakMemory(Work&& work) {
  int ends[2];
  if (pipe(ends) != 0)
    return 0;
  if (fork() == 0) {
    const auto peak = [] {
      std::ifstream status("/proc/self/status");
      std::string word;
      while (status >> word && word != "VmHWM:") {
      }
      double kilobytes = 0;
      status >> kilobytes;
      return kilobytes * 1024;
    };
    malloc_trim(0);
    std::ofstream("/proc/self/clear_refs") << 5;
    const double before = peak();
    work();
    const double used = peak() - before;
    if (write(ends[1], &used, sizeof used) != sizeof used)
      _exit(1);
    _exit(0);
  }
  double used = 0;
  if (read(ends[0], &used, sizeof used) != sizeof used)
    used = 0;
  wait(nullptr);
  close(ends[0]);
  close(ends[1]);
  return used;
}
