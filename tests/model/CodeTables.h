#ifndef TESTS_MODEL_CODETABLES_H
#define TESTS_MODEL_CODETABLES_H

#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

/// What the tables of several records have in common: the codes to try, and the tables that records share.
namespace CodeTables {

using Table = std::map<unsigned int, unsigned short>;

inline const Table enabledState = {{0, 0}, {1, 2}, {12, 6}, {16, 3}};
inline constexpr unsigned short otherEnabledState = 5;

inline const Table operationalStatus = {{0, 0}, {1, 2}, {2, 8}, {3, 9}, {8, 15}, {10, 10}, {13, 13}, {17, 12}, {20, 5}};

/// HealthState and the text with it, of cores and caches; any other code is 5, "OK".
inline const std::map<unsigned int, std::pair<unsigned short, std::string>> partHealth = {
    {0, {0, "Unknown"}}, {1, {5, "OK"}}, {21, {10, "Error"}}, {24, {25, "Error"}}};

/// Every code up to well behind the last row of any table, and numbers that only look like a row once
/// they are cut to 16 bits.
inline std::vector<unsigned int> codesToTry() {
  std::vector<unsigned int> codes;
  for (unsigned int code = 0; code <= 40; ++code) {
    codes.push_back(code);
    codes.push_back(65536 + code);
  }
  codes.insert(codes.end(), {65535U, 0x7FFFFFFFU, 0x80000000U, 0xFFFF0001U, 0xFFFFFFFFU});
  return codes;
}

inline std::optional<unsigned short> find(const Table& table, unsigned int code) {
  const auto row = table.find(code);
  return row != table.end() ? std::optional(row->second) : std::nullopt;
}

}  // namespace CodeTables

#endif
