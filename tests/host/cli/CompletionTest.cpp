// The completion for bash, called as bash calls it.

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "tests/host/cli/Program.h"

namespace Corvcim::Testing {
namespace {

/// What bash offers after the words, the last of which is being typed.
std::string offered(const std::string& words) {
  return shell("source " CORVANE_SOURCE_DIR "/host/completion/corvcim.bash\nCOMP_WORDS=(\"$corvcim\" " + words +
               ")\nCOMP_CWORD=$((${#COMP_WORDS[@]} - 1))\n_corvcim\necho \"${COMPREPLY[*]}\"")
      .output;
}

TEST(Completion, OffersTheFormatsThatTheVerbTakes) {
  EXPECT_EQ(offered("-o ''"), "text table csv mof json svg dot\n");
  EXPECT_EQ(offered("ei HALDA_CPUMemory -o ''"), "text table csv mof json\n");
  EXPECT_EQ(offered("tree --output ''"), "text json svg dot\n");
  EXPECT_EQ(offered("inventory -o ''"), "text json\n");
  EXPECT_EQ(offered("snapshot -o ''"), "text\n");
  EXPECT_EQ(offered("classes -o m"), "mof\n");
}

TEST(Completion, OffersTheRoleOfTheResultWhereThereIsOne) {
  EXPECT_NE(offered("ain -").find(" -ar -arr\n"), std::string::npos);
  EXPECT_NE(offered("rin -").find(" -ar\n"), std::string::npos);
}

TEST(Completion, OffersVerbsToHelpAndColumnsToTables) {
  EXPECT_EQ(offered("help cl"), "classes\n");
  EXPECT_NE(offered("ei HALDA_CPUMemory --").find(" --columns"), std::string::npos);
  EXPECT_EQ(offered("tree --").find(" --columns"), std::string::npos);
}

TEST(Completion, OffersEveryVerbOfTheHelp) {
  std::string verbs = shell(R"("$corvcim" --help | sed -n '/^Verbs:$/,/^$/s/^  \([a-z]*\).*/\1/p')").output;
  std::ranges::replace(verbs, '\n', ' ');
  verbs.back() = '\n';

  EXPECT_EQ(offered("''"), verbs);
}

}  // namespace
}  // namespace Corvcim::Testing
