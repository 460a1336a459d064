#ifndef TARN_STATECODES_H
#define TARN_STATECODES_H

#include <algorithm>
#include <iterator>

/// From the inventory tree's codes to CIM values. The tables look at the whole number, before it is
/// cut to the 16 bits of a CIM value.
namespace Tarn::CPUProvider {

struct Translation {
  unsigned int code;
  unsigned short value;
};

/// EnabledState by node status; any other status is not applicable.
inline constexpr Translation enabledStates[] = {{0, 0}, {1, 2}, {12, 6}, {16, 3}};
inline constexpr unsigned short enabledStateNotApplicable = 5;

/// OperationalStatus by node status; any other status says nothing.
inline constexpr Translation operationalStatuses[] = {{0, 0},   {1, 2},   {2, 8},   {3, 9}, {8, 15},
                                                      {10, 10}, {13, 13}, {17, 12}, {20, 5}};

/// CoreEnabledState by node status; any other status is unknown.
inline constexpr Translation coreEnabledStates[] = {{0, 0}, {1, 2}, {2, 4}, {3, 5}};
inline constexpr unsigned short coreEnabledStateUnknown = 0;

inline constexpr Translation cacheWritePolicies[] = {{1, 2}, {2, 3}, {3, 4}, {4, 1}};
inline constexpr Translation cacheTypes[] = {{0, 0}, {1, 2}, {2, 3}, {3, 4}};
inline constexpr Translation cacheAssociativities[] = {{0, 0}, {1, 2}, {2, 5}, {3, 3}, {4, 4}, {5, 6}, {6, 7}};

/// RequestedState is never anything else: the inventory cannot be asked to change a state.
inline constexpr unsigned short requestedStateNotApplicable = 12;

/// HealthState and the text that goes with it.
struct Health {
  unsigned int code;
  unsigned short state;
  const char* text;
};

/// A processor spells two of its texts differently from its cores and caches.
inline constexpr Health processorHealth[] = {{0, 0, "UnKnown"}, {21, 10, "Degraded"}, {24, 25, "Error"}};
inline constexpr Health coreAndCacheHealth[] = {{0, 0, "Unknown"}, {1, 5, "OK"}, {21, 10, "Error"}, {24, 25, "Error"}};
inline constexpr Health healthOk = {1, 5, "OK"};

/// The row of `code`, or nullptr.
template <class Row, std::size_t rows>
constexpr const Row* findRow(const Row (&table)[rows], unsigned int code) {
  const Row* row = std::find_if(std::begin(table), std::end(table), [&](const Row& r) { return r.code == code; });
  return row != std::end(table) ? row : nullptr;
}

/// The value of `code`, or `otherwise`.
template <std::size_t rows>
constexpr unsigned short translate(const Translation (&table)[rows], unsigned int code, unsigned short otherwise) {
  const Translation* row = findRow(table, code);
  return row != nullptr ? row->value : otherwise;
}

template <std::size_t rows>
constexpr const Health& healthOf(const Health (&table)[rows], unsigned int code) {
  const Health* row = findRow(table, code);
  return row != nullptr ? *row : healthOk;
}

}  // namespace Tarn::CPUProvider

#endif
