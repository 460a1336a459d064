#ifndef CORVANE_TESTS_CMPI_PATHBROKER_H
#define CORVANE_TESTS_CMPI_PATHBROKER_H

#include <cmpidt.h>
#include <cmpift.h>

#include <deque>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// As much of a broker as makes object paths: `path("HALDA_CPUMemory").key("DeviceID", "1")`. What it has
/// made lives as long as it does.
class PathBroker {
 public:
  struct Key {
    const CMPIString* name;
    CMPIData data;
  };

  /// One path; converts to what the compared functions take.
  class Path {
   public:
    Path(PathBroker& broker, std::string_view className);

    Path& in(std::string_view nameSpace);
    Path& on(std::string_view host);
    /// A string key as CMPI_string.
    Path& key(std::string_view name, std::string_view value);
    Path& key(std::string_view name, const Path& reference);
    Path& key(std::string_view name, CMPIType type, CMPIValue value, CMPIValueState state = CMPI_goodValue);
    /// The broker answers NULL for its class name.
    Path& withoutClassName();
    /// From now on the broker fails to tell the number of keys, or the key at that index.
    Path& failingCount();
    Path& failingKeyAt(CMPICount index);

    operator const CMPIObjectPath*() const { return &handle_; }

   private:
    friend class PathBroker;

    PathBroker& broker_;
    CMPIString* className_;
    CMPIString* nameSpace_ = nullptr;
    CMPIString* host_ = nullptr;
    std::vector<Key> keys_;
    bool failsCount_ = false;
    std::optional<CMPICount> failsAt_;
    CMPIObjectPath handle_;
  };

  Path& path(std::string_view className) { return paths_.emplace_back(*this, className); }
  CMPIString* string(std::string_view text);
  CMPIDateTime* dateTime(CMPIUint64 microseconds, bool isInterval);

 private:
  struct DateTime {
    CMPIUint64 microseconds;
    bool isInterval;
    CMPIDateTime handle;
  };
  struct String {
    std::string text;
    CMPIString handle;
  };

  static const Path& of(const CMPIObjectPath* path) { return *static_cast<const Path*>(path->hdl); }
  static const DateTime& of(const CMPIDateTime* dateTime) { return *static_cast<const DateTime*>(dateTime->hdl); }

  static const CMPIStringFT stringTable;
  static const CMPIDateTimeFT dateTimeTable;
  static const CMPIObjectPathFT pathTable;

  std::deque<Path> paths_;
  std::deque<String> strings_;
  std::deque<DateTime> dateTimes_;
};

#endif
