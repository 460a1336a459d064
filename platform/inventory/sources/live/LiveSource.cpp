#include "platform/inventory/sources/live/LiveSource.h"

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/firmware/Socket.h"
#include "platform/inventory/sources/kernel/KernelProcessor.h"
#include "platform/inventory/sources/kernel/KernelView.h"
#include "platform/inventory/sources/kernel/Machine.h"
#include "platform/inventory/sources/kernel/NumaNodes.h"
#include "platform/inventory/sources/kernel/SystemModel.h"
#include "platform/inventory/sources/live/CacheNodes.h"
#include "platform/inventory/sources/live/CoreNodes.h"
#include "platform/inventory/sources/live/FirmwareCaches.h"
#include "platform/inventory/sources/live/NodePaths.h"
#include "platform/inventory/sources/live/Reconciliation.h"
#include "platform/inventory/sources/live/SocketAssignment.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/Facts.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

class LiveReader {
 public:
  LiveReader(FileSystem& root, Detail detail) : machine_(root, detail), kernel_(machine_), tree_(detail) {}

  /// Forgets which of the kernel's files could not be read.
  void expectNoKernel() { machine_.unread() = UnreadLog(); }

  void readFirmware() {
    firmware_ = readFirmwareTables(machine_);
    if (firmware_) {
      sockets_ = readSockets(firmware_->tables);
    }
  }

  bool knowsProcessors() const { return !kernel_.topology.packages.empty() || !sockets_.empty(); }
  std::vector<Unread> unread() { return machine_.unread().entries(); }

  Tree read() {
    addSystem();
    const std::vector<KernelProcessor> processors = readProcessors();
    const SocketAssignment assignment = assignSockets(sockets_, kernel_, processors);
    disagreements_.insert(disagreements_.end(), assignment.disagreements.begin(), assignment.disagreements.end());
    for (std::size_t i = 0; i < processors.size(); ++i) {
      addPackage(kernel_.topology.packages[i], processors[i], assignment.packages[i]);
    }
    for (const Socket* socket : assignment.standalone) {
      addSocket(*socket);
    }
    for (NumaNode& node : readNumaNodes(machine_)) {
      tree_.numaNode(std::move(node));
    }
    for (const Unread& entry : machine_.unread().entries()) {
      tree_.unread(entry);
    }
    for (const Disagreement& entry : disagreements_) {
      tree_.disagreement(entry);
    }
    return tree_.build();
  }

 private:
  void addSystem() {
    const Facts told = firmware_ ? systemFacts(firmware_->tables) : Facts();
    const Facts kernel = readSystemFacts(machine_, firmware_ ? &told : nullptr);
    const Facts facts = reconcile(kernel, told, "system", disagreements_);
    tree_.system().status(Status::inUse).from([] {
      return Origin{"(fixed)", "", "the computer that tells this is in use"};
    });
    const Facts::Fact* model = facts.find(PropSystemModel);
    if (model != nullptr) {
      tree_.description(describe(model->value)).from(model->explain);
    } else {
      tree_.description("Computer system").from([] { return Origin{"(fixed)", "", "no source tells the model"}; });
    }
    facts.addTo(tree_);
  }

  std::vector<KernelProcessor> readProcessors() const {
    std::vector<KernelProcessor> processors;
    for (const Package& package : kernel_.topology.packages) {
      processors.push_back(readKernelProcessor(kernel_, package));
    }
    return processors;
  }

  void addPackage(const Package& package, const KernelProcessor& processor,
                  const SocketAssignment::PackageSocket& assigned) {
    const std::string path = processorPath(package);
    tree_.processor(path).cpus(package.cpus);
    tree_.status(kernel_.statusOf(package.cpus)).from([&] { return kernel_.statusOrigin(package.cpus); });
    tree_.description(describeByPath("Processor", path)).from([&] {
      return originOfPackage(
          kernel_, package,
          path.find('@') == std::string::npos ? "the kernel's number of the package" : "the lowest CPU of the package");
    });
    if (assigned.socket == nullptr) {
      processor.facts.addTo(tree_);
    } else {
      compareStatus(package, *assigned.socket, path);
      reconcile(processor.facts, socketFacts(*assigned.socket, assigned.rule), path, disagreements_).addTo(tree_);
    }
    addCores(tree_, kernel_, package, path);
    addCachesOf(package, assigned.socket, path);
  }

  // The processor runs, whatever the firmware says of it.
  void compareStatus(const Package& package, const Socket& socket, const std::string& path) {
    if (socket.status != Status::inUse) {
      disagreements_.push_back({path, "status", std::to_string(kernel_.statusOf(package.cpus)),
                                kernel_.statusOrigin(package.cpus).source, std::to_string(socket.status),
                                socket.statusOrigin().source});
    }
  }

  void addCachesOf(const Package& package, const Socket* socket, const std::string& path) {
    const std::vector<const Cache*> kernel = kernel_.cachesOf(package);
    const std::vector<FirmwareCache> told =
        socket == nullptr ? std::vector<FirmwareCache>() : cachesOf(*socket, firmware_->tables);
    if (kernel.empty()) {
      addFirmwareCaches(tree_, told, path, offlineOrigin(package));
      return;
    }
    addCaches(tree_, kernel_, package, path, told);
    // The kernel hides the caches of CPUs that are offline.
    if (package.cpus.isSubsetOf(kernel_.topology.online)) {
      compareCaches(told, kernel, machine_.cpus().files(), path, disagreements_);
    }
  }

  // Why the parts of a package are offline; empty where one of its CPUs is online.
  Facts::Explain offlineOrigin(const Package& package) const {
    if (kernel_.isOnline(package.cpus)) {
      return {};
    }
    return [this, &package] {
      return kernel_.onlineOrigin(package.cpus, "none of the processor's CPUs is online: offline, 12");
    };
  }

  // A socket that stands for itself: nothing is known of it but what the firmware says.
  void addSocket(const Socket& socket) {
    tree_.processor(socket.path).status(socket.status).from([&] { return socket.statusOrigin(); });
    tree_.description("Socket " + socket.label).from([&] { return socket.labelOrigin(); });
    Facts facts = socketFacts(socket, {});
    if (socket.status == Status::inUse || socket.status == Status::disabled) {
      addRequestedStates(facts);
    }
    facts.addTo(tree_);
    if (socket.isPopulated()) {
      addFirmwareCaches(tree_, cachesOf(socket, firmware_->tables), socket.path, {});
    }
  }

  Machine machine_;
  const KernelView kernel_;
  std::unique_ptr<const FirmwareTables> firmware_;
  std::vector<Socket> sockets_;
  std::vector<Disagreement> disagreements_;
  TreeBuilder tree_;
};

}  // namespace

Tree readLiveInventory(FileSystem& root, Detail detail) {
  LiveReader reader(root, detail);
  reader.readFirmware();
  if (!reader.knowsProcessors()) {
    throw InventoryError("cannot read the inventory", root.nameOf(kernelCpuDirectory),
                         "neither this directory nor /proc/cpuinfo lists a processor",
                         "mount sysfs on /sys and proc on /proc; a captured root holds both as sys and proc");
  }
  return reader.read();
}

Tree readFirmwareInventory(FileSystem& root, Detail detail) {
  LiveReader reader(root, detail);
  reader.expectNoKernel();
  reader.readFirmware();
  if (!reader.knowsProcessors()) {
    const std::vector<Unread> unread = reader.unread();
    throw InventoryError("cannot read the inventory", root.nameOf(tableFile),
                         unread.empty() ? "its tables list no processor socket" : unread.front().reason,
                         "name a dump of a machine's SMBIOS tables, or join it with another source: smbios:FILE+live");
  }
  return reader.read();
}

}  // namespace Tarn::Inventory
