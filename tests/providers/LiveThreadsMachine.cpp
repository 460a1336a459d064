#include <cstdlib>

#include "tests/providers/ThreadsMachine.h"

namespace ThreadsMachine {

// The platform reads a captured machine, when the first of the threads asks for it.
void prepare() {
  setenv("CORVANE_INVENTORY", "root:" CORVANE_SOURCE_DIR "/tests/fixtures/virtual-machine/root.txt", 1);
  setenv("CORVANE_CONFIG", "/dev/null", 1);
  setenv("CORVANE_LOG", "debug:none", 1);
}

}  // namespace ThreadsMachine
