#include <gtest/gtest.h>
#include <tarn/Common.h>

#include <limits>
#include <string>
#include <vector>

#include "tests/cmpi/PathBroker.h"

namespace {

using Tarn::isObjPathsEqual;
using Tarn::isObjPathsEqualWithLog;

class ObjectPaths : public testing::Test {
 protected:
  using Path = PathBroker::Path;

  Path& path(std::string_view className) { return broker_.path(className); }
  Path& memory(std::string_view device) {
    return path("HALDA_CPUMemory").key("CreationClassName", "HALDA_CPUMemory").key("DeviceID", device);
  }
  Path& withKey(CMPIType type, CMPIValue value, CMPIValueState state = CMPI_goodValue) {
    return path("C").key("K", type, value, state);
  }

  /// The answer, which must not depend on the order of the paths nor on who logs.
  static bool equal(const CMPIObjectPath* left, const CMPIObjectPath* right, bool flag = true) {
    const bool answer = isObjPathsEqual(left, right, flag);
    EXPECT_EQ(isObjPathsEqual(right, left, flag), answer);
    EXPECT_EQ(isObjPathsEqualWithLog(nullptr, left, right, flag), answer);
    return answer;
  }

  PathBroker broker_;
};

TEST_F(ObjectPaths, WithTheSameClassAndKeysAreEqual) {
  EXPECT_TRUE(equal(memory("1"), memory("1")));
  EXPECT_TRUE(equal(memory("1"), memory("1"), false));
}

TEST_F(ObjectPaths, CompareNamesOfClassesAndKeysWithoutRegardToCase) {
  EXPECT_TRUE(equal(path("HALDA_CPUMemory").key("DeviceID", "1"), path("halda_cpumemory").key("DEVICEID", "1")));
  EXPECT_FALSE(equal(path("HALDA_CPUMemory").key("DeviceID", "1"), path("HALDA_CPUMemories").key("DeviceID", "1")));
}

TEST_F(ObjectPaths, DoNotDependOnTheOrderOfTheirKeys) {
  EXPECT_TRUE(
      equal(path("C").key("a", "1").key("B", "2").key("c", "3"), path("C").key("C", "3").key("A", "1").key("b", "2")));
  EXPECT_FALSE(equal(path("C").key("a", "1").key("b", "2"), path("C").key("a", "2").key("b", "1")));
}

TEST_F(ObjectPaths, NeedTheSameSetOfKeys) {
  EXPECT_FALSE(equal(path("C").key("a", "1"), path("C")));
  EXPECT_FALSE(equal(path("C").key("a", "1"), path("C").key("b", "1")));
  EXPECT_FALSE(equal(path("C").key("a", "1").key("a", "1"), path("C").key("a", "1").key("b", "1")));
  EXPECT_TRUE(equal(path("C"), path("C")));
}

TEST_F(ObjectPaths, CompareStringsExactly) {
  EXPECT_FALSE(equal(memory("a"), memory("A")));
  EXPECT_FALSE(equal(memory("1"), memory("1 ")));
  EXPECT_FALSE(equal(memory("1"), memory("")));
}

TEST_F(ObjectPaths, CompareStringsOfAllTypesWithEachOther) {
  std::string text = "device";
  Path& string = withKey(CMPI_string, {.string = broker_.string(text)});
  Path& chars = withKey(CMPI_chars, {.chars = text.data()});
  Path& place = withKey(CMPI_charsptr, {.dataPtr = {text.data(), 6}});
  Path& shorter = withKey(CMPI_charsptr, {.dataPtr = {text.data(), 5}});
  EXPECT_TRUE(equal(string, chars));
  EXPECT_TRUE(equal(string, place));
  EXPECT_FALSE(equal(string, shorter));
}

TEST_F(ObjectPaths, CompareIntegersByValueWhateverTheirType) {
  const std::vector<const Path*> ones = {&withKey(CMPI_uint8, {.uint8 = 1}),   &withKey(CMPI_uint16, {.uint16 = 1}),
                                         &withKey(CMPI_uint32, {.uint32 = 1}), &withKey(CMPI_uint64, {.uint64 = 1}),
                                         &withKey(CMPI_sint8, {.sint8 = 1}),   &withKey(CMPI_sint16, {.sint16 = 1}),
                                         &withKey(CMPI_sint32, {.sint32 = 1}), &withKey(CMPI_sint64, {.sint64 = 1})};
  const std::vector<const Path*> minusOnes = {
      &withKey(CMPI_sint8, {.sint8 = -1}), &withKey(CMPI_sint16, {.sint16 = -1}), &withKey(CMPI_sint32, {.sint32 = -1}),
      &withKey(CMPI_sint64, {.sint64 = -1})};
  for (const Path* left : ones) {
    for (const Path* right : ones) {
      EXPECT_TRUE(equal(*left, *right));
    }
    for (const Path* right : minusOnes) {
      EXPECT_FALSE(equal(*left, *right));
    }
  }
  for (const Path* left : minusOnes) {
    for (const Path* right : minusOnes) {
      EXPECT_TRUE(equal(*left, *right));
    }
  }
}

TEST_F(ObjectPaths, DoNotTakeALargeNumberForANegativeOne) {
  constexpr CMPIUint64 largest = std::numeric_limits<CMPIUint64>::max();
  EXPECT_FALSE(equal(withKey(CMPI_uint64, {.uint64 = largest}), withKey(CMPI_sint64, {.sint64 = -1})));
  EXPECT_FALSE(equal(withKey(CMPI_uint8, {.uint8 = 255}), withKey(CMPI_sint8, {.sint8 = -1})));
  EXPECT_FALSE(equal(withKey(CMPI_uint16, {.uint16 = 256}), withKey(CMPI_uint8, {.uint8 = 0})));
}

TEST_F(ObjectPaths, DoNotTakeAValueOfOneKindForAnother) {
  std::string text = "1";
  const std::vector<const Path*> kinds = {&withKey(CMPI_boolean, {.boolean = 1}),
                                          &withKey(CMPI_char16, {.char16 = 1}),
                                          &withKey(CMPI_uint16, {.uint16 = 1}),
                                          &withKey(CMPI_real64, {.real64 = 1}),
                                          &withKey(CMPI_chars, {.chars = text.data()}),
                                          &withKey(CMPI_dateTime, {.dateTime = broker_.dateTime(1, false)}),
                                          &withKey(CMPI_dateTime, {.dateTime = broker_.dateTime(1, true)}),
                                          &path("C").key("K", path("1")),
                                          &withKey(CMPI_uint16, {.uint16 = 1}, CMPI_nullValue)};
  for (const Path* left : kinds) {
    for (const Path* right : kinds) {
      EXPECT_EQ(equal(*left, *right), left == right);
    }
  }
}

TEST_F(ObjectPaths, CompareValuesOfTheOtherKinds) {
  EXPECT_TRUE(equal(withKey(CMPI_boolean, {.boolean = 1}), withKey(CMPI_boolean, {.boolean = 2})));
  EXPECT_FALSE(equal(withKey(CMPI_boolean, {.boolean = 1}), withKey(CMPI_boolean, {.boolean = 0})));
  EXPECT_FALSE(equal(withKey(CMPI_char16, {.char16 = 1}), withKey(CMPI_char16, {.char16 = 2})));
  EXPECT_TRUE(equal(withKey(CMPI_real32, {.real32 = 0.5F}), withKey(CMPI_real64, {.real64 = 0.5})));
  EXPECT_FALSE(equal(withKey(CMPI_real64, {.real64 = 0.5}), withKey(CMPI_real64, {.real64 = 0.25})));
  EXPECT_TRUE(equal(withKey(CMPI_dateTime, {.dateTime = broker_.dateTime(7, false)}),
                    withKey(CMPI_dateTime, {.dateTime = broker_.dateTime(7, false)})));
  EXPECT_FALSE(equal(withKey(CMPI_dateTime, {.dateTime = broker_.dateTime(7, false)}),
                     withKey(CMPI_dateTime, {.dateTime = broker_.dateTime(8, false)})));
}

TEST_F(ObjectPaths, TakeMissingValuesForNulls) {
  Path& null = withKey(CMPI_string, {.string = nullptr}, CMPI_nullValue);
  CMPIString empty{nullptr, nullptr};
  EXPECT_TRUE(equal(null, withKey(CMPI_string, {.string = nullptr})));
  EXPECT_TRUE(equal(null, withKey(CMPI_string, {.string = &empty})));
  EXPECT_TRUE(equal(null, withKey(CMPI_chars, {.chars = nullptr})));
  EXPECT_TRUE(equal(null, withKey(CMPI_charsptr, {.dataPtr = {nullptr, 7}})));
  EXPECT_TRUE(equal(null, withKey(CMPI_ref, {.ref = nullptr})));
  EXPECT_TRUE(equal(null, withKey(CMPI_dateTime, {.dateTime = nullptr})));
  EXPECT_FALSE(equal(null, withKey(CMPI_string, {.string = broker_.string("")})));
}

TEST_F(ObjectPaths, CompareTextsAndReferencesInTheStateOfANullValue) {
  Path& text = withKey(CMPI_string, {.string = broker_.string("a")}, CMPI_nullValue);
  EXPECT_TRUE(equal(text, withKey(CMPI_string, {.string = broker_.string("a")})));
  EXPECT_FALSE(equal(text, withKey(CMPI_string, {.string = broker_.string("b")}, CMPI_nullValue)));
}

TEST_F(ObjectPaths, WithAValueThatNoKeyCanHaveEqualNothing) {
  CMPIDateTime withoutTable{this, nullptr};
  for (Path* strange : {&withKey(CMPI_uint16A, {.array = nullptr}), &withKey(CMPI_instance, {.inst = nullptr}),
                        &withKey(CMPI_string, {.string = nullptr}, CMPI_notFound),
                        &withKey(CMPI_string, {.string = nullptr}, CMPI_badValue),
                        &withKey(CMPI_dateTime, {.dateTime = &withoutTable})}) {
    EXPECT_FALSE(equal(*strange, *strange));
  }
}

TEST_F(ObjectPaths, CompareReferencesByTheSameRule) {
  const auto link = [this](std::string_view device) -> Path& {
    return path("HALDA_CPUAssociatedCacheMemory").key("Antecedent", memory(device)).key("Dependent", path("D"));
  };
  EXPECT_TRUE(equal(link("1"), link("1")));
  EXPECT_FALSE(equal(link("1"), link("2")));
}

TEST_F(ObjectPaths, DoNotDependOnHosts) {
  EXPECT_TRUE(equal(memory("1").on("a"), memory("1").on("b")));
  EXPECT_TRUE(equal(memory("1").on("a"), memory("1")));
  EXPECT_TRUE(equal(path("L").key("A", memory("1").on("a")), path("L").key("A", memory("1").on("b"))));
}

TEST_F(ObjectPaths, CompareNamespacesOnlyWhereAskedToAndBothHaveOne) {
  EXPECT_FALSE(equal(memory("1").in("root/cimv2"), memory("1").in("root/halda")));
  EXPECT_TRUE(equal(memory("1").in("root/cimv2"), memory("1").in("root/halda"), false));
  EXPECT_TRUE(equal(memory("1").in("root/cimv2"), memory("1").in("ROOT/CimV2")));
  EXPECT_TRUE(equal(memory("1").in("root/cimv2"), memory("1").in("")));
  EXPECT_TRUE(equal(memory("1").in("root/cimv2"), memory("1")));
}

TEST_F(ObjectPaths, CompareNamespacesOfReferencesLikewise) {
  Path& left = path("L").key("A", memory("1").in("root/cimv2"));
  EXPECT_FALSE(equal(left, path("L").key("A", memory("1").in("root/halda"))));
  EXPECT_TRUE(equal(left, path("L").key("A", memory("1").in("root/halda")), false));
  EXPECT_TRUE(equal(left, path("L").key("A", memory("1"))));
}

TEST_F(ObjectPaths, ThatAreMissingEqualNothing) {
  CMPIObjectPath withoutHandle = *static_cast<const CMPIObjectPath*>(memory("1"));
  withoutHandle.hdl = nullptr;
  CMPIObjectPath withoutTable = *static_cast<const CMPIObjectPath*>(memory("1"));
  withoutTable.ft = nullptr;
  EXPECT_FALSE(equal(nullptr, nullptr));
  EXPECT_FALSE(equal(memory("1"), nullptr));
  EXPECT_FALSE(equal(&withoutHandle, &withoutHandle));
  EXPECT_FALSE(equal(&withoutTable, memory("1")));
}

TEST_F(ObjectPaths, ReadAMissingClassNameAsEmpty) {
  EXPECT_TRUE(equal(path("C").withoutClassName(), path("")));
  EXPECT_FALSE(equal(path("C").withoutClassName(), path("C")));
}

TEST_F(ObjectPaths, WhoseKeysTheBrokerDoesNotTellEqualNothing) {
  EXPECT_FALSE(equal(memory("1").failingCount(), memory("1")));
  EXPECT_FALSE(equal(memory("1").failingKeyAt(1), memory("1").failingKeyAt(1)));
}

TEST_F(ObjectPaths, ThatReferToThemselvesAreComparedInFiniteTime) {
  Path& loop = path("L");
  loop.key("Self", loop);
  EXPECT_FALSE(equal(loop, loop));
}

TEST_F(ObjectPaths, MayNestReferencesEightDeep) {
  const auto nested = [this](int depth) -> Path& {
    Path* outer = &memory("1");
    for (int level = 0; level < depth; ++level) {
      outer = &path("L").key("A", *outer);
    }
    return *outer;
  };
  EXPECT_TRUE(equal(nested(8), nested(8)));
  EXPECT_FALSE(equal(nested(9), nested(9)));
}

}  // namespace
