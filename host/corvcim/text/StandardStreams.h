#ifndef HOST_CORVCIM_TEXT_STANDARDSTREAMS_H
#define HOST_CORVCIM_TEXT_STANDARDSTREAMS_H

#include <cstddef>
#include <string_view>

namespace Corvcim {

/// Occupies the descriptors 0 to 2 where the caller closed them, so that no file opened later takes
/// their place. What is written to a closed one fails as before.
void occupyStandardStreams();

/// The width of the terminal on standard output; 0 if that is no terminal.
std::size_t terminalWidth();

/// Writes to standard output, and has it all on its way when it returns. A reader that went away ends
/// the program quietly, as SIGPIPE does. Throws std::runtime_error if the output cannot be written.
void writeOutput(std::string_view text);

/// Writes "corvcim: TEXT" as one line to standard error, the caller's even where it is replaced.
void writeError(std::string_view text);

/// Writes the text as it is to the caller's standard error. The handler of a signal may call it.
void writeToStandardError(std::string_view text);

/// Puts a file in the place of standard error, until it is restored. Whether that could be done.
bool replaceStandardError(int descriptor);
void restoreStandardError();

}  // namespace Corvcim

#endif
