#ifndef CORVCIM_WIRE_H
#define CORVCIM_WIRE_H

#include <stdexcept>
#include <string>
#include <string_view>

#include "host/broker/Operation.h"

namespace Corvcim {

/// How requests and responses travel between the processes of one host. Both ends are the same
/// program, so the form has no version: numbers in groups of seven bits, least significant first,
/// texts with their length in front, everything else in the order of its members.

class WireError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// An operation, and the class whose provider is to perform it (empty for an up-call, which goes by
/// the operation's own class).
struct WireRequest {
  std::string className;
  Operation operation;

  friend bool operator==(const WireRequest&, const WireRequest&) = default;
};

[[nodiscard]] std::string encode(const WireRequest& request);
[[nodiscard]] std::string encode(const Response& response);

/// Both throw WireError, with the offset, for bytes that no encode made.
[[nodiscard]] WireRequest decodeRequest(std::string_view bytes);
[[nodiscard]] Response decodeResponse(std::string_view bytes);

}  // namespace Corvcim

#endif
