// The reader of captured files: what it accepts is written and read back as the same files, and the live source makes
// a tree of them or says why not.

#include "fuzz/Target.h"
#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/Error.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace Tarn::Inventory;
  try {
    MemoryFileSystem files(readArchive(Corvane::Fuzz::textOf(data, size), "input"));
    const MemoryFileSystem::Files again = readArchive(writeArchive(files.files()), "output");
    Corvane::Fuzz::require(again == files.files(), "files are read back as they were written");
    readLiveInventory(files);
  } catch (const InventoryError&) {
    return 0;
  }
  return 0;
}
