#include <tarn/Common.h>
#include <unistd.h>

#include <array>
#include <climits>

namespace Tarn {

std::string getSystemName() {
  std::array<char, HOST_NAME_MAX + 1> name{};
  if (gethostname(name.data(), name.size()) != 0) {
    return {};
  }
  name.back() = '\0';  // a name that was cut need not be terminated
  return name.data();
}

}  // namespace Tarn
