#ifndef CORVANE_TESTS_PLATFORM_INVENTORY_KERNELFILES_H
#define CORVANE_TESTS_PLATFORM_INVENTORY_KERNELFILES_H

#include <optional>
#include <string>
#include <vector>

#include "platform/inventory/sources/files/MemoryFileSystem.h"
#include "platform/inventory/tree/Tree.h"
#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Inventory {

/// Where the files of CPUs lie, as a FileSystem takes it.
inline const std::string cpuDirectory = "sys/devices/system/cpu/";

/// The files with which a kernel describes a machine, made up call by call. What a call does not name is
/// not there, but for SMBIOS tables in which nothing stands, so that nothing is said of them.
class KernelFiles {
 public:
  KernelFiles();

  struct Cpu {
    std::optional<int> package = 0;
    std::optional<int> core = {};
    std::optional<int> die = {};
    std::optional<int> cluster = {};
    std::string siblings = {};         ///< empty: no such file
    std::string packageSiblings = {};  ///< empty: no such file
  };
  struct Cache {
    unsigned int level = 1;
    std::string type = "Unified";
    std::string cpus = {};
    std::string id = {};  ///< empty: no such file; so for all that follow
    std::string size = "32K";
    std::string lineSize = "64";
    std::string sets = "64";
    std::string ways = "8";
    std::string writePolicy = {};
  };

  /// The lists of CPUs, present and online alike.
  KernelFiles& cpus(const std::string& list);
  KernelFiles& online(const std::string& list);

  KernelFiles& cpu(unsigned int number, const Cpu& cpu);
  KernelFiles& cache(unsigned int cpu, unsigned int index, const Cache& cache);
  KernelFiles& maxFrequency(unsigned int cpu, const std::string& kilohertz);

  /// A block of /proc/cpuinfo as x86 writes it.
  KernelFiles& x86Block(unsigned int cpu, const std::string& name = "Intel(R) Xeon(R) CPU");

  /// The firmware's tables.
  KernelFiles& firmware(const Support::SmbiosEncoder& tables);

  /// Any file: "sys/devices/system/cpu/online".
  KernelFiles& file(const std::string& path, const std::string& contents);
  KernelFiles& fail(const std::string& path, FileError error);
  KernelFiles& remove(const std::string& prefix);

  const MemoryFileSystem::Files& files() const { return files_; }

  /// The tree that the live source reads from them.
  Tree tree() const;

 private:
  void attribute(const std::string& path, const std::string& value);

  MemoryFileSystem::Files files_;
  std::string cpuInfo_;
};

/// The printable paths of the nodes of a type, in tree order.
std::vector<std::string> pathsOf(const Tree& tree, NodeLexicon::NodeType type);

/// The node with this printable path; the test fails where there is none.
const Node& nodeAt(const Tree& tree, const std::string& path);

/// A property of the node with this printable path; nothing where it does not have it.
std::optional<unsigned int> numberAt(const Tree& tree, const std::string& path, NodeLexicon::Properties id);
std::optional<std::string> textAt(const Tree& tree, const std::string& path, NodeLexicon::Properties id);

}  // namespace Tarn::Inventory

#endif
