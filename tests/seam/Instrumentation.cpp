#include <tarn/Instrumentation.h>

#include <algorithm>

#include "tests/seam/Inventory.h"

namespace Tarn {

using Scripted::internalPath;
using Scripted::inventory;
using Scripted::Node;
using Scripted::Operation;

Instrumentation::Instrumentation() {
  inventory().enter(Operation::Construct, "Instrumentation()");
  inventory().cursorMade();
}

Instrumentation::~Instrumentation() {
  inventory().cursorGone();
}

void Instrumentation::selectNode(NodeLexicon::NodeType type) {
  inventory().enter(Operation::SelectType, "selectNode(" + std::to_string(type) + ")");
  selection_.clear();
  position_ = 0;
  for (Node& node : inventory().nodes()) {
    if (node.type == type) {
      selection_.push_back(&node);
    }
  }
}

void Instrumentation::selectNode(const std::string& path) {
  inventory().enter(Operation::SelectPath, "selectNode(" + path + ")");
  selection_.clear();
  position_ = 0;
  for (Node& node : inventory().nodes()) {
    if (internalPath(node.path) == path) {
      selection_ = {&node};
      return;
    }
  }
}

Instrumentation::operator bool() const {
  inventory().enter(Operation::Test, "operator bool()");
  return current() != nullptr;
}

Instrumentation& Instrumentation::operator++() {
  inventory().enter(Operation::Next, "operator++()");
  ++position_;
  return *this;
}

void Instrumentation::setFilter(NodeLexicon::PathType type, const std::string& path) {
  inventory().enter(Operation::SetFilter, "setFilter(" + std::to_string(type) + ", " + path + ")");
  const auto passes = [&](const Node* node) {
    if (type == NodeLexicon::PathSelf) {
      return internalPath(node->path) == path;
    }
    return path.starts_with(internalPath("")) && inventory().isBelow(*node, path.substr(internalPath("").size()));
  };
  std::erase_if(selection_, [&](const Node* node) { return !passes(node); });
  position_ = 0;
}

unsigned int Instrumentation::getNodeStatus() const {
  inventory().enter(Operation::GetNodeStatus, "getNodeStatus()");
  Node* node = current();
  if (node == nullptr) {
    return 0;
  }
  const unsigned int status = node->statuses.front();
  if (node->statuses.size() > 1) {
    node->statuses.erase(node->statuses.begin());
  }
  return status;
}

std::string Instrumentation::getNodeDescription() const {
  inventory().enter(Operation::GetNodeDescription, "getNodeDescription()");
  return current() != nullptr ? current()->description : std::string();
}

std::string Instrumentation::getPathToNode() const {
  inventory().enter(Operation::GetPathToNode, "getPathToNode()");
  return current() != nullptr ? internalPath(current()->path) : std::string();
}

std::string Instrumentation::getPathToParentNode() const {
  inventory().enter(Operation::GetPathToParentNode, "getPathToParentNode()");
  return current() != nullptr && !current()->parent.empty() ? internalPath(current()->parent) : std::string();
}

std::string Instrumentation::convertPathToString(const std::string& path) const {
  inventory().enter(Operation::ConvertPathToString, "convertPathToString(" + path + ")");
  return path.starts_with(internalPath("")) ? path.substr(internalPath("").size()) : std::string();
}

std::string Instrumentation::convertStringToPath(const std::string& printablePath) const {
  inventory().enter(Operation::ConvertStringToPath, "convertStringToPath(" + printablePath + ")");
  return internalPath(printablePath);
}

template <class Value>
bool Instrumentation::readProperty(NodeLexicon::Properties property, Value& value) const {
  inventory().enter(Operation::GetProperty, "getProperty(" + std::to_string(property) + ")");
  if (current() == nullptr) {
    return false;
  }
  const auto found = current()->properties.find(property);
  if (found == current()->properties.end() || !std::holds_alternative<Value>(found->second)) {
    return false;
  }
  value = std::get<Value>(found->second);
  return true;
}

bool Instrumentation::getProperty(NodeLexicon::Properties property, unsigned int& value) const {
  return readProperty(property, value);
}

bool Instrumentation::getProperty(NodeLexicon::Properties property, std::string& value) const {
  return readProperty(property, value);
}

bool Instrumentation::getProperty(NodeLexicon::Properties property, std::vector<unsigned int>& value) const {
  return readProperty(property, value);
}

Node* Instrumentation::current() const {
  return position_ < selection_.size() ? selection_[position_] : nullptr;
}

}  // namespace Tarn
