#include "host/corvcim/SnapshotCommand.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <stdexcept>

#include "platform/base/FileDescriptor.h"
#include "platform/inventory/ProcessTree.h"
#include "platform/inventory/sources/SnapshotWriter.h"
#include "platform/inventory/sources/files/FileSystem.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Identifiers;

[[noreturn]] void fail(const std::string& file, int error) {
  throw std::runtime_error("cannot write the snapshot: " + file + ": " + Tarn::Inventory::describeError(error) +
                           "; name a file that can be written, or none for standard output");
}

/// Identifiers are kept from other users, as the kernel keeps them.
constexpr mode_t modeOf(Identifiers identifiers) {
  return identifiers == Identifiers::Kept ? S_IRUSR | S_IWUSR : S_IRUSR | S_IWUSR | S_IRGRP | S_IROTH;
}

void writeFile(const std::string& file, std::string_view text, Identifiers identifiers) {
  const Tarn::Common::FileDescriptor target(
      ::open(file.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC | O_NOCTTY, modeOf(identifiers)));
  if (!target) {
    fail(file, errno);
  }
  // A file that was there before has a mode of its own.
  struct stat status {};
  if (identifiers == Identifiers::Kept && ::fstat(target.number(), &status) == 0 && S_ISREG(status.st_mode) &&
      ::fchmod(target.number(), modeOf(identifiers)) != 0) {
    fail(file, errno);
  }
  while (!text.empty()) {
    const ssize_t written = ::write(target.number(), text.data(), text.size());
    if (written < 0 && errno != EINTR) {
      fail(file, errno);
    }
    text.remove_prefix(written < 0 ? 0 : static_cast<std::size_t>(written));
  }
}

}  // namespace

Outcome takeSnapshot(const Options& options) {
  const Identifiers identifiers = options.unmasked ? Identifiers::Kept : Identifiers::Masked;
  Tarn::Inventory::Snapshot snapshot =
      Tarn::Inventory::takeSnapshot(Tarn::Inventory::chosenSource(), identifiers, "corvcim " CORVCIM_VERSION);
  Outcome outcome;
  if (!snapshot.error.empty()) {
    outcome.errors.push_back(std::move(snapshot.error));
  }
  if (options.operand(0).empty()) {
    outcome.output = std::move(snapshot.text);
  } else {
    writeFile(options.operands.front(), snapshot.text, identifiers);
  }
  return outcome;
}

}  // namespace Corvcim
