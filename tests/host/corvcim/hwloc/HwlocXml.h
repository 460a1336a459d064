#ifndef TESTS_HOST_CORVCIM_HWLOC_HWLOCXML_H
#define TESTS_HOST_CORVCIM_HWLOC_HWLOCXML_H

#include <string>
#include <string_view>

namespace Corvcim::Testing {

/// An XML file as lstopo writes it, made up element by element. Sets are hexadecimal masks of CPUs.
class HwlocXml {
 public:
  /// The machine: the CPUs with a place, and all that there are. Empty: as the first.
  explicit HwlocXml(std::string_view cpus, std::string_view completeCpus = {}, std::string_view allowedCpus = {});

  /// Opens an object; what follows belongs to it until end(). No number: an empty text.
  HwlocXml& begin(std::string_view type, std::string_view number, std::string_view cpus,
                  std::string_view completeCpus = {}, std::string_view attributes = {});
  HwlocXml& cache(std::string_view type, std::string_view number, std::string_view cpus, std::string_view attributes);
  HwlocXml& info(std::string_view name, std::string_view value);
  HwlocXml& end();

  /// A core with one thread; CPU and core have the same number.
  HwlocXml& plainCore(unsigned int number);

  /// A thread, with nothing in it.
  HwlocXml& thread(unsigned int cpu);

  /// A remark on kinds of core, at the end of the file.
  HwlocXml& kind(std::string_view cpus, std::string_view name, std::string_view value);

  /// The whole document. All that was opened must have been closed.
  std::string text() const;

 private:
  std::string body_;
  std::string memory_;  // the machine's own, until it is placed
  std::string kinds_;
};

/// The mask of one CPU.
std::string maskOf(unsigned int cpu);

}  // namespace Corvcim::Testing

#endif
