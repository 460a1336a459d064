#include "host/broker/Wire.h"

#include <gtest/gtest.h>

#include <limits>

namespace Corvcim {
namespace {

std::vector<NamedValue> everyKindOfValue() {
  return {{"none", Value()},
          {"null", Value::null(CMPI_uint16)},
          {"boolean", Value::boolean(true)},
          {"char16", Value::char16(0x20AC)},
          {"uint8", Value::uint8(255)},
          {"uint64", Value::uint64(std::numeric_limits<std::uint64_t>::max())},
          {"sint8", Value::sint8(-128)},
          {"sint64", Value::sint64(std::numeric_limits<std::int64_t>::min())},
          {"real32", Value::real32(-0.1F)},
          {"real64", Value::real64(1e300)},
          {"string", Value::string(std::string_view("a\0b\xff", 4))},
          {"dateTime", Value::dateTime("20200229120000.000001+000")},
          {"reference", Value::reference({"h", "n", "C", {{"k", Value::string("v")}}})},
          {"instance", Value::instance({{{}, {}, "D", {}}, {{"p", Value::uint8(1)}}})},
          {"array", Value::uint16Array({1, 65535})},
          {"empty", Value::stringArray({})}};
}

WireRequest fullRequest() {
  return {"HALDA_CPUMemory",
          {OperationKind::Associators,
           {"host", "root/cimv2", "HALDA_CPUMemory", everyKindOfValue()},
           PropertyList({"a", ""}),
           {"assoc", {}, "role", ""}}};
}

Response fullResponse() {
  return {CMPI_RC_ERR_ACCESS_DENIED,
          "message",
          {{{"host", "ns", "C", {}}, everyKindOfValue()}, {}},
          {{{}, {}, "D", everyKindOfValue()}},
          3};
}

}  // namespace

TEST(Wire, RequestArrivesAsItWasSent) {
  EXPECT_EQ(decodeRequest(encode(fullRequest())), fullRequest());
  EXPECT_EQ(decodeRequest(encode(WireRequest{})), WireRequest{});
}

TEST(Wire, EmptyPropertyListIsNotAbsentOne) {
  WireRequest request;
  request.operation.properties.emplace();

  EXPECT_EQ(decodeRequest(encode(request)), request);
}

TEST(Wire, ResponseArrivesAsItWasSent) {
  EXPECT_EQ(decodeResponse(encode(fullResponse())), fullResponse());
  EXPECT_EQ(decodeResponse(encode(Response{})), Response{});
}

TEST(Wire, MessageThatEndsTooEarlyIsAnError) {
  const std::string request = encode(fullRequest());
  const std::string response = encode(fullResponse());

  for (std::size_t size = 0; size < request.size(); ++size) {
    EXPECT_THROW((void)decodeRequest(std::string_view(request).substr(0, size)), WireError) << size;
  }
  for (std::size_t size = 0; size < response.size(); ++size) {
    EXPECT_THROW((void)decodeResponse(std::string_view(response).substr(0, size)), WireError) << size;
  }
}

TEST(Wire, MessageThatGoesOnIsAnError) {
  EXPECT_THROW((void)decodeRequest(encode(fullRequest()) + "x"), WireError);
  EXPECT_THROW((void)decodeResponse(encode(fullResponse()) + "x"), WireError);
}

TEST(Wire, NumberWithoutEndIsAnError) {
  EXPECT_THROW((void)decodeResponse(std::string(20, '\xff')), WireError);
}

TEST(Wire, ErrorSaysWhere) {
  try {
    (void)decodeRequest("");
    FAIL();
  } catch (const WireError& error) {
    EXPECT_STREQ(error.what(), "message between host and provider process, byte 0: the message ends too early");
  }
}

}  // namespace Corvcim
