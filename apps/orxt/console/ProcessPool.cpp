#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/ProcessPool.h>

#include <array>
#include <cstdio>
#include <map>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

namespace {

struct RunningJob {
  int job;
  std::FILE* messages;
};

void copyMessages(std::FILE* messages) {
  std::rewind(messages);
  std::array<char, 4096> buffer;
  for (;;) {
    const std::size_t length = std::fread(buffer.data(), 1, buffer.size(), messages);
    if (length == 0)
      break;
    std::fwrite(buffer.data(), 1, length, stderr);
  }
  std::fclose(messages);
}

}  // namespace

bool runInPool(int jobs, int processes, const std::function<int(int job)>& work,
               const std::function<void(int job, int status)>& finished) {
  struct Outcome {
    int status = -1;
    std::FILE* messages = nullptr;
  };
  std::vector<Outcome> outcomes(static_cast<std::size_t>(jobs));
  std::map<pid_t, RunningJob> running;
  int started = 0;
  int reported = 0;
  bool canStart = true;
  while ((started < jobs && canStart) || !running.empty()) {
    while (started < jobs && canStart && static_cast<int>(running.size()) < processes) {
      std::FILE* messages = std::tmpfile();
      std::fflush(stdout);
      std::fflush(stderr);
      const pid_t child = messages ? fork() : -1;
      if (child < 0) {
        if (messages)
          std::fclose(messages);
        canStart = false;
        break;
      }
      if (child == 0) {
        dup2(fileno(messages), STDERR_FILENO);
        const int status = work(started);
        std::fflush(stdout);
        std::fflush(stderr);
        // The parent's objects are not this process's to destroy.
        _exit(status);
      }
      running.emplace(child, RunningJob{started++, messages});
    }
    int status = 0;
    const pid_t child = running.empty() ? -1 : waitpid(-1, &status, 0);
    const auto found = running.find(child);
    if (found == running.end())
      continue;
    Outcome& outcome = outcomes[static_cast<std::size_t>(found->second.job)];
    outcome.status = WIFEXITED(status) ? WEXITSTATUS(status) : kExitFile;
    outcome.messages = found->second.messages;
    running.erase(found);
    for (; reported < started && outcomes[static_cast<std::size_t>(reported)].status >= 0; ++reported) {
      copyMessages(outcomes[static_cast<std::size_t>(reported)].messages);
      finished(reported, outcomes[static_cast<std::size_t>(reported)].status);
    }
  }
  return reported == jobs;
}
