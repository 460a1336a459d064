#include "platform/inventory/sources/firmware/SocketMatching.h"

#include <gtest/gtest.h>

namespace Tarn::Inventory {
namespace {

using Identities = std::vector<ProcessorIdentity>;

constexpr std::size_t none = SocketMatching::none;

/// The socket of each package.
std::vector<std::size_t> socketsOf(const SocketMatching& matching) {
  std::vector<std::size_t> sockets;
  for (const SocketMatching::Match& match : matching.packages) {
    sockets.push_back(match.socket);
  }
  return sockets;
}

TEST(SocketMatching, OneSocketAndOnePackageAreOneProcessor) {
  const SocketMatching matching = matchSockets(Identities{{}}, Identities{{}});

  EXPECT_EQ(socketsOf(matching), std::vector<std::size_t>{0});
  EXPECT_EQ(matching.packages[0].rule, "the only one that is left on both sides");
  EXPECT_TRUE(matching.unseen.empty());
  EXPECT_TRUE(matching.contradictions.empty());
}

TEST(SocketMatching, SaysByWhatAProcessorWasFound) {
  const ProcessorIdentity identity{.signature = "57 06 05 00", .name = "xeon", .cores = 8, .threads = 16};

  EXPECT_EQ(matchSockets(Identities{identity}, Identities{identity}).packages[0].rule,
            "the same signature, name, number of cores, number of threads");
}

struct MatchingRow {
  const char* what;
  Identities sockets;
  Identities packages;
  std::vector<std::size_t> expected;
};

class MatchingByIdentity : public testing::TestWithParam<MatchingRow> {};

TEST_P(MatchingByIdentity, DoesNotFollowTheOrder) {
  const SocketMatching matching = matchSockets(GetParam().sockets, GetParam().packages);

  EXPECT_EQ(socketsOf(matching), GetParam().expected) << GetParam().what;
  EXPECT_TRUE(matching.contradictions.empty());
}

INSTANTIATE_TEST_SUITE_P(
    All, MatchingByIdentity,
    testing::Values(
        MatchingRow{"signatures",
                    Identities{{.signature = "B"}, {.signature = "A"}},
                    Identities{{.signature = "A"}, {.signature = "B"}},
                    {1, 0}},
        MatchingRow{
            "names", Identities{{.name = "b"}, {.name = "a"}}, Identities{{.name = "a"}, {.name = "b"}}, {1, 0}},
        MatchingRow{"cores", Identities{{.cores = 16}, {.cores = 8}}, Identities{{.cores = 8}, {.cores = 16}}, {1, 0}},
        MatchingRow{
            "threads", Identities{{.threads = 4}, {.threads = 2}}, Identities{{.threads = 2}, {.threads = 4}}, {1, 0}},
        MatchingRow{"names where signatures are alike",
                    Identities{{.signature = "A", .name = "b"}, {.signature = "A", .name = "a"}},
                    Identities{{.signature = "A", .name = "a"}, {.signature = "A", .name = "b"}},
                    {1, 0}},
        MatchingRow{"what is left over by the others",
                    Identities{{.name = "generic"}, {.name = "a"}},
                    Identities{{.name = "a"}, {.name = "b"}},
                    {1, 0}},
        MatchingRow{"a signature that is not known",
                    Identities{{}, {.signature = "A"}},
                    Identities{{.signature = "A"}, {}},
                    {1, 0}}));

TEST(SocketMatching, WhatIdentityDoesNotTellApartGoesByOrder) {
  const ProcessorIdentity alike{.signature = "A", .name = "xeon"};

  const SocketMatching matching = matchSockets(Identities{alike, alike, alike}, Identities{alike, alike, alike});

  EXPECT_EQ(socketsOf(matching), (std::vector<std::size_t>{0, 1, 2}));
  EXPECT_EQ(matching.packages[1].rule,
            "the same signature, name; 3 are alike, so by order: ascending handle to ascending package number");
  EXPECT_EQ(matchSockets(Identities{{}, {}}, Identities{{}, {}}).packages[0].rule,
            "2 are alike, so by order: ascending handle to ascending package number");
}

TEST(SocketMatching, MoreSocketsThanPackagesAreAContradiction) {
  const ProcessorIdentity alike{.signature = "A"};

  const SocketMatching matching = matchSockets(Identities{alike, alike}, Identities{alike});

  EXPECT_EQ(socketsOf(matching), std::vector<std::size_t>{none});
  ASSERT_EQ(matching.contradictions.size(), 1U);
  EXPECT_EQ(matching.contradictions[0].sockets, (std::vector<std::size_t>{0, 1}));
  EXPECT_EQ(matching.contradictions[0].packages, std::vector<std::size_t>{0});
  EXPECT_TRUE(matching.unseen.empty());
}

TEST(SocketMatching, MorePackagesThanSocketsAreAContradiction) {
  const SocketMatching matching = matchSockets(Identities{{}}, Identities{{}, {}});

  EXPECT_EQ(socketsOf(matching), (std::vector<std::size_t>{none, none}));
  EXPECT_EQ(matching.contradictions.size(), 1U);
}

TEST(SocketMatching, NothingIsKnownAndMoreAreLeft) {
  const SocketMatching matching = matchSockets(Identities{{.cores = 4}, {}}, Identities{{.cores = 6}, {.name = "x"}});

  EXPECT_EQ(socketsOf(matching), (std::vector<std::size_t>{0, 1}));
}

TEST(SocketMatching, ContradictionsAreInTheOrderOfThePackages) {
  const SocketMatching matching =
      matchSockets(Identities{{.signature = "1", .name = "a"}, {.signature = "2", .name = "z"}, {.signature = "3"}},
                   Identities{{.signature = "4", .name = "z"}, {.signature = "5", .name = "a"}, {.signature = "6"}});

  ASSERT_EQ(matching.contradictions.size(), 3U);
  EXPECT_EQ(matching.contradictions[0].sockets, std::vector<std::size_t>{1});
  EXPECT_EQ(matching.contradictions[1].sockets, std::vector<std::size_t>{0});
  EXPECT_EQ(matching.contradictions[2].sockets, std::vector<std::size_t>{2});
}

TEST(SocketMatching, WhatIsLeftOverStaysInItsOrder) {
  const SocketMatching matching = matchSockets(Identities{{.name = "z"}, {.name = "y"}, {.name = "m"}, {.name = "x"}},
                                               Identities{{.name = "d"}, {.name = "m"}, {.name = "c"}, {.name = "b"}});

  EXPECT_EQ(socketsOf(matching), (std::vector<std::size_t>{0, 2, 1, 3}));
}

// Comparing each with each would take very long.
TEST(SocketMatching, VeryManyAreToldApart) {
  constexpr unsigned int count = 20000;
  Identities sockets;
  Identities packages;
  std::vector<std::size_t> expected;
  for (unsigned int i = 0; i < count; ++i) {
    sockets.push_back({.signature = "A", .cores = i});
    packages.push_back({.signature = "A", .cores = count - 1 - i});
    expected.push_back(count - 1 - i);
  }

  EXPECT_EQ(socketsOf(matchSockets(sockets, packages)), expected);
}

TEST(SocketMatching, NoSocketAtAllIsAContradiction) {
  const SocketMatching matching = matchSockets(Identities{}, Identities{{}});

  EXPECT_EQ(matching.contradictions.size(), 1U);
}

TEST(SocketMatching, AProcessorThatTheKernelDoesNotSeeIsKnownByItsIdentity) {
  const SocketMatching matching =
      matchSockets(Identities{{.signature = "B"}, {.signature = "A"}}, Identities{{.signature = "A"}});

  EXPECT_EQ(socketsOf(matching), std::vector<std::size_t>{1});
  EXPECT_EQ(matching.unseen, std::vector<std::size_t>{0});
  EXPECT_TRUE(matching.contradictions.empty());
}

TEST(SocketMatching, DifferentSignaturesAreNeverOneProcessor) {
  const SocketMatching matching =
      matchSockets(Identities{{.signature = "A", .name = "x"}}, Identities{{.signature = "B", .name = "x"}});

  EXPECT_EQ(socketsOf(matching), std::vector<std::size_t>{none});
  EXPECT_EQ(matching.contradictions.size(), 1U);
}

TEST(SocketMatching, DifferentNamesAndCountsAlonePreventNothing) {
  const SocketMatching matching = matchSockets(Identities{{.signature = "A", .name = "x", .cores = 8}},
                                               Identities{{.signature = "A", .name = "y", .cores = 4}});

  EXPECT_EQ(socketsOf(matching), std::vector<std::size_t>{0});
}

TEST(ComparableName, LeavesOutMarksCaseAndRunsOfBlanks) {
  const char* const rows[][2] = {{"Intel(R) Xeon(R) CPU @ 3.60GHz", "intel xeon cpu @ 3.60ghz"},
                                 {"  Intel(r)   Core(TM)  i7  ", "intel core i7"},
                                 {"(tm)", ""},
                                 {"", ""},
                                 {"A (Rev 2)", "a (rev 2)"}};
  for (const auto& [name, expected] : rows) {
    EXPECT_EQ(comparableName(name), expected);
  }
}

}  // namespace
}  // namespace Tarn::Inventory
