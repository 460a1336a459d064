#include "platform/inventory/sources/live/SocketAssignment.h"

#include <algorithm>
#include <utility>

#include "platform/inventory/sources/firmware/SocketMatching.h"
#include "platform/inventory/sources/live/NodePaths.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

std::optional<unsigned int> valueOf(const unsigned int* number) {
  return number == nullptr ? std::nullopt : std::optional(*number);
}

ProcessorIdentity identityOf(const KernelProcessor& processor) {
  return {.signature = processor.identity.processorId,
          .name = comparableName(processor.identity.name),
          .cores = valueOf(processor.facts.number(PropProcessorCores)),
          .threads = valueOf(processor.facts.number(PropHardwareThreads))};
}

class Assigner {
 public:
  Assigner(const std::vector<Socket>& sockets, const KernelView& kernel, const std::vector<KernelProcessor>& processors)
      : sockets_(sockets), kernel_(kernel), processors_(processors) {
    result_.packages.resize(processors.size());
  }

  SocketAssignment assign() {
    if (processors_.empty()) {
      for (const Socket& socket : sockets_) {
        result_.standalone.push_back(&socket);
      }
    } else if (!sockets_.empty()) {
      match();
      addStandalone();
    }
    return std::move(result_);
  }

 private:
  // Those are matched whose processor can be at work. Where the kernel has as many packages as there are processors
  // at all, it works with those that the firmware calls disabled as well; and so it may where the others are
  // not the kernel's processors, which would else be in the tree a second time, as disabled.
  void match() {
    std::vector<const Socket*> populated;
    std::vector<const Socket*> enabled;
    for (const Socket& socket : sockets_) {
      if (socket.isPopulated()) {
        populated.push_back(&socket);
      }
      if (socket.isEnabled()) {
        enabled.push_back(&socket);
      }
    }
    enabled_ = enabled.size();
    std::vector<ProcessorIdentity> packages;
    packages.reserve(processors_.size());
    for (const KernelProcessor& processor : processors_) {
      packages.push_back(identityOf(processor));
    }
    const bool areAll = enabled.size() != packages.size() && populated.size() == packages.size();
    const SocketMatching matching = matchSockets(identitiesOf(areAll ? populated : enabled), packages);
    if (!areAll && enabled.size() < populated.size() && isRefused(matching)) {
      const SocketMatching ofAll = matchSockets(identitiesOf(populated), packages);
      if (ofAll.contradictions.empty()) {
        take(std::move(populated), ofAll, packages);
        return;
      }
    }
    take(areAll ? std::move(populated) : std::move(enabled), matching, packages);
  }

  static std::vector<ProcessorIdentity> identitiesOf(const std::vector<const Socket*>& sockets) {
    std::vector<ProcessorIdentity> identities;
    identities.reserve(sockets.size());
    for (const Socket* socket : sockets) {
      identities.push_back(socket->identity);
    }
    return identities;
  }

  // Whether there are as many sockets as packages and it is the signatures that do not fit.
  static bool isRefused(const SocketMatching& matching) {
    return std::ranges::any_of(matching.contradictions, [](const SocketMatching::Contradiction& contradiction) {
      return contradiction.sockets.size() == contradiction.packages.size();
    });
  }

  void take(std::vector<const Socket*> candidates, const SocketMatching& matching,
            const std::vector<ProcessorIdentity>& packages) {
    candidates_ = std::move(candidates);
    for (std::size_t i = 0; i < packages.size(); ++i) {
      const SocketMatching::Match& match = matching.packages[i];
      if (match.socket != SocketMatching::none) {
        result_.packages[i] = {candidates_[match.socket], match.rule};
      }
    }
    for (const std::size_t socket : matching.unseen) {
      unseen_.push_back(candidates_[socket]);
    }
    for (const SocketMatching::Contradiction& contradiction : matching.contradictions) {
      addContradiction(contradiction, packages);
    }
  }

  void addContradiction(const SocketMatching::Contradiction& contradiction,
                        const std::vector<ProcessorIdentity>& packages) {
    if (contradiction.sockets.size() == 1 && contradiction.packages.size() == 1) {
      const std::size_t package = contradiction.packages.front();
      const Socket& socket = *candidates_[contradiction.sockets.front()];
      const Facts::Fact* told = processors_[package].facts.find(PropProcessorId);
      result_.disagreements.push_back(
          {processorPath(kernel_.topology.packages[package]), "ProcessorId", packages[package].signature,
           told == nullptr ? kernelSource() : told->explain().source, socket.identity.signature,
           Smbios::placeOf(socket.structure->structure, socket.structure->id)});
      return;
    }
    std::string paths;
    for (const std::size_t package : contradiction.packages) {
      paths += (paths.empty() ? ": " : ", ") + processorPath(kernel_.topology.packages[package]);
    }
    std::string labels;
    std::string places;
    for (const std::size_t socket : contradiction.sockets) {
      labels += (labels.empty() ? ": " : ", ") + candidates_[socket]->label;
      places += (places.empty() ? "" : "; ") + Smbios::placeOf(candidates_[socket]->structure->structure);
    }
    result_.disagreements.push_back({"system", "processors", std::to_string(contradiction.packages.size()) + paths,
                                     kernelSource(), std::to_string(contradiction.sockets.size()) + labels,
                                     places.empty() ? "SMBIOS" : places});
  }

  void addStandalone() {
    for (const Socket& socket : sockets_) {
      const bool isCandidate = std::ranges::binary_search(candidates_, &socket);
      const bool isUnseen = std::ranges::binary_search(unseen_, &socket);
      // Where the kernel has more packages than there are enabled sockets, it may well see a disabled one.
      const bool isDisabled = socket.isPopulated() && !isCandidate && processors_.size() <= enabled_;
      if (!socket.isPopulated() || isUnseen || isDisabled) {
        result_.standalone.push_back(&socket);
      }
      if (isUnseen && socket.isEnabled()) {
        result_.disagreements.push_back({socket.path, "status", std::to_string(socket.status),
                                         socket.statusOrigin().source, "(no such processor)", kernelSource()});
      }
    }
  }

  std::string kernelSource() const { return kernel_.machine.root().files().nameOf(kernelCpuDirectory); }

  const std::vector<Socket>& sockets_;
  const KernelView& kernel_;
  const std::vector<KernelProcessor>& processors_;
  std::vector<const Socket*> candidates_;  // in the order of sockets_, and so ascending
  std::size_t enabled_ = 0;
  std::vector<const Socket*> unseen_;  // in the order of sockets_
  SocketAssignment result_;
};

}  // namespace

SocketAssignment assignSockets(const std::vector<Socket>& sockets, const KernelView& kernel,
                               const std::vector<KernelProcessor>& processors) {
  return Assigner(sockets, kernel, processors).assign();
}

}  // namespace Tarn::Inventory
