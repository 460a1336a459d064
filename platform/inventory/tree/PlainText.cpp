#include "platform/inventory/tree/PlainText.h"

#include <algorithm>

#include "platform/base/Ascii.h"

namespace Tarn::Inventory {

std::string plainText(std::string_view text) {
  std::string plain(text);
  std::ranges::replace_if(plain, Common::isControl, ' ');
  return std::string(Common::trimmed(plain));
}

}  // namespace Tarn::Inventory
