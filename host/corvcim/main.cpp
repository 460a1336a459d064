// corvcim: loads the CPU provider library as a CIM broker does and shows what it answers.

#include <langinfo.h>

#include <algorithm>
#include <clocale>
#include <exception>
#include <span>
#include <string>
#include <string_view>

#include "host/corvcim/Commands.h"
#include "host/corvcim/options/Options.h"
#include "host/corvcim/options/SourceArgument.h"
#include "host/corvcim/options/Usage.h"
#include "host/corvcim/overview/Health.h"
#include "host/corvcim/text/StandardStreams.h"
#include "host/corvcim/text/Text.h"

namespace {

enum ExitStatus { Success = 0, Failed = 1, WrongUsage = 2 };

/// The status 1 of comparisons means that something differs, as that of diff(1), so their failures are 2.
constexpr int Differs = 1;
constexpr int ComparisonFailed = 2;
/// The statuses 1 and 2 of health are those of processors.
constexpr int HealthUnknown = 3;

int failureStatus(const Corvcim::Options& options) {
  switch (options.verb->verb) {
    case Corvcim::Verb::Diff:
      return ComparisonFailed;
    case Corvcim::Verb::Health:
      return HealthUnknown;
    default:
      return Failed;
  }
}

/// What the user's terminal shows. Widths of characters follow the same locale.
Corvcim::Charset localCharset() {
  std::setlocale(LC_CTYPE, "");
  return nl_langinfo(CODESET) == std::string_view("UTF-8") ? Corvcim::Charset::Utf8 : Corvcim::Charset::Ascii;
}

/// Files for programs have one character set wherever they are made. A snapshot holds files as they are.
bool isForTerminal(const Corvcim::Options& options) {
  return (options.format == Corvcim::Format::Text || options.format == Corvcim::Format::Table) &&
         options.verb->verb != Corvcim::Verb::Snapshot;
}

int run(const Corvcim::Options& options, Corvcim::Charset charset) {
  if (options.wantsVersion) {
    Corvcim::writeOutput(Corvcim::versionText());
    return Success;
  }
  if (options.wantsHelp) {
    const bool isAboutVerb = !options.verb->name.empty();
    Corvcim::writeOutput(isAboutVerb ? Corvcim::verbHelp(*options.verb) : Corvcim::programHelp());
    return Success;
  }
  Corvcim::useCharset(isForTerminal(options) ? charset : Corvcim::Charset::Utf8);
  const Corvcim::Outcome outcome = Corvcim::runCommand(options, Corvcim::terminalWidth());
  Corvcim::writeOutput(isForTerminal(options) ? Corvcim::inCharset(outcome.output) : outcome.output);
  Corvcim::useCharset(charset);
  for (const std::string& error : outcome.errors) {
    Corvcim::writeError(Corvcim::withGivenNames(error));
  }
  for (const std::string& remark : outcome.remarks) {
    Corvcim::writeError(remark);
  }
  if (outcome.status) {
    return *outcome.status;
  }
  return !outcome.errors.empty() ? failureStatus(options) : outcome.differs ? Differs : Success;
}

/// Monitoring reads standard output, and takes the status of a wrong command line for a failed processor.
int wrongUsage(std::span<const char* const> arguments, const std::string& what) {
  if (std::ranges::find(arguments, std::string_view("health")) == arguments.end()) {
    return WrongUsage;
  }
  const Corvcim::Outcome unknown = Corvcim::unknownHealth(what);
  Corvcim::writeOutput(unknown.output);
  return *unknown.status;
}

}  // namespace

int main(int count, char** arguments) {
  Corvcim::occupyStandardStreams();
  const Corvcim::Charset charset = localCharset();
  Corvcim::useCharset(charset);
  const std::span<const char* const> all(arguments, static_cast<std::size_t>(count));
  int failed = Failed;
  try {
    const Corvcim::Options options = Corvcim::parseOptions(all.subspan(all.empty() ? 0 : 1));
    failed = failureStatus(options);
    return run(options, charset);
  } catch (const Corvcim::UsageError& error) {
    Corvcim::writeError(error.what());
    return wrongUsage(all, error.what());
  } catch (const std::exception& error) {
    Corvcim::useCharset(charset);
    Corvcim::writeError(Corvcim::withGivenNames(error.what()));
    return failed;
  }
}
