#ifndef TESTS_SEAM_INSTRUMENTATION_H
#define TESTS_SEAM_INSTRUMENTATION_H

#include <tarn/NodeLexicon.h>

#include <cstddef>
#include <string>
#include <vector>

namespace Scripted {
struct Node;
}

namespace Tarn {

/// A cursor over Scripted::inventory(). Every operation is recorded there and fails if told to.
class Instrumentation {
 public:
  Instrumentation();
  ~Instrumentation();
  Instrumentation(const Instrumentation&) = delete;
  Instrumentation& operator=(const Instrumentation&) = delete;
  void selectNode(NodeLexicon::NodeType type);
  void selectNode(const std::string& internalPath);
  explicit operator bool() const;
  Instrumentation& operator++();
  void setFilter(NodeLexicon::PathType type, const std::string& internalPath);
  unsigned int getNodeStatus() const;
  std::string getNodeDescription() const;
  std::string getPathToNode() const;
  std::string getPathToParentNode() const;
  std::string convertPathToString(const std::string& internalPath) const;
  std::string convertStringToPath(const std::string& printablePath) const;
  bool getProperty(NodeLexicon::Properties property, unsigned int& value) const;
  bool getProperty(NodeLexicon::Properties property, std::string& value) const;
  bool getProperty(NodeLexicon::Properties property, std::vector<unsigned int>& value) const;

 private:
  Scripted::Node* current() const;
  template <class Value>
  bool readProperty(NodeLexicon::Properties property, Value& value) const;

  std::vector<Scripted::Node*> selection_;
  std::size_t position_ = 0;
};

}  // namespace Tarn

#endif
