#ifndef CORVCIM_ARENA_H
#define CORVCIM_ARENA_H

#include <memory>
#include <mutex>
#include <utility>

namespace Corvcim {

class Arena;
class Broker;

/// Anything whose life a request or the broker decides.
class Object {
 public:
  Object() = default;
  virtual ~Object() = default;
  Object& operator=(const Object&) = delete;

  [[nodiscard]] Arena& arena() const { return *arena_; }
  [[nodiscard]] Broker& broker() const;

 protected:
  /// A copy is in no arena yet.
  Object(const Object& /*other*/) {}

 private:
  friend class Arena;

  Arena* arena_ = nullptr;
  Object* previous_ = nullptr;
  Object* next_ = nullptr;
};

/// Owns objects and frees them together, the youngest first, or one by one before that. Objects may be
/// made and freed from several threads at once.
class Arena {
 public:
  explicit Arena(Broker& broker) : broker_(broker) {}
  ~Arena();
  Arena(const Arena&) = delete;
  Arena& operator=(const Arena&) = delete;

  [[nodiscard]] Broker& broker() const { return broker_; }

  template <class T, class... Arguments>
  T* make(Arguments&&... arguments) {
    auto object = std::make_unique<T>(std::forward<Arguments>(arguments)...);
    adopt(*object);
    return object.release();
  }

  void free(Object* object);

  /// Frees the object and everything made after it.
  void freeFrom(Object* object);

 private:
  void adopt(Object& object);
  void unlink(Object& object);

  Broker& broker_;
  std::mutex mutex_;
  Object* youngest_ = nullptr;
};

}  // namespace Corvcim

#endif
