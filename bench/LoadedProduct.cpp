#include "bench/LoadedProduct.h"

#include <dlfcn.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "bench/Rows.h"
#include "platform/inventory/tree/JsonTree.h"

namespace Corvane::Bench {
namespace {

namespace fs = std::filesystem;

/// Removes what is in it when the program ends.
class TemporaryDirectory {
 public:
  TemporaryDirectory() {
    std::string pattern = fs::temp_directory_path() / "corvane_bench.XXXXXX";
    require(mkdtemp(pattern.data()) != nullptr, "a temporary directory can be made");
    path_ = pattern;
  }
  TemporaryDirectory(const TemporaryDirectory&) = delete;
  TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;
  ~TemporaryDirectory() {
    std::error_code ignored;
    fs::remove_all(path_, ignored);
  }

  const fs::path& path() const { return path_; }

 private:
  fs::path path_;
};

/// A file name that was not used before.
fs::path newFile(const char* extension) {
  static const TemporaryDirectory directory;
  static int count = 0;
  return directory.path() / (std::to_string(++count) + extension);
}

}  // namespace

LoadedProduct::LoadedProduct(const Tarn::Inventory::Tree& machine) {
  const fs::path inventory = newFile(".json");
  std::ofstream(inventory) << writeJson(machine);
  setenv("CORVANE_INVENTORY", ("json:" + inventory.string()).c_str(), 1);

  const fs::path library = newFile(".so");
  fs::copy_file(CORVANE_PRODUCT_LIBRARY, library);
  handle_ = dlopen(library.c_str(), RTLD_NOW | RTLD_LOCAL);
  require(handle_ != nullptr, CORVANE_PRODUCT_LIBRARY, "can be loaded");
}

void* LoadedProduct::symbol(const std::string& name) const {
  void* address = dlsym(handle_, name.c_str());
  require(address != nullptr, name.c_str(), "is exported");
  return address;
}

CMPIInstanceMI* LoadedProduct::instances(const std::string& provider) const {
  using Create = CMPIInstanceMI*(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
  CMPIStatus status{};
  return reinterpret_cast<Create*>(symbol(provider + "_Create_InstanceMI"))(NullBroker::broker(), NullBroker::context(),
                                                                            &status);
}

CMPIAssociationMI* LoadedProduct::associations(const std::string& provider) const {
  using Create = CMPIAssociationMI*(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
  CMPIStatus status{};
  return reinterpret_cast<Create*>(symbol(provider + "_Create_AssociationMI"))(NullBroker::broker(),
                                                                               NullBroker::context(), &status);
}

}  // namespace Corvane::Bench
