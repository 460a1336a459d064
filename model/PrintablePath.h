#ifndef TARN_PRINTABLEPATH_H
#define TARN_PRINTABLEPATH_H

#include <tarn/Instrumentation.h>

#include <string>

namespace Tarn::CPUProvider {

/// The path of the node that a cursor stands on, as records and clients know it.
inline std::string printablePath(const Instrumentation& node) {
  return node.convertPathToString(node.getPathToNode());
}

}  // namespace Tarn::CPUProvider

#endif
