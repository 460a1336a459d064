#include "platform/inventory/sources/smbios/Structure.h"

#include <algorithm>

#include "platform/inventory/sources/smbios/Hexadecimal.h"

namespace Tarn::Smbios {

namespace {

constexpr std::byte zero{0};

/// Handles are 16 bits wide and none is used twice.
constexpr std::size_t mostStructures = std::size_t{1} << 16U;

class Walker {
 public:
  Walker(const EntryPoint& entryPoint, Bytes table, Problems& problems)
      : entryPoint_(entryPoint), table_(table), problems_(problems) {
    if (table.size() > entryPoint.tableLength) {
      table_ = table.first(entryPoint.tableLength);
    } else if (table.size() < entryPoint.tableLength && entryPoint.kind != EntryPoint::Kind::Smbios3) {
      problems.add({Problem::Place::Table, table.size(),
                    "the table ends after " + std::to_string(table.size()) + " of the " +
                        std::to_string(entryPoint.tableLength) + " bytes that its entry point announces"});
    }
    if (table_.size() > largestTable) {
      problems.add({Problem::Place::Table, largestTable,
                    "the table has " + std::to_string(table_.size()) + " bytes; what comes after the first " +
                        std::to_string(largestTable) + " is not read"});
      table_ = table_.first(largestTable);
    }
  }

  std::vector<Structure> walk() {
    found_.reserve(std::min<std::size_t>(entryPoint_.structures.value_or(64), table_.size() / 6));
    while (!atEnd() && readStructure()) {
    }
    return std::move(found_);
  }

 private:
  bool atEnd() {
    if (!found_.empty() && found_.back().type == StructureType::endOfTable && allSeen()) {
      return noteCount();
    }
    if (offset_ == table_.size() || (entryPoint_.structures && allSeen() && onlyZerosLeft())) {
      return noteEnd();
    }
    if (found_.size() == mostStructures) {
      note("the table has more structures than there can be handles");
      return true;
    }
    return false;
  }

  // Under _SM3_ the number of structures is not given, and the mark ends the table wherever it stands.
  bool allSeen() const { return found_.size() >= entryPoint_.structures.value_or(0); }

  bool onlyZerosLeft() const {
    return std::ranges::all_of(table_.subspan(offset_), [](std::byte byte) { return byte == zero; });
  }

  bool noteEnd() {
    if (entryPoint_.kind == EntryPoint::Kind::Smbios3) {
      note("the table ends without an end-of-table structure");
    }
    return noteCount();
  }

  bool noteCount() {
    if (entryPoint_.structures && found_.size() != *entryPoint_.structures) {
      note("the table has " + std::to_string(found_.size()) + " structures; its entry point announces " +
           std::to_string(*entryPoint_.structures));
    }
    return true;
  }

  // False where the walk cannot go on.
  bool readStructure() {
    const Bytes rest = table_.subspan(offset_);
    const auto number = static_cast<unsigned int>(found_.size());
    if (rest.size() < Structure::headerLength) {
      note("the table ends within the structure's header, after " + std::to_string(rest.size()) + " of its 4 bytes",
           number);
      return false;
    }
    const auto length = littleEndian<std::uint8_t>(rest, 1);
    const auto handle = littleEndian<std::uint16_t>(rest, 2);
    if (length < Structure::headerLength) {
      note("the structure's length is " + std::to_string(length) + ", less than the 4 bytes of its header", number,
           handle);
      return false;
    }
    if (length > rest.size()) {
      note("the structure's length is " + std::to_string(length) + ", and the table ends after " +
               std::to_string(rest.size()) + " of these bytes",
           number, handle);
      return false;
    }
    const Bytes following = rest.subspan(length);
    const std::size_t strings = endOfStrings(following);
    found_.push_back({.number = number,
                      .offset = offset_,
                      .type = littleEndian<std::uint8_t>(rest, 0),
                      .handle = handle,
                      .formatted = rest.first(length),
                      .strings = following.first(strings)});
    if (strings == following.size()) {
      offset_ = table_.size();
      note("the table ends within the structure's strings", number, handle);
      return false;
    }
    // One zero more than the strings have, and two where there is no string.
    offset_ += length + std::max<std::size_t>(strings + 1, 2);
    return true;
  }

  // Where the zero stands that follows the last string's own; the end of the table where there is none.
  static std::size_t endOfStrings(Bytes following) {
    const auto last = std::adjacent_find(following.begin(), following.end(),
                                         [](std::byte one, std::byte next) { return (one | next) == zero; });
    if (last == following.end()) {
      return following.size();
    }
    const auto length = static_cast<std::size_t>(last - following.begin());
    return length == 0 ? 0 : length + 1;
  }

  void note(const std::string& text, std::optional<unsigned int> number = {},
            std::optional<std::uint16_t> handle = {}) {
    problems_.add({Problem::Place::Table, offset_, text, number, handle});
  }

  const EntryPoint& entryPoint_;
  Bytes table_;
  Problems& problems_;
  std::size_t offset_ = 0;
  std::vector<Structure> found_;
};

}  // namespace

std::optional<Bytes> Structure::string(unsigned int index) const {
  Bytes rest = strings;
  for (unsigned int at = 1; !rest.empty(); ++at) {
    const Bytes text = takeString(rest);
    if (at == index) {
      return text;
    }
  }
  return std::nullopt;
}

Bytes Structure::takeString(Bytes& rest) {
  const auto length = static_cast<std::size_t>(std::ranges::find(rest, zero) - rest.begin());
  const Bytes text = rest.first(length);
  rest = rest.subspan(std::min(length + 1, rest.size()));
  return text;
}

unsigned int Structure::stringCount() const {
  const auto ends = static_cast<unsigned int>(std::ranges::count(strings, zero));
  return ends + (strings.empty() || strings.back() == zero ? 0 : 1);
}

std::string placeOf(const Structure& structure) {
  return "SMBIOS type " + std::to_string(structure.type) + ", handle " + detail::hexadecimal(structure.handle, 4);
}

std::string placeOf(const Structure& structure, std::size_t offset) {
  return placeOf(structure) + ", offset " + detail::hexadecimal(offset, 2);
}

std::vector<Structure> walk(const EntryPoint& entryPoint, Bytes table, Problems& problems) {
  return Walker(entryPoint, table, problems).walk();
}

}  // namespace Tarn::Smbios
