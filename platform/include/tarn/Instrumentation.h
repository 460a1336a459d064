#ifndef TARN_INSTRUMENTATION_H
#define TARN_INSTRUMENTATION_H

#include <tarn/NodeLexicon.h>

#include <memory>
#include <string>
#include <vector>

namespace Tarn {

namespace Inventory {
class Tree;
}

/// A cursor over this machine's inventory tree: the system, its processors, and below each processor
/// its cores and caches.
///
/// The tree is read once for each process, when the first cursor is made, and never changes. A cursor
/// costs next to nothing: a walk allocates only the strings that it hands out. Cursors of different
/// threads are independent; one cursor belongs to one thread at a time. A cursor keeps its tree alive.
///
/// A walk selects, restricts if it likes to, and reads on while the cursor stands on a node:
///
///     Tarn::Instrumentation cursor;
///     cursor.selectNode(Tarn::NodeLexicon::NodeCacheMemory);
///     cursor.setFilter(Tarn::NodeLexicon::PathChildren, processorPath);
///     for (; cursor; ++cursor) { ... }
///
/// A node's path has two forms. The internal form goes between the calls of this class; the printable
/// form, short and without blanks, is what people and clients see. It names the same part on every
/// boot. Each form is the exact inverse of the other.
///
/// On a cursor that stands on no node every getter answers empty, 0 or false.
class Instrumentation {
 public:
  /// A cursor on no node. Throws std::exception's children if the inventory cannot be read; the text
  /// says which file, where and why. The next cursor tries again.
  Instrumentation();
  ~Instrumentation();
  Instrumentation(const Instrumentation& other) = default;
  Instrumentation& operator=(const Instrumentation& other) = default;

  /// Selects all nodes of the type, without a filter, and stands on the first of them, if any.
  void selectNode(NodeLexicon::NodeType type);

  /// Selects the one node with this path and stands on it, or on no node if there is none.
  void selectNode(const std::string& internalPath);

  /// Whether the cursor stands on a node.
  explicit operator bool() const { return current_ != last_; }

  /// Goes to the next node of the selection; past its last node, and from there, to none.
  Instrumentation& operator++();

  /// Restricts the selection to the node at the path (PathSelf) or to the nodes below it, at any depth
  /// (PathChildren), and stands on the first node that passes, if any. Each further filter restricts
  /// what the filters before it have left; the next selectNode forgets them.
  void setFilter(NodeLexicon::PathType type, const std::string& internalPath);

  /// How the node is: 1 in use, 12 offline, 15 an empty socket, 16 disabled, 24 failed. 0 only where
  /// there is no node.
  unsigned int getNodeStatus() const;

  /// The node's text for people, in UTF-8.
  std::string getNodeDescription() const;

  /// The node's path, in internal form.
  std::string getPathToNode() const;

  /// The path of the node that this one is part of, in internal form; empty at the root.
  std::string getPathToParentNode() const;

  /// The printable form of an internal path. What is no internal path gives an empty text.
  std::string convertPathToString(const std::string& internalPath) const;

  /// The internal form of a printable path. A text that names no node gives a path that selects none.
  std::string convertStringToPath(const std::string& printablePath) const;

  /// Reads a property of the node. False, with `value` untouched, where the node has no such property
  /// or has it in another type than asked for.
  bool getProperty(NodeLexicon::Properties property, unsigned int& value) const;
  bool getProperty(NodeLexicon::Properties property, std::string& value) const;
  bool getProperty(NodeLexicon::Properties property, std::vector<unsigned int>& value) const;

 private:
  std::shared_ptr<const Inventory::Tree> tree_;
  // The selection: a stretch of the tree's list of one node type, and the place in it.
  const unsigned int* first_ = nullptr;
  const unsigned int* current_ = nullptr;
  const unsigned int* last_ = nullptr;
};

}  // namespace Tarn

#endif
