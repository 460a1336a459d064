#ifndef HOST_CORVCIM_TEXT_OUTCOME_H
#define HOST_CORVCIM_TEXT_OUTCOME_H

#include <optional>
#include <string>
#include <vector>

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

}  // namespace Corvcim

#endif
