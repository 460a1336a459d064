#include "platform/inventory/sources/smbios/Problem.h"

#include <utility>

#include "platform/inventory/sources/smbios/Hexadecimal.h"

namespace Tarn::Smbios {

std::string describe(const Problem& problem) {
  std::string text = problem.place == Problem::Place::EntryPoint ? "SMBIOS entry point" : "SMBIOS table";
  text += ", offset " + detail::hexadecimal(problem.offset);
  if (problem.structure) {
    text += ", structure " + std::to_string(*problem.structure);
  }
  if (problem.handle) {
    text += " (handle " + detail::hexadecimal(*problem.handle, 4) + ')';
  }
  return text + ": " + problem.text;
}

void Problems::add(Problem problem) {
  if (list_.size() < most) {
    list_.push_back(std::move(problem));
  } else if (list_.size() == most) {
    problem.text = "there are more problems from here on, which are not listed";
    list_.push_back(std::move(problem));
  }
}

}  // namespace Tarn::Smbios
