#include <gtest/gtest.h>

#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

Finished refused(const std::string& name) {
  return {1, "",
          "corvcim: cannot read the inventory: " + name +
              ": this corvcim was built without hwloc; use one that was built where libhwloc-dev is installed for its "
              "architecture, and read its JSON with json:FILE\n"};
}

TEST(WithoutHwloc, ADescriptionIsRefusedInOneLine) {
  const Directory directory;
  const std::string file = directory.write("machine.xml", "<topology/>");

  EXPECT_EQ(corvcim({"inventory", "--from", "hwloc:" + file}), refused(file));
  EXPECT_EQ(corvcim({"inventory", "--from", "hwloc-synthetic:pu:2"}), refused("\"pu:2\""));
}

}  // namespace
}  // namespace Corvcim::Testing
