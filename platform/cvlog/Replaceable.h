#ifndef CORVANE_PLATFORM_CVLOG_REPLACEABLE_H
#define CORVANE_PLATFORM_CVLOG_REPLACEABLE_H

#include <atomic>
#include <memory>
#include <utility>
#include <vector>

namespace CVLog {

/// A value that many threads use while one puts another in its place. Users never wait here, in a forked process
/// neither; what `use` does may have locks of its own. What was replaced lives until nobody uses any value, which is
/// looked for when `discardUnused` is called; at the latest it goes with this object. In a process that was forked
/// while another thread used a value that user never ends, so there all that is replaced lives so long.
template <class T>
class Replaceable {
 public:
  explicit Replaceable(std::unique_ptr<const T> first) : inForce_(first.get()), owned_() {
    owned_.push_back(std::move(first));
  }
  Replaceable(const Replaceable&) = delete;
  Replaceable& operator=(const Replaceable&) = delete;
  ~Replaceable() = default;

  /// Calls `use` with the value that is in force; it stays alive meanwhile.
  template <class Use>
  void with(Use use) const {
    const User user(users_);
    use(*inForce_.load());
  }

  // For one thread at a time.

  /// The value in force, for the thread that replaces it.
  [[nodiscard]] const T& inForce() const { return *owned_.back(); }

  /// Whoever comes from here on uses `next`.
  void replace(std::unique_ptr<const T> next) {
    owned_.push_back(std::move(next));
    inForce_.store(owned_.back().get());
  }

  /// Frees what was replaced, if nobody uses it.
  void discardUnused() {
    // In the one order of all these operations, a user that is not counted here comes later, and finds the value that
    // was put in force before.
    if (owned_.size() > 1 && users_.load() == 0) {
      owned_.erase(owned_.begin(), owned_.end() - 1);
    }
  }

 private:
  class User {
   public:
    explicit User(std::atomic<unsigned>& users) : users_(users) { users_.fetch_add(1); }
    User(const User&) = delete;
    User& operator=(const User&) = delete;
    ~User() { users_.fetch_sub(1); }

   private:
    std::atomic<unsigned>& users_;
  };

  mutable std::atomic<unsigned> users_{0};
  std::atomic<const T*> inForce_;
  std::vector<std::unique_ptr<const T>> owned_;  // the last one is in force
};

}  // namespace CVLog

#endif
