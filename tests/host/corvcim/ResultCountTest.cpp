#include "host/corvcim/operations/ResultCount.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>

#include "platform/inventory/ProcessTree.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Corvcim {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A machine with that many cores and caches in each of two processors, and an empty socket.
class ResultCount : public testing::Test {
 protected:
  static void readMachine(unsigned int cores, unsigned int caches) {
    Tarn::Inventory::TreeBuilder builder;
    builder.system();
    for (const std::string processor : {"P0", "P1"}) {
      builder.processor(processor);
      for (unsigned int i = 0; i < cores; ++i) {
        builder.core(processor + ".C" + std::to_string(i));
      }
      for (unsigned int i = 0; i < caches; ++i) {
        builder.cache(processor + ".L1." + std::to_string(i));
      }
    }
    builder.processor("P2").status(Tarn::Inventory::Status::emptySocket);
    Tarn::Inventory::setProcessTree(std::make_shared<const Tarn::Inventory::Tree>(builder.build()));
    setenv("CORVANE_INVENTORY", "json:machine.json", 1);
  }

  ~ResultCount() override {
    Tarn::Inventory::setProcessTree(nullptr);
    unsetenv("CORVANE_INVENTORY");
  }

  static std::vector<std::string> missing(OperationKind kind, const std::string& className, std::size_t results) {
    const ObjectPath path = {{}, "root/cimv2", className, {}};
    Response response;
    if (givesPaths(kind)) {
      response.paths.assign(results, path);
    } else {
      response.instances.assign(results, {path, {}});
    }
    return describeMissingResults({kind, path, {}, {}}, response);
  }

  static constexpr OperationKind instances_ = OperationKind::EnumerateInstances;
  static constexpr OperationKind names_ = OperationKind::EnumerateInstanceNames;
};

TEST_F(ResultCount, PartsBeyondSixteenBitsAreMissedInInstancesAndNames) {
  readMachine(35000, 1);
  const std::string line =
      "4464 of 70000 results: the library counts them in 16 bits and leaves out the rest; "
      "'corvcim inventory' lists all parts";

  EXPECT_THAT(missing(instances_, "HALDA_CPUProcessorCore", 4464), ElementsAre(line));
  EXPECT_THAT(missing(names_, "HALDA_CPUProcessorCore", 4464), ElementsAre(line));
  EXPECT_THAT(missing(names_, "HALDA_CPUProcessorCore", 70000), IsEmpty());
}

TEST_F(ResultCount, NamesOfLinksAreComplete) {
  readMachine(200, 200);

  EXPECT_THAT(missing(instances_, "HALDA_CPUCoreAssociatedCacheMemory", 14464),
              ElementsAre("14464 of 80000 results: the library counts them in 16 "
                          "bits and leaves out the rest; ein lists the paths of all"));
  EXPECT_THAT(missing(names_, "HALDA_CPUCoreAssociatedCacheMemory", 80000), IsEmpty());
}

TEST_F(ResultCount, ExactlyTheLimitIsDelivered) {
  readMachine(1, 1);
  EXPECT_THAT(missing(instances_, "HALDA_CPUProcessor", 0), IsEmpty());
  readMachine(255, 128);
  EXPECT_THAT(missing(instances_, "HALDA_CPUCoreAssociatedCacheMemory", 0), IsEmpty());
  readMachine(256, 128);
  EXPECT_EQ(missing(instances_, "HALDA_CPUCoreAssociatedCacheMemory", 0).size(), 1U);
}

TEST_F(ResultCount, EachClassOfAnEnumerationIsCounted) {
  readMachine(33000, 33000);

  const std::vector<std::string> lines = missing(instances_, "CIM_ManagedElement", 0);

  std::vector<std::string> classes;
  for (const std::string& line : lines) {
    classes.push_back(line.substr(0, line.find(':')));
  }
  EXPECT_THAT(classes, ElementsAre("HALDA_CPUProcessorCore", "HALDA_CPUMemory"));
}

}  // namespace
}  // namespace Corvcim
