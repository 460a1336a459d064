// corvcim: loads the CPU provider library as a CIM broker does and shows what it answers.

#include <exception>
#include <span>
#include <string>

#include "host/cli/Commands.h"
#include "host/cli/Options.h"
#include "host/cli/StandardStreams.h"
#include "host/cli/Usage.h"

namespace {

enum ExitStatus { Success = 0, Failed = 1, WrongUsage = 2 };

/// Comparisons say with 1 that something differs, as diff(1) does, so that their failures are 2.
constexpr int Differs = 1;
constexpr int ComparisonFailed = 2;

int failureStatus(const Corvcim::Options& options) {
  return options.verb->verb == Corvcim::Verb::Diff ? ComparisonFailed : Failed;
}

int run(const Corvcim::Options& options) {
  if (options.wantsVersion) {
    Corvcim::writeOutput(Corvcim::versionText());
    return Success;
  }
  if (options.wantsHelp) {
    const bool isAboutVerb = !options.verb->name.empty();
    Corvcim::writeOutput(isAboutVerb ? Corvcim::verbHelp(*options.verb) : Corvcim::programHelp());
    return Success;
  }
  const Corvcim::Outcome outcome = Corvcim::runCommand(options, Corvcim::terminalWidth());
  Corvcim::writeOutput(outcome.output);
  for (const std::string& error : outcome.errors) {
    Corvcim::writeError(error);
  }
  for (const std::string& remark : outcome.remarks) {
    Corvcim::writeError(remark);
  }
  return !outcome.errors.empty() ? failureStatus(options) : outcome.differs ? Differs : Success;
}

}  // namespace

int main(int count, char** arguments) {
  Corvcim::occupyStandardStreams();
  int failed = Failed;
  try {
    const std::span<const char* const> all(arguments, static_cast<std::size_t>(count));
    const Corvcim::Options options = Corvcim::parseOptions(all.subspan(all.empty() ? 0 : 1));
    failed = failureStatus(options);
    return run(options);
  } catch (const Corvcim::UsageError& error) {
    Corvcim::writeError(error.what());
    return WrongUsage;
  } catch (const std::exception& error) {
    Corvcim::writeError(error.what());
    return failed;
  }
}
