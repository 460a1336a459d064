#include "host/corvcim/options/Options.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <vector>

#include "host/corvcim/options/Usage.h"

namespace Corvcim {
namespace {

using testing::ElementsAre;

Options parse(const std::vector<const char*>& arguments) {
  return parseOptions(arguments);
}

/// The error that the arguments give; empty if they are understood.
std::string complaint(const std::vector<const char*>& arguments) {
  try {
    parseOptions(arguments);
    return "";
  } catch (const UsageError& error) {
    return error.what();
  }
}

TEST(Options, NothingMeansTheOverviewOfThisMachine) {
  const Options options = parse({});

  EXPECT_EQ(options.verb->verb, Verb::Overview);
  EXPECT_EQ(options.format, Format::Text);
  EXPECT_EQ(options.nameSpace, "root/cimv2");
  EXPECT_EQ(options.library + options.companion + options.inventory + options.language, "");
}

TEST(Options, LongOptionsTakeTheirValueAsAWordOrAfterAnEqualsSign) {
  const Options options = parse({"--library", "a.so", "--companion=b.so", "--inventory", "json:x=y", "--language=de_AT",
                                 "--namespace=ROOT/cimv2", "--output", "text"});

  EXPECT_EQ(options.library, "a.so");
  EXPECT_EQ(options.companion, "b.so");
  EXPECT_EQ(options.inventory, "json:x=y");
  EXPECT_EQ(options.language, "de_AT");
  EXPECT_EQ(options.nameSpace, "ROOT/cimv2");
}

TEST(Options, ShortOptionsTakeTheirValueAsAWordOrGlued) {
  const Options options = parse({"-l", "a.so", "-ilive", "-nRoot/CIMv2", "-ojson", "classes"});

  EXPECT_EQ(options.library, "a.so");
  EXPECT_EQ(options.inventory, "live");
  EXPECT_EQ(options.nameSpace, "Root/CIMv2");
  EXPECT_EQ(options.format, Format::Json);
}

TEST(Options, MayStandAfterTheVerb) {
  const Options options = parse({"ei", "HALDA_CPUMemory", "-o", "mof", "DeviceID"});

  EXPECT_EQ(options.verb->verb, Verb::EnumerateInstances);
  EXPECT_THAT(options.operands, ElementsAre("HALDA_CPUMemory", "DeviceID"));
  EXPECT_EQ(options.format, Format::Mof);
  EXPECT_THAT(options.properties, ElementsAre("DeviceID"));
}

TEST(Options, PropertyListsAreSeparatedByCommas) {
  const Options options = parse({"ei", "HALDA_CPUProcessor", "DeviceID,Name,,Family"});

  EXPECT_TRUE(options.hasPropertyList);
  EXPECT_THAT(options.properties, ElementsAre("DeviceID", "Name", "Family"));
}

TEST(Options, AnEmptyPropertyListSelectsTheKeysAlone) {
  EXPECT_TRUE(parse({"ei", "HALDA_CPUProcessor", ""}).hasPropertyList);
  EXPECT_FALSE(parse({"ei", "HALDA_CPUProcessor"}).hasPropertyList);
}

TEST(Options, AssociationOptionsAreThoseOfWbemcli) {
  const Options options = parse({"ai", "-ac", "A", "-arc", "R", "-ar", "role", "-arr", "far", "X.K=1"});

  EXPECT_EQ(options.association.associationClass, "A");
  EXPECT_EQ(options.association.resultClass, "R");
  EXPECT_EQ(options.association.role, "role");
  EXPECT_EQ(options.association.resultRole, "far");
  EXPECT_THAT(options.operands, ElementsAre("X.K=1"));
}

TEST(Options, ReferencesTakeTheAssociationClassByEitherOption) {
  EXPECT_EQ(parse({"ri", "-arc", "A", "X.K=1"}).association.associationClass, "A");
  EXPECT_EQ(parse({"rin", "-ac", "A", "X.K=1"}).association.associationClass, "A");
  EXPECT_EQ(complaint({"ri", "-ac", "A", "-arc", "B", "X.K=1"}),
            "ri: '-ac' and '-arc' both name the association class; usage: corvcim [OPTION...] ri PATH [PROPERTY,...]");
  EXPECT_EQ(
      complaint({"rin", "-arr", "far", "X.K=1"}),
      "rin takes no option '-arr': it belongs to ai and ain, as a reference has no far end; see 'corvcim --help'");
}

TEST(Options, ColumnsAreAListOfPropertiesForTablesAndCsv) {
  const Options options = parse({"ein", "HALDA_CPUMemory", "-o", "csv", "--columns", "DeviceID,SystemName"});

  EXPECT_TRUE(options.hasPropertyList);
  EXPECT_THAT(options.properties, ElementsAre("DeviceID", "SystemName"));
  EXPECT_EQ(complaint({"ei", "A", "--columns", "B"}),
            "'--columns' is for '-o table' and '-o csv'; see 'corvcim --help'");
  EXPECT_EQ(complaint({"tree", "--columns", "B"}),
            "tree takes no option '--columns': its output has no columns; see 'corvcim --help'");
  EXPECT_EQ(complaint({"ei", "A", "B", "-o", "table", "--columns", "C"}),
            "ei: '--columns' and 'B' both name the columns; usage: corvcim [OPTION...] ei CLASS [PROPERTY,...]");
}

TEST(Options, TwoDashesEndThem) {
  EXPECT_EQ(parse({"ein", "--", "-strange"}).operand(0), "-strange");
}

TEST(Options, HelpNeedsNoOperands) {
  const Options options = parse({"gi", "--help"});

  EXPECT_TRUE(options.wantsHelp);
  EXPECT_EQ(options.verb->verb, Verb::GetInstance);
  EXPECT_TRUE(parse({"-h"}).wantsHelp);
  EXPECT_TRUE(parse({"-V"}).wantsVersion);
}

TEST(Options, UnknownWordsAreNamed) {
  EXPECT_EQ(complaint({"list"}), "unknown verb 'list'; see 'corvcim --help'");
  EXPECT_EQ(complaint({"--colour"}), "unknown option '--colour'; see 'corvcim --help'");
  EXPECT_EQ(complaint({"-x"}), "unknown option '-x'; see 'corvcim --help'");
  EXPECT_EQ(complaint({"-o", "xml", "classes"}),
            "unknown output format 'xml': it can be text, table, csv, mof, json, svg or dot; see 'corvcim --help'");
}

TEST(Options, MissingAndSurplusWordsAreNamed) {
  EXPECT_EQ(complaint({"ei"}), "ei: CLASS is missing; usage: corvcim [OPTION...] ei CLASS [PROPERTY,...]");
  EXPECT_EQ(complaint({"gi"}), "gi: PATH is missing; usage: corvcim [OPTION...] gi PATH [PROPERTY,...]");
  EXPECT_EQ(complaint({"ein", "A", "B"}), "ein: unexpected argument 'B'; usage: corvcim [OPTION...] ein CLASS");
  EXPECT_EQ(complaint({"tree", "now"}), "tree: unexpected argument 'now'; usage: corvcim [OPTION...] tree");
  EXPECT_EQ(complaint({"ei", "A", "-n"}), "option '-n' needs a value; see 'corvcim --help'");
  EXPECT_EQ(complaint({"--help=yes"}), "option '--help' takes no value; see 'corvcim --help'");
  EXPECT_EQ(complaint({"-n", "", "classes"}), "the namespace is empty; see 'corvcim --help'");
}

TEST(Options, FormatsBelongToVerbs) {
  EXPECT_EQ(complaint({"ei", "A", "-o", "svg"}),
            "ei has no output format 'svg': it can be text, table, csv, mof or json; see 'corvcim --help'");
  EXPECT_EQ(complaint({"tree", "-o", "mof"}),
            "tree has no output format 'mof': it can be text, json, svg or dot; see 'corvcim --help'");
  EXPECT_EQ(complaint({"-o", "svg"}),
            "the overview has no output format 'svg': it can be text, table, csv or json; see 'corvcim --help'");
}

TEST(Options, AssociationOptionsBelongToAssociationVerbs) {
  EXPECT_EQ(complaint({"ei", "A", "-ac", "B"}),
            "ei takes no option '-ac': it belongs to ai, ain, ri and rin; see 'corvcim --help'");
}

TEST(Options, DiffTakesTwoSources) {
  const Options options = parse({"diff", "live", "--ignore=status,cpus", "json:b.json"});

  EXPECT_THAT(options.operands, ElementsAre("live", "json:b.json"));
  EXPECT_FALSE(options.hasPropertyList);
  EXPECT_THAT(options.ignoredFields, ElementsAre("status", "cpus"));
}

TEST(Options, DiffNamesWhatIsMissing) {
  EXPECT_EQ(complaint({"diff"}), "diff: A is missing; usage: corvcim [OPTION...] diff A B");
  EXPECT_EQ(complaint({"diff", "live"}), "diff: B is missing; usage: corvcim [OPTION...] diff A B");
}

TEST(Options, ASourceThatThereIsNotIsNamed) {
  const std::string forms =
      " is neither a file nor another source of an inventory: it can be live, root:DIRECTORY, snapshot:FILE, "
      "json:FILE, smbios:FILE, hwloc:FILE, the name of a file, or - for standard input; see 'corvcim --help'";

  EXPECT_EQ(complaint({"-i", "machine.json", "tree"}), "--inventory: 'machine.json'" + forms);
  EXPECT_EQ(complaint({"--inventory=", "tree"}), "--inventory: ''" + forms);
  EXPECT_EQ(complaint({"diff", "live", "json:"}), "diff: 'json:'" + forms);
  EXPECT_EQ(complaint({"diff", "machine.json", "live"}), "diff: 'machine.json'" + forms);
}

TEST(Options, FilesDescriptionsAndStandardInputAreSources) {
  EXPECT_EQ(parse({"-i", "-", "tree"}).inventory, "-");
  EXPECT_EQ(parse({"-i", "/dev/null", "tree"}).inventory, "/dev/null");
  EXPECT_EQ(parse({"-i", "hwloc:machine.xml", "tree"}).inventory, "hwloc:machine.xml");
  EXPECT_THAT(parse({"diff", "-", "/"}).operands, ElementsAre("-", "/"));
}

TEST(Options, ANameThatIsNearlyRightIsSuggested) {
  EXPECT_EQ(complaint({"clases"}), "unknown verb 'clases'; did you mean classes?");
  EXPECT_EQ(complaint({"--invntory=live"}), "unknown option '--invntory=live'; did you mean --inventory?");
}

TEST(Options, NamespacesWithoutClassesAreRefused) {
  EXPECT_EQ(complaint({"-n", "root/x", "tree"}),
            "no class is served in the namespace 'root/x': it can be root/cimv2; see 'corvcim --help'");
  EXPECT_EQ(complaint({"-nroot/x", "tree"}), complaint({"-n", "root/x", "tree"}));
  EXPECT_EQ(complaint({"-nl", "tree"}), "unknown option '-nl'; see 'corvcim --help'");
  EXPECT_EQ(parse({"--as-is", "-n", "root/x", "ei", "A"}).nameSpace, "root/x");
}

TEST(Options, RequestsGoAsTheyAreOnDemand) {
  EXPECT_FALSE(parse({"ei", "A"}).asIs);
  EXPECT_TRUE(parse({"ri", "--as-is", "A.K=1"}).asIs);
  EXPECT_EQ(parse({"ai", "-ac", "", "A.K=1"}).association.associationClass, "");
  EXPECT_EQ(parse({"ai", "A.K=1"}).association.associationClass, std::nullopt);
  EXPECT_EQ(complaint({"tree", "--as-is"}),
            "tree takes no option '--as-is': it belongs to ei, ein, gi, ai, ain, ri and rin; see 'corvcim --help'");
}

TEST(Options, LanguagesAreThoseOfTheTexts) {
  EXPECT_EQ(parse({"--language", "fr_CA.UTF-8", "tree"}).language, "fr_CA.UTF-8");
  EXPECT_EQ(complaint({"--language", "fi", "tree"}),
            "unknown language 'fi': it can be de, en, es, fr, ja, zh_CN; see 'corvcim --help'");
  EXPECT_EQ(complaint({"--language=", "tree"}),
            "unknown language '': it can be de, en, es, fr, ja, zh_CN; see 'corvcim --help'");
}

TEST(Options, SnapshotMayNameAFileAndKeepIdentifiers) {
  const Options toOutput = parse({"snapshot"});
  const Options toFile = parse({"snapshot", "--unmasked", "machine.txt"});

  EXPECT_EQ(toOutput.operand(0), "");
  EXPECT_FALSE(toOutput.unmasked);
  EXPECT_EQ(toFile.operand(0), "machine.txt");
  EXPECT_TRUE(toFile.unmasked);
  EXPECT_EQ(complaint({"snapshot", "a", "b"}),
            "snapshot: unexpected argument 'b'; usage: corvcim [OPTION...] snapshot [FILE]");
}

TEST(Options, OptionsOfOneVerbAreRefusedByTheOthers) {
  EXPECT_EQ(complaint({"diff", "live", "live", "--inventory=live"}),
            "diff takes no option '--inventory': A and B say which inventories; see 'corvcim --help'");
  EXPECT_EQ(complaint({"tree", "--ignore", "cpus"}),
            "tree takes no option '--ignore': it belongs to diff; see 'corvcim --help'");
}

TEST(Options, LanguagesBelongToText) {
  EXPECT_EQ(complaint({"ei", "A", "--language", "de", "-o", "json"}),
            "'--language' is for text: csv, mof and json are the same in every language; see 'corvcim --help'");
}

TEST(Options, HelpFitsInEightyColumns) {
  std::string help = programHelp();
  for (const VerbSyntax& syntax : verbs()) {
    help += verbHelp(syntax);
  }
  std::istringstream lines(help);
  for (std::string line; std::getline(lines, line);) {
    EXPECT_LE(line.size(), 80U) << line;
  }
}

TEST(Options, EveryVerbIsFoundByItsName) {
  for (const VerbSyntax& syntax : verbs()) {
    EXPECT_EQ(findVerb(syntax.name), &syntax);
  }
  EXPECT_EQ(findVerb(""), nullptr);
}

}  // namespace
}  // namespace Corvcim
