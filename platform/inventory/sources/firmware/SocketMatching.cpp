#include "platform/inventory/sources/firmware/SocketMatching.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <utility>

#include "platform/base/Ascii.h"

namespace Tarn::Inventory {

namespace {

/// One of the traits by which processors are told apart; its value as a text, empty where it is not known.
struct Criterion {
  std::string_view name;
  std::string (*value)(const ProcessorIdentity& identity);
};

std::string countText(std::optional<unsigned int> count) {
  return count ? std::to_string(*count) : std::string();
}

constexpr std::array criteria = {
    Criterion{"signature", [](const ProcessorIdentity& identity) { return identity.signature; }},
    Criterion{"name", [](const ProcessorIdentity& identity) { return identity.name; }},
    Criterion{"number of cores", [](const ProcessorIdentity& identity) { return countText(identity.cores); }},
    Criterion{"number of threads", [](const ProcessorIdentity& identity) { return countText(identity.threads); }},
};

using Indexes = std::vector<std::size_t>;

/// Sockets and packages that nothing tells apart so far.
struct Group {
  Indexes sockets;
  Indexes packages;
};

bool agree(const Criterion& criterion, const ProcessorIdentity& one, const ProcessorIdentity& other) {
  const std::string value = criterion.value(one);
  return !value.empty() && value == criterion.value(other);
}

bool contradict(const ProcessorIdentity& socket, const ProcessorIdentity& package) {
  return !socket.signature.empty() && !package.signature.empty() && socket.signature != package.signature;
}

class Matcher {
 public:
  Matcher(std::span<const ProcessorIdentity> sockets, std::span<const ProcessorIdentity> packages)
      : sockets_(sockets), packages_(packages) {
    result_.packages.resize(packages.size());
  }

  SocketMatching match() {
    Group all;
    for (std::size_t i = 0; i < sockets_.size(); ++i) {
      all.sockets.push_back(i);
    }
    for (std::size_t i = 0; i < packages_.size(); ++i) {
      all.packages.push_back(i);
    }
    std::vector<Group> groups = {std::move(all)};
    for (const Criterion& criterion : criteria) {
      groups = split(criterion, groups);
    }
    for (const Group& group : groups) {
      settle(group);
    }
    std::ranges::sort(result_.unseen);
    return std::move(result_);
  }

 private:
  // Takes out of each group what agrees in the criterion, if equally many do on both sides.
  std::vector<Group> split(const Criterion& criterion, const std::vector<Group>& groups) const {
    std::vector<Group> parts;
    for (const Group& group : groups) {
      Group rest;
      const auto firstOfThese = static_cast<std::ptrdiff_t>(parts.size());
      for (auto& [value, part] : alike(criterion, group)) {
        if (!value.empty() && part.sockets.size() == part.packages.size()) {
          parts.push_back(std::move(part));
        } else {
          append(part, rest);
        }
      }
      std::sort(parts.begin() + firstOfThese, parts.end(),
                [](const Group& one, const Group& other) { return one.packages.front() < other.packages.front(); });
      std::ranges::sort(rest.sockets);
      std::ranges::sort(rest.packages);
      parts.push_back(std::move(rest));
    }
    return parts;
  }

  // The members of the group by their value. Comparing each with each would take too long on a machine, or
  // with a made-up table, of very many sockets.
  std::map<std::string, Group> alike(const Criterion& criterion, const Group& group) const {
    std::map<std::string, Group> parts;
    for (const std::size_t socket : group.sockets) {
      parts[criterion.value(sockets_[socket])].sockets.push_back(socket);
    }
    for (const std::size_t package : group.packages) {
      parts[criterion.value(packages_[package])].packages.push_back(package);
    }
    return parts;
  }

  static void append(const Group& part, Group& rest) {
    rest.sockets.insert(rest.sockets.end(), part.sockets.begin(), part.sockets.end());
    rest.packages.insert(rest.packages.end(), part.packages.begin(), part.packages.end());
  }

  void settle(const Group& group) {
    if (group.packages.empty()) {
      result_.unseen.insert(result_.unseen.end(), group.sockets.begin(), group.sockets.end());
      return;
    }
    bool fits = group.sockets.size() == group.packages.size();
    for (std::size_t i = 0; fits && i < group.sockets.size(); ++i) {
      fits = !contradict(sockets_[group.sockets[i]], packages_[group.packages[i]]);
    }
    if (!fits) {
      result_.contradictions.push_back({group.sockets, group.packages});
      return;
    }
    for (std::size_t i = 0; i < group.sockets.size(); ++i) {
      result_.packages[group.packages[i]] = {group.sockets[i], ruleOf(group, i)};
    }
  }

  std::string ruleOf(const Group& group, std::size_t place) const {
    const ProcessorIdentity& socket = sockets_[group.sockets[place]];
    const ProcessorIdentity& package = packages_[group.packages[place]];
    std::string same;
    for (const Criterion& criterion : criteria) {
      if (agree(criterion, socket, package)) {
        same += (same.empty() ? "the same " : ", ") + std::string(criterion.name);
      }
    }
    if (group.sockets.size() == 1) {
      return same.empty() ? "the only one that is left on both sides" : same;
    }
    return (same.empty() ? "" : same + "; ") + std::to_string(group.sockets.size()) +
           " are alike, so by order: ascending handle to ascending package number";
  }

  std::span<const ProcessorIdentity> sockets_;
  std::span<const ProcessorIdentity> packages_;
  SocketMatching result_;
};

}  // namespace

std::string comparableName(std::string_view name) {
  constexpr std::array<std::string_view, 2> marks = {"(r)", "(tm)"};
  std::string plain;
  while (!name.empty()) {
    const auto* const mark = std::ranges::find_if(
        marks, [&](std::string_view m) { return Common::equalIgnoringCase(name.substr(0, m.size()), m); });
    if (mark != marks.end()) {
      name.remove_prefix(mark->size());
      continue;
    }
    if (name.front() != ' ' || !(plain.empty() || plain.back() == ' ')) {
      plain += Common::lower(name.front());
    }
    name.remove_prefix(1);
  }
  if (plain.ends_with(' ')) {
    plain.pop_back();
  }
  return plain;
}

SocketMatching matchSockets(std::span<const ProcessorIdentity> sockets, std::span<const ProcessorIdentity> packages) {
  return Matcher(sockets, packages).match();
}

}  // namespace Tarn::Inventory
