#ifndef HOST_CORVCIM_DIFF_SENTENCES_H
#define HOST_CORVCIM_DIFF_SENTENCES_H

#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// Paths as a sentence lists them: "P0.C1", "P0.C1 and P0.C4", "P0.C1 to P0.C7 and P0.C9". Three or more
/// that differ only in their last number, which counts up by one, become "first to last".
std::string listPaths(const std::vector<std::string>& paths);

enum class Verbal { None, Is, Has };

/// What is said of a path: "is" or "has", as its number asks, and what follows. Without either, `rest`
/// stands right after the path and begins with a blank or a colon.
struct Predicate {
  Verbal verbal = Verbal::None;
  std::string rest;
  std::string ifSeveral = {};  ///< the end of a sentence about several paths
  bool operator==(const Predicate&) const = default;
};

/// Sentences about paths, in the order of their first paths. Paths of which the same is said share one.
class Sentences {
 public:
  /// `kind` keeps sentences about different kinds of thing apart.
  void add(std::string_view kind, const std::string& path, Predicate predicate);

  /// One sentence on each line.
  std::string text() const;

 private:
  struct Sentence {
    std::string kind;
    Predicate predicate;
    std::vector<std::string> paths;
  };
  std::vector<Sentence> sentences_;
};

}  // namespace Corvcim

#endif
