#include "platform/inventory/sources/SnapshotWriter.h"

#include <algorithm>
#include <memory>
#include <vector>

#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/files/RecordingFileSystem.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/sources/snapshot/Masking.h"
#include "platform/inventory/sources/snapshot/Snapshot.h"
#include "platform/inventory/tree/Error.h"

namespace Tarn::Inventory {

namespace {

void comment(std::string& text, std::string line) {
  std::ranges::replace(line, '\n', ' ');
  text += "# " + line + '\n';
}

std::string headOf(const std::string& program, std::string_view specification) {
  std::string text(snapshotFirstLine);
  text += '\n';
  // Not where a captured root is: that names directories, and people.
  const std::string_view kind = specification.substr(0, specification.find(':'));
  comment(text, "The files that " + program + " read for the inventory; source: " + std::string(kind));
  comment(text, "To read the same inventory anywhere: corvcim --inventory snapshot:FILE");
  return text;
}

void describeMasks(std::string& text, const std::vector<std::string>& masks) {
  if (masks.empty()) {
    comment(text, "Masked: nothing; no identifier of this machine was read.");
    return;
  }
  comment(text, "Masked at equal length, because it identifies this machine:");
  for (const std::string& mask : masks) {
    comment(text, "  " + mask);
  }
}

}  // namespace

Snapshot takeSnapshot(std::string_view specification, Identifiers identifiers, const std::string& program) {
  const std::unique_ptr<FileSystem> files = openSource(specification);
  if (!files) {
    throw InventoryError("cannot take a snapshot", std::string(specification),
                         "the source is one file already, and none of a machine's files is read for it",
                         "pass on that file, or name live, root:DIRECTORY or snapshot:FILE");
  }
  Snapshot snapshot;
  RecordingFileSystem::Record record;
  try {
    RecordingFileSystem recorder(*files, record);
    readLiveInventory(recorder);
  } catch (const InventoryError& error) {
    snapshot.error = error.what();
  }
  snapshot.text = headOf(program, specification);
  if (identifiers == Identifiers::Masked) {
    describeMasks(snapshot.text, maskIdentifiers(record.files));
  } else {
    comment(snapshot.text, "Nothing is masked: serial numbers and other identifiers are as they were read.");
  }
  if (!snapshot.error.empty()) {
    // Not the error itself: it names the captured directory.
    comment(snapshot.text, "No inventory came of it; reading this file as a source says why.");
  }
  snapshot.text += writeArchive(record.files);
  return snapshot;
}

}  // namespace Tarn::Inventory
