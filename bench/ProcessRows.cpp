// The host as a command, from its start to its end, against the system's own processor listing.

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>

#include "bench/Rows.h"

namespace Corvane::Bench {
namespace {

/// Runs a command to its end with nothing on its standard output.
void run(const char* const* arguments) {
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, "/dev/null", O_WRONLY, 0);
  pid_t process = 0;
  const int error =
      posix_spawnp(&process, arguments[0], &actions, nullptr, const_cast<char* const*>(arguments), environ);
  posix_spawn_file_actions_destroy(&actions);
  require(error == 0, arguments[0], "can be started");

  int status = -1;
  waitpid(process, &status, 0);
  require(status == 0, arguments[0], "succeeds");
}

}  // namespace

void addProcessRows() {
  // The products of other rows have read theirs; the host is to look at this machine, as lscpu does.
  unsetenv("CORVANE_INVENTORY");
  static const char* const host[] = {CORVANE_HOST, "ei", "HALDA_CPUProcessor", nullptr};
  static const char* const lscpu[] = {"lscpu", "-J", nullptr};

  Row row{"corvcim ei HALDA_CPUProcessor, whole process", 1.3};
  row.wallClock = true;
  addRow(
      row, [] { run(host); }, [] { run(lscpu); });
}

}  // namespace Corvane::Bench
