#include "host/corvcim/text/LibraryErrors.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <string_view>
#include <unordered_set>

#include "host/corvcim/text/StandardStreams.h"
#include "platform/base/Configuration.h"
#include "platform/base/Environment.h"
#include "platform/cvlog/Settings.h"

namespace Corvcim {
namespace {

constexpr int none = -1;

/// The file in memory. Read by the handler of a signal, and changed only where that cannot run.
int kept = none;

bool isLoggedHere() {
  using Tarn::Common::environmentOverride;
  const CVLog::Settings settings = CVLog::makeSettings(
      Tarn::Common::configuration(), environmentOverride("CORVANE_LOG"), environmentOverride("CORVANE_TRACE"));
  return std::ranges::any_of(std::array{settings.log.destination.kind, settings.trace.destination.kind},
                             [](CVLog::DestinationKind kind) { return kind == CVLog::DestinationKind::StandardError; });
}

/// Calls `use` with one piece of what was kept after the other.
template <class Use>
void readKept(Use use) {
  std::array<char, 4096> piece;
  off_t place = 0;
  for (ssize_t size = 0; (size = pread(kept, piece.data(), piece.size(), place)) > 0; place += size) {
    use(std::string_view(piece.data(), static_cast<std::size_t>(size)));
  }
}

void giveBack() {
  restoreStandardError();
  close(kept);
  kept = none;
}

std::vector<std::string> differentLines(std::string_view text) {
  std::vector<std::string> lines;
  std::unordered_set<std::string_view> seen;
  while (!text.empty()) {
    const std::string_view line = text.substr(0, text.find('\n'));
    if (!line.empty() && seen.insert(line).second) {
      lines.emplace_back(line);
    }
    text.remove_prefix(std::min(text.size(), line.size() + 1));
  }
  return lines;
}

}  // namespace

LibraryErrors::LibraryErrors() {
  if (isLoggedHere()) {
    return;
  }
  kept = memfd_create("corvcim-standard-error", MFD_CLOEXEC);
  if (kept != none && !replaceStandardError(kept)) {
    close(kept);
    kept = none;
  }
}

LibraryErrors::~LibraryErrors() {
  if (kept != none) {
    show();
    giveBack();
  }
}

std::vector<std::string> LibraryErrors::take() {
  if (kept == none) {
    return {};
  }
  std::string text;
  readKept([&](std::string_view piece) { text += piece; });
  giveBack();
  return differentLines(text);
}

void LibraryErrors::show() {
  if (kept != none) {
    readKept([](std::string_view piece) { writeToStandardError(piece); });
  }
}

}  // namespace Corvcim
