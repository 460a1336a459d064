#include "host/broker/ServiceMonitor.h"

#include <gtest/gtest.h>

#include <set>
#include <stdexcept>

namespace Corvcim {
namespace {

std::optional<Failure> enter(ServiceMonitor& monitor, Service service) {
  return monitor.enter(service, [] { return std::string("detail"); });
}

}  // namespace

TEST(ServiceMonitor, NamesEveryServiceOnce) {
  std::set<std::string_view> names;
  for (const NamedService& each : namedServices) {
    names.insert(each.name);
  }

  EXPECT_EQ(names.size(), serviceCount);
  EXPECT_FALSE(names.contains(""));
  EXPECT_EQ(serviceName(Service::PrepareAttachThread), "prepareAttachThread");
  EXPECT_EQ(serviceName(Service::GetCharPtr), "getCharPtr");
  EXPECT_EQ(serviceName(Service::SetPropertyFilter), "setPropertyFilter");
  EXPECT_EQ(serviceName(Service::GetKeyCount), "getKeyCount");
  EXPECT_EQ(serviceName(Service::ReturnDone), "returnDone");
  EXPECT_EQ(serviceName(Service::IsInterval), "isInterval");
}

TEST(ServiceMonitor, RefusesNamesThatNoServiceHas) {
  ServiceMonitor monitor;

  EXPECT_THROW((void)monitor.count("newarray"), std::invalid_argument);
  EXPECT_THROW(monitor.failNth("newarray", 1), std::invalid_argument);
  EXPECT_THROW(monitor.failNth("newArray", 0), std::invalid_argument);
}

TEST(ServiceMonitor, CountsByService) {
  ServiceMonitor monitor;

  enter(monitor, Service::NewArray);
  enter(monitor, Service::NewArray);
  enter(monitor, Service::GetKey);

  EXPECT_EQ(monitor.count("newArray"), 2U);
  EXPECT_EQ(monitor.count("getKey"), 1U);
  EXPECT_EQ(monitor.totalCount(), 3U);
  monitor.resetCounts();
  EXPECT_EQ(monitor.totalCount(), 0U);
}

TEST(ServiceMonitor, FailsTheNthCallFromNowOn) {
  ServiceMonitor monitor;
  enter(monitor, Service::NewArray);
  monitor.failNth("newArray", 2, {FailureResult::HandleLess, CMPI_RC_ERR_ACCESS_DENIED, "why"});

  EXPECT_FALSE(enter(monitor, Service::NewArray));
  EXPECT_FALSE(enter(monitor, Service::GetKey));
  const auto failure = enter(monitor, Service::NewArray);
  ASSERT_TRUE(failure);
  EXPECT_EQ(failure->result, FailureResult::HandleLess);
  EXPECT_EQ(failure->rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(failure->message, "why");
  EXPECT_FALSE(enter(monitor, Service::NewArray));
}

TEST(ServiceMonitor, FailsSeveralTimesOrForEver) {
  ServiceMonitor monitor;
  monitor.failNth("newArray", 1, {}, 2);
  monitor.failNth("getKey", 2, {}, 0);

  EXPECT_TRUE(enter(monitor, Service::NewArray));
  EXPECT_TRUE(enter(monitor, Service::NewArray));
  EXPECT_FALSE(enter(monitor, Service::NewArray));
  EXPECT_FALSE(enter(monitor, Service::GetKey));
  for (int i = 0; i < 100; ++i) {
    EXPECT_TRUE(enter(monitor, Service::GetKey));
  }
  monitor.clearFailures();
  EXPECT_FALSE(enter(monitor, Service::GetKey));
}

TEST(ServiceMonitor, RecordsCallsInOrderWhileItIsOn) {
  ServiceMonitor monitor;
  enter(monitor, Service::NewString);
  monitor.record(true);

  enter(monitor, Service::NewArray);
  enter(monitor, Service::GetKey);
  monitor.record(false);
  enter(monitor, Service::NewString);

  EXPECT_EQ(monitor.takeRecord(), (std::vector<ServiceCall>{{"newArray", "detail"}, {"getKey", "detail"}}));
  EXPECT_TRUE(monitor.takeRecord().empty());
}

}  // namespace Corvcim
