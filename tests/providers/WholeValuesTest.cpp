// Values as brokers read them that copy the whole union.

#include "tests/providers/AssociationRows.h"
#include "tests/support/UnionCopyingBroker.h"

namespace {

using Corvcim::Operation;
using Support::providerFunctions;
using Support::ProviderFunctions;

class WholeValues : public Support::ProviderTest {
 protected:
  WholeValues() : copying(broker.handle()) {
    Associations::scriptMachine();
    broker.serveInstances("HALDA_ComputerSystem", {Support::systemInstance("sysA")});
  }

  void performEverything(const ProviderFunctions& provider) {
    using Corvcim::OperationKind;
    CMPIInstanceMI* mi = provider.createInstanceMI(copying.handle(), nullptr, nullptr);
    const Corvcim::ObjectPath path = Support::classPath(provider.className);
    broker.enumerateInstances(mi, path);
    broker.enumerateInstanceNames(mi, path);
    if (provider.createAssociationMI == nullptr) {
      return;
    }
    Corvcim::AssociationFilter filter;
    filter.assocClass = provider.className;
    for (const Associations::Row& row : Associations::rows()) {
      for (const Associations::FarEnds& ends :
           row.className == provider.className ? row.farEnds() : std::vector<Associations::FarEnds>()) {
        for (const OperationKind kind : Associations::associationOperations) {
          broker.perform(provider.createAssociationMI(copying.handle(), nullptr, nullptr),
                         Operation{kind, ends.source, {}, filter});
        }
      }
    }
  }

  Support::UnionCopyingBroker copying;
};

TEST_F(WholeValues, EveryValueIsInitializedToTheEndOfItsUnion) {
  for (const ProviderFunctions& provider : providerFunctions()) {
    Support::forgetInventory();  // with cores known, the processor-cache association answers nothing
    const unsigned int before = copying.copies();
    performEverything(provider);
    EXPECT_GT(copying.copies(), before) << provider.className;
  }
  EXPECT_EQ(copying.partialValues(), std::vector<std::string>());
}

}  // namespace
