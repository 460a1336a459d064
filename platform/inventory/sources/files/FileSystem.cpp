#include "platform/inventory/sources/files/FileSystem.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <charconv>

#include "platform/inventory/sources/files/ErrorNames.h"

namespace Tarn::Inventory {

namespace {

struct ErrorText {
  FileError error;
  std::string_view name;
  std::string_view text;
};

// Not strerror: its texts follow the process's language.
constexpr std::array errorTexts = {
    ErrorText{EPERM, "EPERM", "operation not permitted"},
    ErrorText{ENOENT, "ENOENT", "no such file or directory"},
    ErrorText{EIO, "EIO", "input/output error"},
    ErrorText{ENXIO, "ENXIO", "no such device or address"},
    ErrorText{EAGAIN, "EAGAIN", "it is a pipe, and nothing is in it"},
    ErrorText{ENOMEM, "ENOMEM", "out of memory"},
    ErrorText{EACCES, "EACCES", "permission denied"},
    ErrorText{ENODEV, "ENODEV", "no such device"},
    ErrorText{ENOTDIR, "ENOTDIR", "not a directory"},
    ErrorText{EISDIR, "EISDIR", "is a directory"},
    ErrorText{EINVAL, "EINVAL", "invalid argument"},
    ErrorText{ENFILE, "ENFILE", "too many open files in the system"},
    ErrorText{EMFILE, "EMFILE", "too many open files"},
    ErrorText{EFBIG, "EFBIG", "file too large"},
    ErrorText{ENAMETOOLONG, "ENAMETOOLONG", "file name too long"},
    ErrorText{ELOOP, "ELOOP", "too many symbolic links"},
};

}  // namespace

std::string describeError(FileError error) {
  const auto* const found = std::ranges::find(errorTexts, error, &ErrorText::error);
  return found == errorTexts.end() ? "system error " + std::to_string(error) : std::string(found->text);
}

std::string nameOfError(FileError error) {
  const auto* const found = std::ranges::find(errorTexts, error, &ErrorText::error);
  return found == errorTexts.end() ? std::to_string(error) : std::string(found->name);
}

std::optional<FileError> errorOfName(std::string_view name) {
  constexpr FileError highest = 4095;  // what a system call of Linux can return
  const auto* const found = std::ranges::find(errorTexts, name, &ErrorText::name);
  if (found != errorTexts.end()) {
    return found->error;
  }
  FileError number = 0;
  const auto [end, failure] = std::from_chars(name.data(), name.data() + name.size(), number);
  const bool isNumber = failure == std::errc() && end == name.data() + name.size();
  return isNumber && number > 0 && number <= highest ? std::optional(number) : std::nullopt;
}

}  // namespace Tarn::Inventory
