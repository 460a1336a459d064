#include "tests/host/corvcim/hwloc/HwlocXml.h"

#include <cstdio>
#include <utility>

namespace Corvcim::Testing {
namespace {

std::string attribute(std::string_view name, std::string_view value) {
  return value.empty() ? "" : ' ' + std::string(name) + "=\"" + std::string(value) + '"';
}

}  // namespace

HwlocXml::HwlocXml(std::string_view cpus, std::string_view completeCpus, std::string_view allowedCpus) {
  begin("Machine", "0", cpus, completeCpus,
        attribute("allowed_cpuset", allowedCpus.empty() ? cpus : allowedCpus) + attribute("allowed_nodeset", "0x1"));
}

HwlocXml& HwlocXml::begin(std::string_view type, std::string_view number, std::string_view cpus,
                          std::string_view completeCpus, std::string_view attributes) {
  const std::string sets = attribute("cpuset", cpus) +
                           attribute("complete_cpuset", completeCpus.empty() ? cpus : completeCpus) +
                           attribute("nodeset", "0x1") + attribute("complete_nodeset", "0x1");
  if (type == "Machine") {
    memory_ = R"(<object type="NUMANode" os_index="0" local_memory="1024")" + sets + "/>\n";
  } else {
    // After the machine's remarks, before its other parts.
    body_ += std::exchange(memory_, "");
  }
  body_ += "<object" + attribute("type", type) + attribute("os_index", number) + sets;
  body_ += attributes;
  body_ += ">\n";
  return *this;
}

HwlocXml& HwlocXml::cache(std::string_view type, std::string_view number, std::string_view cpus,
                          std::string_view attributes) {
  return begin(type, number, cpus, {}, ' ' + std::string(attributes));
}

HwlocXml& HwlocXml::info(std::string_view name, std::string_view value) {
  body_ += "<info" + attribute("name", name) + attribute("value", value) + "/>\n";
  return *this;
}

HwlocXml& HwlocXml::end() {
  body_ += "</object>\n";
  return *this;
}

HwlocXml& HwlocXml::plainCore(unsigned int number) {
  return begin("Core", std::to_string(number), maskOf(number)).thread(number).end();
}

HwlocXml& HwlocXml::thread(unsigned int cpu) {
  return begin("PU", std::to_string(cpu), maskOf(cpu)).end();
}

HwlocXml& HwlocXml::kind(std::string_view cpus, std::string_view name, std::string_view value) {
  kinds_ += "<cpukind" + attribute("cpuset", cpus) + ">\n<info" + attribute("name", name) + attribute("value", value) +
            "/>\n</cpukind>\n";
  return *this;
}

std::string HwlocXml::text() const {
  return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<!DOCTYPE topology SYSTEM \"hwloc2.dtd\">\n"
         "<topology version=\"2.0\">\n" +
         body_ + "</object>\n" + kinds_ + "</topology>\n";
}

std::string maskOf(unsigned int cpu) {
  char mask[16];
  std::snprintf(mask, sizeof mask, "0x%08x", 1U << cpu);
  return mask;
}

}  // namespace Corvcim::Testing
