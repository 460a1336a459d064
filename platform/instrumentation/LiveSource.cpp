#include "platform/instrumentation/LiveSource.h"

#include <string>

#include "platform/instrumentation/CacheNodes.h"
#include "platform/instrumentation/CoreNodes.h"
#include "platform/instrumentation/Error.h"
#include "platform/instrumentation/Facts.h"
#include "platform/instrumentation/KernelProcessor.h"
#include "platform/instrumentation/KernelView.h"
#include "platform/instrumentation/Machine.h"
#include "platform/instrumentation/NodePaths.h"
#include "platform/instrumentation/SystemModel.h"
#include "platform/instrumentation/TreeBuilder.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

class LiveReader {
 public:
  LiveReader(FileSystem& root, Detail detail) : machine_(root, detail), kernel_(machine_), tree_(detail) {
    if (kernel_.topology.packages.empty()) {
      throw InventoryError("can not read the inventory", root.nameOf("sys/devices/system/cpu"),
                           "neither this directory nor /proc/cpuinfo tells of a processor",
                           "mount sysfs on /sys and proc on /proc");
    }
  }

  Tree read() {
    addSystem();
    for (const Package& package : kernel_.topology.packages) {
      const std::string path = processorPath(package);
      addProcessor(package, path);
      addCores(tree_, kernel_, package, path);
      addCaches(tree_, kernel_, package, path);
    }
    for (const Unread& entry : machine_.unread().entries()) {
      tree_.unread(entry);
    }
    return tree_.build();
  }

 private:
  void addSystem() {
    const Facts facts = readSystemFacts(machine_);
    tree_.system().status(Status::inUse).from([] {
      return Origin{"(fixed)", "", "the computer that tells this is in use"};
    });
    addSystemDescription(facts.find(PropSystemModel));
    facts.addTo(tree_);
  }

  void addSystemDescription(const Facts::Fact* model) {
    if (model != nullptr) {
      tree_.description(describe(model->value)).from(model->explain);
    } else {
      tree_.description("Computer system").from([] { return Origin{"(fixed)", "", "no source tells the model"}; });
    }
  }

  void addProcessor(const Package& package, const std::string& path) {
    const KernelProcessor processor = readKernelProcessor(kernel_, package);
    tree_.processor(path).cpus(package.cpus);
    tree_.status(kernel_.statusOf(package.cpus)).from([&] { return kernel_.statusOrigin(package.cpus); });
    tree_.description(describeByPath("Processor", path)).from([&] {
      return originOfPackage(
          kernel_, package,
          path.find('@') == std::string::npos ? "the kernel's number of the package" : "the lowest CPU of the package");
    });
    processor.facts.addTo(tree_);
  }

  Machine machine_;
  const KernelView kernel_;
  TreeBuilder tree_;
};

}  // namespace

Tree readLiveInventory(FileSystem& root, Detail detail) {
  return LiveReader(root, detail).read();
}

}  // namespace Tarn::Inventory
