#ifndef HOST_CORVCIM_TEXT_LIBRARYERRORS_H
#define HOST_CORVCIM_TEXT_LIBRARYERRORS_H

#include <string>
#include <vector>

namespace Corvcim {

/// While it lives, what anybody in this process or its children writes to standard error goes to a file in
/// memory: providers write texts of exceptions there, which this program says itself and better. One at a time.
///
/// Nothing is kept back where the library's logger writes to standard error, as somebody wants to read along,
/// nor where the system has no files in memory.
class LibraryErrors {
 public:
  LibraryErrors();
  /// Writes what nobody took to standard error as it is.
  ~LibraryErrors();
  LibraryErrors(const LibraryErrors&) = delete;
  LibraryErrors& operator=(const LibraryErrors&) = delete;

  /// Ends the keeping back and gives the lines, in order, without empty ones and without those that were
  /// there before.
  std::vector<std::string> take();

  /// Writes what was kept back so far to standard error. For the handler of a signal.
  static void show();
};

}  // namespace Corvcim

#endif
