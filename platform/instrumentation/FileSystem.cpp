#include "platform/instrumentation/FileSystem.h"

#include <algorithm>
#include <array>
#include <cerrno>

namespace Tarn::Inventory {

namespace {

struct ErrorText {
  FileError error;
  std::string_view text;
};

// Not strerror: its texts follow the process's language.
constexpr std::array errorTexts = {
    ErrorText{EPERM, "operation not permitted"},
    ErrorText{ENOENT, "no such file or directory"},
    ErrorText{EIO, "input/output error"},
    ErrorText{ENXIO, "no such device or address"},
    ErrorText{EAGAIN, "it is a pipe, and nothing is in it"},
    ErrorText{ENOMEM, "out of memory"},
    ErrorText{EACCES, "permission denied"},
    ErrorText{ENODEV, "no such device"},
    ErrorText{ENOTDIR, "not a directory"},
    ErrorText{EISDIR, "is a directory"},
    ErrorText{EINVAL, "invalid argument"},
    ErrorText{ENFILE, "too many open files in the system"},
    ErrorText{EMFILE, "too many open files"},
    ErrorText{EFBIG, "file too large"},
    ErrorText{ENAMETOOLONG, "file name too long"},
    ErrorText{ELOOP, "too many symbolic links"},
};

}  // namespace

std::string describeError(FileError error) {
  const auto* const found = std::ranges::find(errorTexts, error, &ErrorText::error);
  return found == errorTexts.end() ? "system error " + std::to_string(error) : std::string(found->text);
}

}  // namespace Tarn::Inventory
