// The completion for bash, called as bash calls it.

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

/// What bash offers after the words, the last of which is being typed.
std::string offered(const std::string& words) {
  return shell("source " CORVANE_BINARY_DIR "/host/completion/corvcim.bash\nCOMP_WORDS=(\"$corvcim\" " + words +
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

TEST(Completion, OffersTheOptionsOfTheVerb) {
  const std::string general = "--inventory --output --namespace --library --companion --language --help --version\n";

  EXPECT_EQ(offered("tree -"), general);
  EXPECT_EQ(offered("diff --i"), "--ignore\n");
  EXPECT_EQ(offered("ain -a"), "-ac -arc -ar -arr\n");
  EXPECT_EQ(offered("rin -a"), "-ac -arc -ar\n");
}

TEST(Completion, OffersValuesThatTheTablesHave) {
  EXPECT_EQ(offered("--language ''"), "de en es fr ja zh_CN\n");
  EXPECT_EQ(offered("-n ''"), "root/cimv2\n");
  EXPECT_EQ(offered("ai -ar ''"), "GroupComponent PartComponent Antecedent Dependent ManagedElement Capabilities\n");
  EXPECT_EQ(offered("diff --ignore Current"), "CurrentClockSpeed\n");
}

TEST(Completion, OffersEveryVerbOfTheHelp) {
  std::string verbs = shell(R"("$corvcim" --help | sed -n '/^Verbs:$/,/^$/s/^  \([a-z][a-z]*\).*/\1/p')").output;
  std::ranges::replace(verbs, '\n', ' ');
  verbs.back() = '\n';

  EXPECT_EQ(offered("''"), verbs);
}

TEST(WrittenTexts, HaveNoPartLeftOut) {
  EXPECT_EQ(shell("cd " CORVANE_BINARY_DIR "/host && grep -n '@[a-z-]*@' corvcim.1 completion/*"),
            (Finished{1, "", ""}));
}

TEST(WrittenTexts, TheManualHasTheOptionsOfTheHelp) {
  const Finished help = shell(
      "\"$corvcim\" --help | sed -n '/^Options/,/^Exit/s/^  *\\(-[a-zV]*\\|\\), *\\(-.*\\)/\\1 \\2/p' | "
      "grep -o '^-[a-zV]* --[a-z-]*'");
  const Finished manual = shell(
      "sed -n 's/^.It Fl \\([a-zA-Z]*\\).* Fl \\(-[a-z-]*\\).*/-\\1 -\\2/p' " CORVANE_BINARY_DIR "/host/corvcim.1");

  EXPECT_EQ(help.output, "-i --inventory\n-o --output\n-n --namespace\n-l --library\n-h --help\n-V --version\n");
  EXPECT_EQ(manual.output, help.output);
}

}  // namespace
}  // namespace Corvcim::Testing
