#ifndef TESTS_SEAM_COMPARISONS_H
#define TESTS_SEAM_COMPARISONS_H

#include <cmpidt.h>

#include <vector>

/// The calls of Tarn::isObjPathsEqual and its logging twin.
namespace Scripted {

struct Comparison {
  bool withLog;
  const CMPIBroker* broker;  // NULL for the one without log
  const CMPIObjectPath* left;
  const CMPIObjectPath* right;
  bool flag;
  bool equal;

  friend bool operator==(const Comparison&, const Comparison&) = default;
};

/// The calls since they were taken last.
std::vector<Comparison> takeComparisons();

}  // namespace Scripted

#endif
