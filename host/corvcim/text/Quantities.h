#ifndef HOST_CORVCIM_TEXT_QUANTITIES_H
#define HOST_CORVCIM_TEXT_QUANTITIES_H

#include <cstdint>
#include <string>

namespace Corvcim {

// Quantities as people write them. No locale has a say in it.

/// "48 KiB", "1.5 MiB", "512 bytes": the largest binary unit that gives at least 1, at most two
/// decimals, no trailing zeros.
std::string formatBytes(std::uint64_t bytes);

/// "2.3 GHz", "3.6 GHz", "800 MHz": at most two decimals, no trailing zeros.
std::string formatMegahertz(std::uint64_t megahertz);

}  // namespace Corvcim

#endif
