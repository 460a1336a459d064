#include "host/broker/Arena.h"

#include "host/broker/Broker.h"

namespace Corvcim {

Broker& Object::broker() const {
  return arena_->broker();
}

Arena::~Arena() {
  while (youngest_ != nullptr) {
    free(youngest_);
  }
}

void Arena::adopt(Object& object) {
  const std::lock_guard lock(mutex_);
  object.arena_ = this;
  object.previous_ = youngest_;
  if (youngest_ != nullptr) {
    youngest_->next_ = &object;
  }
  youngest_ = &object;
  broker_.liveObjectCounter().fetch_add(1, std::memory_order_relaxed);
}

void Arena::unlink(Object& object) {
  const std::lock_guard lock(mutex_);
  if (object.previous_ != nullptr) {
    object.previous_->next_ = object.next_;
  }
  if (object.next_ != nullptr) {
    object.next_->previous_ = object.previous_;
  } else {
    youngest_ = object.previous_;
  }
  broker_.liveObjectCounter().fetch_sub(1, std::memory_order_relaxed);
}

void Arena::free(Object* object) {
  unlink(*object);
  delete object;
}

void Arena::freeFrom(Object* object) {
  while (youngest_ != object) {
    free(youngest_);
  }
  free(object);
}

}  // namespace Corvcim
