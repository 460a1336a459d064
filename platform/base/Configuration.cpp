#include "platform/base/Configuration.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <system_error>

#include "platform/base/Ascii.h"
#include "platform/base/ConfigurationFile.h"
#include "platform/base/FileDescriptor.h"
#include "platform/base/NearestName.h"

namespace Tarn::Common {
namespace {

constexpr std::size_t largestFile = 1 << 20;

constexpr std::array<std::string_view, 12> knownKeys = {
    "inventory",          // which machine the library describes
    "language",           // of captions and descriptions
    "log.destination",    // the log sink
    "log.keep",           //
    "log.level",          //
    "log.rate",           //
    "log.size",           //
    "trace.destination",  // the trace sink
    "trace.keep",         //
    "trace.level",        //
    "trace.rate",         //
    "trace.size",         //
};

std::string errorText(int error) {
  return std::generic_category().message(error);
}

/// The file's content, or why it cannot be had.
struct Content {
  std::string text;
  std::string problem;
};

Content readContent(const std::string& file) {
  // Opening must not wait for the other end of a pipe.
  const FileDescriptor descriptor(open(file.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
  if (!descriptor) {
    return {{}, "cannot be opened: " + errorText(errno)};
  }
  struct stat status {};
  if (fstat(descriptor.number(), &status) != 0 || !S_ISREG(status.st_mode)) {
    return {{}, "is not a regular file"};
  }
  Content content;
  std::array<char, 4096> block{};
  while (content.text.size() <= largestFile) {
    const ssize_t count = ::read(descriptor.number(), block.data(), block.size());
    if (count < 0 && errno == EINTR) {
      continue;
    }
    if (count < 0) {
      return {{}, "cannot be read: " + errorText(errno)};
    }
    if (count == 0) {
      return content;
    }
    content.text.append(block.data(), static_cast<std::size_t>(count));
  }
  return {{}, "is larger than a configuration file can be (1 MiB)"};
}

}  // namespace

Configuration Configuration::parse(std::string_view text, const std::string& file) {
  Configuration parsed;
  for (int number = 1; !text.empty(); ++number) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    parsed.parseLine(trimmed(text.substr(0, end)), file + ':' + std::to_string(number));
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return parsed;
}

Configuration Configuration::read(const std::string& file) {
  const Content content = readContent(file);
  if (!content.problem.empty()) {
    Configuration nothing;
    nothing.problems_.push_back({file, "the configuration file " + content.problem + "; the defaults are used"});
    return nothing;
  }
  return parse(content.text, file);
}

void Configuration::parseLine(std::string_view line, const std::string& where) {
  if (line.empty() || line.front() == '#') {
    return;
  }
  const std::size_t equals = line.find('=');
  if (equals == std::string_view::npos) {
    problems_.push_back({where, R"(expected "key = value" but there is no "="; the line is ignored)"});
    return;
  }
  const std::string_view key = trimmed(line.substr(0, equals));
  if (std::find(knownKeys.begin(), knownKeys.end(), key) == knownKeys.end()) {
    problems_.push_back({where, "unknown key \"" + std::string(key) + "\"; the line is ignored (" +
                                    suggestNames(key, knownKeys, "known keys: ") + ")"});
    return;
  }
  settings_.insert_or_assign(std::string(key), Setting{std::string(trimmed(line.substr(equals + 1))), where});
}

const Setting* Configuration::find(std::string_view key) const {
  const auto found = settings_.find(key);
  return found == settings_.end() ? nullptr : &found->second;
}

const Configuration& configuration() {
  static const Configuration ofThisProcess = ConfigurationFile::ofThisProcess().read();
  return ofThisProcess;
}

}  // namespace Tarn::Common
