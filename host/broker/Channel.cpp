#include "host/broker/Channel.h"

#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdint>
#include <cstring>
#include <system_error>

namespace Corvcim {

std::pair<Channel, Channel> Channel::makePair() {
  std::array<int, 2> descriptors{};
  if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, descriptors.data()) != 0) {
    throw std::system_error(errno, std::generic_category(), "cannot make a socket for a provider process");
  }
  return {Channel(descriptors[0]), Channel(descriptors[1])};
}

Channel::~Channel() {
  if (descriptor_ >= 0) {
    close(descriptor_);
  }
}

Channel& Channel::operator=(Channel&& other) noexcept {
  std::swap(descriptor_, other.descriptor_);
  return *this;
}

std::optional<Response> Channel::ask(const WireRequest& request, const Server& serveMeanwhile) {
  if (!send(FrameKind::Request, encode(request))) {
    return std::nullopt;
  }
  while (const std::optional<Frame> frame = receive()) {
    if (frame->kind == FrameKind::Response) {
      return decodeResponse(frame->payload);
    }
    if (!send(FrameKind::Response, encode(serveMeanwhile(decodeRequest(frame->payload))))) {
      break;
    }
  }
  return std::nullopt;
}

void Channel::serve(const Server& server) {
  while (const std::optional<Frame> frame = receive()) {
    if (!send(FrameKind::Response, encode(server(decodeRequest(frame->payload))))) {
      return;
    }
  }
}

void Channel::shutDown() {
  shutdown(descriptor_, SHUT_RDWR);
}

bool Channel::send(FrameKind kind, std::string_view payload) {
  const auto size = static_cast<std::uint64_t>(payload.size());
  std::array<char, 1 + sizeof size> header{};
  header[0] = static_cast<char>(kind);
  std::memcpy(header.data() + 1, &size, sizeof size);
  return sendBytes({header.data(), header.size()}) && sendBytes(payload);
}

std::optional<Channel::Frame> Channel::receive() {
  std::uint64_t size = 0;
  std::array<char, 1 + sizeof size> header{};
  if (!receiveBytes(header.data(), header.size())) {
    return std::nullopt;
  }
  std::memcpy(&size, header.data() + 1, sizeof size);
  Frame frame = {static_cast<FrameKind>(header[0]), std::string(static_cast<std::size_t>(size), '\0')};
  if (!receiveBytes(frame.payload.data(), frame.payload.size())) {
    return std::nullopt;
  }
  return frame;
}

bool Channel::sendBytes(std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t sent = ::send(descriptor_, bytes.data(), bytes.size(), MSG_NOSIGNAL);
    if (sent < 0 && errno != EINTR) {
      return false;
    }
    bytes.remove_prefix(sent > 0 ? static_cast<std::size_t>(sent) : 0);
  }
  return true;
}

bool Channel::receiveBytes(char* target, std::size_t count) {
  while (count > 0) {
    const ssize_t received = recv(descriptor_, target, count, 0);
    if (received == 0 || (received < 0 && errno != EINTR)) {
      return false;
    }
    if (received > 0) {
      target += received;
      count -= static_cast<std::size_t>(received);
    }
  }
  return true;
}

}  // namespace Corvcim
