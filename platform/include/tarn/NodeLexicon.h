#ifndef TARN_NODELEXICON_H
#define TARN_NODELEXICON_H

/// The numbers that cross the inventory interface: which nodes the tree holds, which properties they
/// may have, and how a walk can be restricted. Only the numeric values matter to the other side.
namespace Tarn::NodeLexicon {

/// Kinds of node, for Instrumentation::selectNode.
enum NodeType {
  NodeSystem = 1,         ///< the computer system itself
  NodeProcessor = 4,      ///< processor packages
  NodeCacheMemory = 31,   ///< processor caches
  NodeProcessorCore = 42  ///< processor cores
};

/// Properties of nodes, for Instrumentation::getProperty. Unsigned integers unless said otherwise.
enum Properties {
  PropCacheAssociativity = 5,          ///< cache: 1 direct, 2 full, 3 two-way, 4 four-way, 5 eight-way, 6 sixteen-way
  PropCacheType = 9,                   ///< cache: 1 instruction, 2 data, 3 unified
  PropDataWidth = 15,                  ///< processor: bits
  PropExternalClockSpeed = 19,         ///< processor: MHz
  PropCacheLevel = 30,                 ///< cache: CIM level code (3 L1, 4 L2, 5 L3, 1 any other)
  PropMaxClockSpeed = 38,              ///< processor: MHz
  PropSystemModel = 39,                ///< system: text
  PropCacheName = 53,                  ///< cache: text
  PropAddressWidth = 66,               ///< processor: bits
  PropCacheBlockSize = 69,             ///< cache: bytes in a block
  PropCacheWritePolicy = 72,           ///< cache: 1 write-back, 2 write-through, 3 varies, 4 other
  PropCacheConsumableBlocks = 73,      ///< cache: blocks
  PropCurrentClockSpeed = 80,          ///< processor: MHz
  PropHardwareThreads = 87,            ///< processor: count
  PropProcessorId = 89,                ///< processor: text
  PropCacheNumberOfBlocks = 112,       ///< cache: blocks
  PropStepping = 124,                  ///< processor: text
  PropRequestedStatesSupported = 125,  ///< processor: vector; 1 stands for "can be enabled"
  PropEnabledCores = 189,              ///< processor: count
  PropProcessorCores = 190,            ///< processor: count
  PropFamily = 298,                    ///< processor: CIM family code
  PropUpgradeMethod = 304,             ///< processor: CIM upgrade-method code
  PropProcessorName = 307              ///< processor: text
};

/// How Instrumentation::setFilter restricts a walk.
enum PathType {
  PathSelf = 0,     ///< only the node at the path
  PathChildren = 1  ///< only nodes below the path
};

}  // namespace Tarn::NodeLexicon

#endif
