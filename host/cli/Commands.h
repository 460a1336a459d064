#ifndef HOST_CLI_COMMANDS_H
#define HOST_CLI_COMMANDS_H

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "host/cli/Options.h"

namespace Corvcim {

/// What a command has to say: what it found for standard output, and one line for standard error
/// about each thing that failed.
struct Outcome {
  std::string output;
  std::vector<std::string> errors;
  bool differs = false;                ///< two inventories were compared, and are not the same
  std::vector<std::string> remarks{};  ///< further lines for standard error; nothing has failed by them
  std::optional<int> status{};         ///< the exit status, if it says more than success or failure
};

/// Runs the command. Sets CORVANE_INVENTORY and CORVANE_LANGUAGE in this process as the options ask.
/// `width` is the terminal's, 0 where output goes elsewhere. Throws std::exception's children with a
/// one-line text where nothing could be done at all.
Outcome runCommand(const Options& options, std::size_t width);

}  // namespace Corvcim

#endif
