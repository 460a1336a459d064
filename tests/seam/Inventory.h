#ifndef TESTS_SEAM_INVENTORY_H
#define TESTS_SEAM_INVENTORY_H

#include <tarn/NodeLexicon.h>

#include <deque>
#include <map>
#include <string>
#include <variant>
#include <vector>

/// The inventory tree that the scripted Tarn::Instrumentation walks.
namespace Scripted {

/// What a cursor can be asked.
enum class Operation {
  Construct,
  SelectType,
  SelectPath,
  Test,
  Next,
  SetFilter,
  GetNodeStatus,
  GetNodeDescription,
  GetPathToNode,
  GetPathToParentNode,
  ConvertPathToString,
  ConvertStringToPath,
  GetProperty
};

/// What a failing operation throws: a std::runtime_error, or something that is no std::exception.
enum class Thrown { Standard, Unusual };
inline constexpr const char* thrownText = "the inventory broke";
struct UnusualException {};

using PropertyValue = std::variant<unsigned int, std::string, std::vector<unsigned int>>;

struct Node {
  Tarn::NodeLexicon::NodeType type;
  std::string path;                       // printable
  std::string parent;                     // printable
  std::vector<unsigned int> statuses{1};  // one for each read, the last for all further ones
  std::string description;
  std::map<Tarn::NodeLexicon::Properties, PropertyValue> properties;
};

/// A tree in the order of its making. Cores and caches become children of the processor made last;
/// what follows a node (status, description, ...) changes that node:
///
///     inventory().system("Model").processor("cpu0").has(PropFamily, 198).core("core0").status(16);
///
/// Nodes start with status 1, the description "Element " + path and no property.
class Inventory {
 public:
  Inventory& system(const std::string& model);
  Inventory& processor(const std::string& path);
  Inventory& core(const std::string& path);
  Inventory& cache(const std::string& path);

  Inventory& status(unsigned int status) { return statuses({status}); }
  Inventory& statuses(std::vector<unsigned int> statuses);
  Inventory& description(const std::string& text);
  Inventory& parent(const std::string& path);
  Inventory& has(Tarn::NodeLexicon::Properties property, PropertyValue value);
  Inventory& lacks(Tarn::NodeLexicon::Properties property);

  /// A node with every property that its kind can have, each of another value.
  Inventory& fullProcessor(const std::string& path);
  Inventory& fullCache(const std::string& path);

  /// Lets the n-th call from now (1: the next) throw.
  void failNth(Operation operation, unsigned int n, Thrown thrown = Thrown::Standard);
  void clearFailures() { failures_.clear(); }

  /// The calls since the last clearing, such as "selectNode(4)" or "getProperty(298)".
  const std::vector<std::string>& calls() const { return calls_; }
  unsigned int count(const std::string& call) const;
  void clearCalls() { calls_.clear(); }

  int livingCursors() const { return livingCursors_; }

  /// An empty tree that nothing has asked yet.
  void reset();

  /// For the cursor.
  void enter(Operation operation, std::string call);
  void cursorMade() { ++livingCursors_; }
  void cursorGone() { --livingCursors_; }
  std::deque<Node>& nodes() { return nodes_; }
  bool isBelow(const Node& node, const std::string& path) const;

 private:
  struct Failure {
    Operation operation;
    unsigned int callsBefore;
    Thrown thrown;
  };

  Inventory& add(Tarn::NodeLexicon::NodeType type, const std::string& path, const std::string& parent);

  std::deque<Node> nodes_;
  std::vector<Failure> failures_;
  std::vector<std::string> calls_;
  std::string system_;
  std::string processor_;
  int livingCursors_ = 0;
};

Inventory& inventory();

/// The internal form of a printable path; never equal to any printable path.
std::string internalPath(const std::string& printablePath);

}  // namespace Scripted

#endif
