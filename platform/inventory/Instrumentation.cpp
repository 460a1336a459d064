#include <tarn/Instrumentation.h>

#include <algorithm>

#include "platform/inventory/ProcessTree.h"
#include "platform/inventory/tree/PathForms.h"
#include "platform/inventory/tree/Tree.h"

namespace Tarn {

using namespace NodeLexicon;
using Inventory::NodeIndex;
using Inventory::noNode;

namespace {

template <class Value>
bool copyTo(Value& target, const Value* source) {
  if (source == nullptr) {
    return false;
  }
  target = *source;
  return true;
}

}  // namespace

Instrumentation::Instrumentation() : tree_(Inventory::processTree()) {}

Instrumentation::~Instrumentation() = default;

void Instrumentation::selectNode(NodeType type) {
  const std::span<const NodeIndex> nodes = tree_->ofType(type);
  first_ = current_ = nodes.data();
  last_ = nodes.data() + nodes.size();
}

void Instrumentation::selectNode(const std::string& internalPath) {
  first_ = current_ = last_ = nullptr;
  const NodeIndex index = tree_->find(internalPath);
  if (index != noNode) {
    selectNode(tree_->node(index).type);
    setFilter(PathSelf, internalPath);
  }
}

Instrumentation& Instrumentation::operator++() {
  if (current_ != last_) {
    ++current_;
  }
  return *this;
}

void Instrumentation::setFilter(PathType type, const std::string& internalPath) {
  NodeIndex begin = 0;
  NodeIndex end = 0;
  const NodeIndex index = tree_->find(internalPath);
  if (index != noNode && type == PathSelf) {
    begin = index;
    end = index + 1;
  } else if (index != noNode && type == PathChildren) {
    begin = index + 1;
    end = tree_->node(index).end;
  }
  // What lies below a node stands after it in one stretch, and the selection is in the same order.
  first_ = std::lower_bound(first_, last_, begin);
  last_ = std::lower_bound(first_, last_, end);
  current_ = first_;
}

unsigned int Instrumentation::getNodeStatus() const {
  return *this ? tree_->node(*current_).status : 0;
}

std::string Instrumentation::getNodeDescription() const {
  return *this ? tree_->node(*current_).description : std::string();
}

std::string Instrumentation::getPathToNode() const {
  return *this ? tree_->node(*current_).internalPath : std::string();
}

std::string Instrumentation::getPathToParentNode() const {
  const NodeIndex parent = *this ? tree_->node(*current_).parent : noNode;
  return parent != noNode ? tree_->node(parent).internalPath : std::string();
}

std::string Instrumentation::convertPathToString(const std::string& internalPath) const {
  return Inventory::toPrintablePath(internalPath);
}

std::string Instrumentation::convertStringToPath(const std::string& printablePath) const {
  return Inventory::toInternalPath(printablePath);
}

bool Instrumentation::getProperty(Properties property, unsigned int& value) const {
  return *this && copyTo(value, tree_->number(tree_->node(*current_), property));
}

bool Instrumentation::getProperty(Properties property, std::string& value) const {
  return *this && copyTo(value, tree_->text(tree_->node(*current_), property));
}

bool Instrumentation::getProperty(Properties property, std::vector<unsigned int>& value) const {
  return *this && copyTo(value, tree_->list(tree_->node(*current_), property));
}

}  // namespace Tarn
