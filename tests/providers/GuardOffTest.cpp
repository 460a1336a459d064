// The plain build: the library locks nothing and catches nothing at its entries.

#include "tests/providers/GuardTest.h"

namespace {

using Corvcim::OperationKind;
using Guards::Meeting;

class GuardOff : public Guards::GuardTest {};

TEST_F(GuardOff, ExceptionsLeaveTheEntry) {
  CMPIInstanceMI* mi = hookedMI("HALDA_CPUProcessor");
  hooked.hook = [] { throw std::runtime_error("out of objects"); };
  EXPECT_THROW(broker.enumerateInstances(mi, Support::classPath("HALDA_CPUProcessor")), std::runtime_error);
  EXPECT_THROW(broker.enumerateInstanceNames(mi, Support::classPath("HALDA_CPUProcessor")), std::runtime_error);
  EXPECT_THROW(broker.getInstance(mi, Support::processorPath("cpu0")), std::runtime_error);

  hooked.hook = [] { throw 7; };
  Corvcim::AssociationFilter filter;
  filter.assocClass = "HALDA_CPUElementCapabilities";
  for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                   OperationKind::References, OperationKind::ReferenceNames}) {
    EXPECT_THROW(broker.perform(hookedAssociationMI("HALDA_CPUElementCapabilities"),
                                Corvcim::Operation{kind, Support::processorPath("cpu0"), {}, filter}),
                 int);
  }
  hooked.hook = nullptr;
}

TEST_F(GuardOff, TwoThreadsMeetInsideTheLibrary) {
#ifdef __SANITIZE_THREAD__
  GTEST_SKIP() << "they race, as is known of this build";
#endif
  Meeting meeting;
  enumerateInTwoThreads(meeting, Guards::longEnough);
  EXPECT_TRUE(meeting.met());
}

}  // namespace
