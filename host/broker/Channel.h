#ifndef CORVCIM_CHANNEL_H
#define CORVCIM_CHANNEL_H

#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "host/broker/Operation.h"
#include "host/broker/Wire.h"

namespace Corvcim {

/// One end of a connected pair of sockets. Either end may ask; while it waits for its answer it serves
/// what the other end asks in the meantime, so that up-calls nest as deeply as they like.
class Channel {
 public:
  using Server = std::function<Response(const WireRequest&)>;

  static std::pair<Channel, Channel> makePair();  ///< throws std::system_error

  explicit Channel(int descriptor) : descriptor_(descriptor) {}
  ~Channel();
  Channel(const Channel&) = delete;
  Channel& operator=(const Channel&) = delete;
  Channel(Channel&& other) noexcept : descriptor_(std::exchange(other.descriptor_, -1)) {}
  Channel& operator=(Channel&& other) noexcept;

  /// The other end's answer; nothing if the other end is gone.
  std::optional<Response> ask(const WireRequest& request, const Server& serveMeanwhile);

  /// Answers requests until the other end is gone.
  void serve(const Server& server);

  /// Ends the connection for both, even if other processes hold the descriptor.
  void shutDown();

 private:
  enum class FrameKind : char { Request, Response };
  struct Frame {
    FrameKind kind;
    std::string payload;
  };

  bool send(FrameKind kind, std::string_view payload);
  std::optional<Frame> receive();
  bool sendBytes(std::string_view bytes);
  bool receiveBytes(char* target, std::size_t count);

  int descriptor_;
};

}  // namespace Corvcim

#endif
