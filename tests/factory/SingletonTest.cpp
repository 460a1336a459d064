#include <CPUObjFactory.h>

#include <string>
#include <vector>

#include "tests/seam/ScriptedTest.h"

using Scripted::inventory;
using Scripted::Lines;
using Scripted::Operation;
using Scripted::Thrown;
using Tarn::CPUProvider::CPUObjFactory;

// Each of these runs in a process of its own: the first call to the factory is the first of the process.

namespace {

class Singleton : public Scripted::ScriptedTest {
 protected:
  /// Before any fixture: what the inventory was asked and what was logged until then was of loading.
  static void SetUpTestSuite() {
    callsOfLoading = inventory().calls();
    messagesOfLoading = Scripted::takeMessages().size();
  }

  inline static std::vector<std::string> callsOfLoading;
  inline static std::size_t messagesOfLoading = 0;

  static void makeInventory() {
    inventory().system("Model").processor("cpu0").core("core0").cache("cache0").processor("cpu1").core("core1");
  }

  /// How many walks over each kind were begun: processors, caches, cores.
  static std::vector<unsigned int> walks() {
    return {inventory().count("selectNode(4)"), inventory().count("selectNode(31)"),
            inventory().count("selectNode(42)")};
  }

  static std::vector<bool> populated() {
    return {CPUObjFactory::_isProcPopulated, CPUObjFactory::_isMemPopulated, CPUObjFactory::_isProcCorePopulated};
  }

  static std::vector<std::size_t> sizes() {
    return {CPUObjFactory::_processorMap.size(), CPUObjFactory::_cpuMemoryMap.size(),
            CPUObjFactory::_cpuProcCoreMap.size()};
  }

  /// The factory's own frame events, with their lines.
  static std::vector<Scripted::Event> takeFrame() {
    std::vector<Scripted::Event> frame;
    for (Scripted::Event& event : Scripted::takeEvents()) {
      if (event.file == "CPUObjFactory.cpp") {
        frame.push_back(std::move(event));
      }
    }
    return frame;
  }

  static Scripted::Event frameEvent(const std::string& form, const std::string& function, int line,
                                    const std::string& flags) {
    return {function,
            "CPUObjFactory.cpp",
            line,
            "Corvane.CPUProvider",
            3000,
            form + ": " + function + "() in CPUObjFactory.cpp [Line: " + std::to_string(line) +
                "],Parameters List: " + flags};
  }
};

using Flags = std::vector<bool>;
using Numbers = std::vector<unsigned int>;
using Sizes = std::vector<std::size_t>;

}  // namespace

TEST_F(Singleton, NothingIsCollectedWhenTheLibraryIsLoaded) {
  EXPECT_EQ(populated(), (Flags{false, false, false}));
  EXPECT_EQ(sizes(), (Sizes{0, 0, 0}));
  EXPECT_EQ(callsOfLoading, Lines());
  EXPECT_EQ(messagesOfLoading, 0U);
}

TEST_F(Singleton, TheFirstCallReportsItselfAndTheConstruction) {
  makeInventory();

  CPUObjFactory::getFactoryInstance(true, false, true);

  const std::string flags = " isProc=1 isMem=0 isProcCore=1";
  const std::vector<Scripted::Event> expected = {
      frameEvent("ENTERING", "getFactoryInstance", 54, flags), frameEvent("ENTERING", "CPUObjFactory", 103, flags),
      frameEvent("EXITING", "CPUObjFactory", 128, flags), frameEvent("EXITING", "getFactoryInstance", 84, flags)};
  EXPECT_EQ(takeFrame(), expected);
}

TEST_F(Singleton, LaterCallsReportThemselvesOnly) {
  makeInventory();
  CPUObjFactory::getFactoryInstance(true, false, true);
  Scripted::takeMessages();

  CPUObjFactory::getFactoryInstance(false, true, false);

  const std::string flags = " isProc=0 isMem=1 isProcCore=0";
  const std::vector<Scripted::Event> expected = {frameEvent("ENTERING", "getFactoryInstance", 54, flags),
                                                 frameEvent("EXITING", "getFactoryInstance", 84, flags)};
  EXPECT_EQ(takeFrame(), expected);
}

TEST_F(Singleton, CollectionHappensInsideTheConstruction) {
  makeInventory();

  CPUObjFactory::getFactoryInstance(true, false, false);

  Lines functions;
  for (const Scripted::Event& event : Scripted::takeEvents()) {
    if (functions.empty() || functions.back() != event.function) {
      functions.push_back(event.function);
    }
  }
  const Lines expected = {"getFactoryInstance",    "CPUObjFactory",         "getProcessorInstances",
                          "checkIfVirtual",        "getProcessorInstances", "checkIfVirtual",
                          "getProcessorInstances", "CPUObjFactory",         "getFactoryInstance"};
  EXPECT_EQ(functions, expected);
}

TEST_F(Singleton, EveryCallGivesTheSameObject) {
  CPUObjFactory* first = CPUObjFactory::getFactoryInstance(false, false, false);
  EXPECT_NE(first, nullptr);
  EXPECT_EQ(CPUObjFactory::getFactoryInstance(true, true, true), first);
}

TEST_F(Singleton, EachKindIsCollectedOnceWhenItIsFirstAskedFor) {
  makeInventory();

  CPUObjFactory* factory = CPUObjFactory::getFactoryInstance(true, false, false);
  EXPECT_EQ(populated(), (Flags{true, false, false}));
  EXPECT_EQ(walks(), (Numbers{1, 0, 0}));

  CPUObjFactory::getFactoryInstance(false, true, false);
  EXPECT_EQ(populated(), (Flags{true, true, false}));
  EXPECT_EQ(walks(), (Numbers{1, 1, 0}));

  CPUObjFactory::getFactoryInstance(true, true, true);
  EXPECT_EQ(populated(), (Flags{true, true, true}));
  EXPECT_EQ(walks(), (Numbers{1, 1, 1}));

  CPUObjFactory::getFactoryInstance(true, true, true);
  EXPECT_EQ(walks(), (Numbers{1, 1, 1}));
  EXPECT_EQ(sizes(), (Sizes{2, 1, 2}));
  EXPECT_EQ(factory->_processorList.size(), 2U);
  EXPECT_EQ(factory->_cpuMemoryList.size(), 1U);
  EXPECT_EQ(factory->_cpuProcCoreList.size(), 2U);
}

TEST_F(Singleton, AFirstCallThatAsksForNothingCollectsNothing) {
  makeInventory();

  CPUObjFactory::getFactoryInstance(false, false, false);

  EXPECT_EQ(populated(), (Flags{false, false, false}));
  EXPECT_TRUE(inventory().calls().empty());
}

TEST_F(Singleton, TheKindsComeInTheirFixedOrder) {
  makeInventory();

  CPUObjFactory::getFactoryInstance(true, true, true);

  Lines selections;
  for (const std::string& call : inventory().calls()) {
    if (call == "selectNode(4)" || call == "selectNode(31)" || call == "selectNode(42)") {
      selections.push_back(call);
    }
  }
  EXPECT_EQ(selections, (Lines{"selectNode(4)", "selectNode(31)", "selectNode(42)"}));
}

TEST_F(Singleton, AFailedKindIsTriedTwiceByTheFirstCallAndOnceByEachFurtherOne) {
  CPUObjFactory::getFactoryInstance(true, true, true);
  EXPECT_EQ(walks(), (Numbers{2, 2, 2}));
  EXPECT_EQ(populated(), (Flags{false, false, false}));

  CPUObjFactory::getFactoryInstance(true, true, true);
  EXPECT_EQ(walks(), (Numbers{3, 3, 3}));

  CPUObjFactory::getFactoryInstance(false, false, true);
  EXPECT_EQ(walks(), (Numbers{3, 3, 4}));

  makeInventory();
  CPUObjFactory::getFactoryInstance(true, true, true);
  EXPECT_EQ(walks(), (Numbers{4, 4, 5}));
  EXPECT_EQ(populated(), (Flags{true, true, true}));
}

TEST_F(Singleton, ASecondAttemptOfTheFirstCallCanSucceed) {
  makeInventory();
  inventory().failNth(Operation::GetNodeStatus, 1);

  CPUObjFactory* factory = CPUObjFactory::getFactoryInstance(true, false, false);

  EXPECT_EQ(populated(), (Flags{true, false, false}));
  EXPECT_EQ(walks(), (Numbers{2, 0, 0}));
  EXPECT_EQ(factory->_processorList.size(), 2U);
}

TEST_F(Singleton, WhatAFailedCollectionLeftStaysInTheList) {
  makeInventory();
  inventory().failNth(Operation::Next, 1);

  CPUObjFactory* factory = CPUObjFactory::getFactoryInstance(true, false, false);

  EXPECT_EQ(factory->_processorList.size(), 3U);
  EXPECT_EQ(sizes(), (Sizes{2, 0, 0}));
  EXPECT_EQ(factory->getNumberOfProcInstances(), 2);
}

TEST_F(Singleton, AnEmptyCollectionThatSucceedsIsNotRepeated) {
  inventory().system("Model").processor("socket").status(15);

  CPUObjFactory::getFactoryInstance(true, false, false);
  CPUObjFactory::getFactoryInstance(true, false, false);

  EXPECT_EQ(populated(), (Flags{true, false, false}));
  EXPECT_EQ(walks(), (Numbers{1, 0, 0}));
  EXPECT_EQ(sizes(), (Sizes{0, 0, 0}));
}

TEST_F(Singleton, NothingIsRefreshed) {
  makeInventory();
  CPUObjFactory* factory = CPUObjFactory::getFactoryInstance(true, true, true);
  inventory().processor("cpu2");

  CPUObjFactory::getFactoryInstance(true, true, true);

  EXPECT_EQ(factory->getNumberOfProcInstances(), 2);
}

TEST_F(Singleton, AnExceptionThatACollectionPassesOnLeavesTheConstructionToTheNextCall) {
  makeInventory();
  inventory().failNth(Operation::Construct, 1, Thrown::Unusual);
  EXPECT_THROW(CPUObjFactory::getFactoryInstance(false, true, false), Scripted::UnusualException);
  Scripted::takeMessages();

  CPUObjFactory* factory = CPUObjFactory::getFactoryInstance(false, true, false);

  EXPECT_EQ(takeFrame().size(), 4U);
  EXPECT_EQ(factory->getNumberOfMemInstances(), 1);
}
