#include "platform/inventory/sources/snapshot/SmbiosMask.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <set>
#include <variant>

#include "platform/base/Ascii.h"
#include "platform/inventory/sources/kernel/SystemModel.h"
#include "platform/inventory/sources/smbios/Tables.h"

namespace Tarn::Inventory {

namespace {

using Smbios::Bytes;
using Smbios::Structure;

/// A field that refers to a text.
struct TextField {
  std::uint8_t type;
  std::uint8_t offset;
  std::string_view name;
  bool identifies;  ///< one machine, or one part of it
};
constexpr std::array textFields = {
    TextField{0, 0x04, "vendor", false},       TextField{0, 0x05, "version", false},
    TextField{0, 0x08, "release date", false}, TextField{1, 0x04, "manufacturer", false},
    TextField{1, 0x05, "product", false},      TextField{1, 0x06, "version", false},
    TextField{1, 0x07, "serial number", true}, TextField{1, 0x19, "SKU number", true},
    TextField{1, 0x1A, "family", false},       TextField{4, 0x04, "socket", false},
    TextField{4, 0x07, "manufacturer", false}, TextField{4, 0x10, "version", false},
    TextField{4, 0x20, "serial number", true}, TextField{4, 0x21, "asset tag", true},
    TextField{4, 0x22, "part number", true},   TextField{7, 0x04, "socket", false},
};

/// A type whose fields stay, up to where they are known.
struct KeptType {
  std::uint8_t type;
  std::size_t length;
};
constexpr std::array keptTypes = {KeptType{0, 0x1A}, KeptType{1, 0x1B}, KeptType{4, 0x32}, KeptType{7, 0x1B}};

constexpr std::size_t uuidOffset = 0x08;
constexpr std::size_t uuidLength = 16;
constexpr char masked = 'X';

class Masker {
 public:
  Masker(const Smbios::Tables& tables, Bytes original, std::string& table)
      : tables_(tables), original_(original), table_(table) {}

  std::vector<std::string> mask() {
    for (const Structure& structure : tables_.structures) {
      const auto* const kept = std::ranges::find(keptTypes, structure.type, &KeptType::type);
      if (kept != keptTypes.end()) {
        maskKept(structure, kept->length);
      } else if (maskWhole(structure)) {
        whole_.insert(structure.type);
      }
    }
    maskBehind();
    noteWhole();
    return std::move(notes_);
  }

 private:
  void maskKept(const Structure& structure, std::size_t knownLength) {
    std::string note;
    const auto add = [&note](std::string_view name) { note.append(note.empty() ? "" : ", ").append(name); };
    std::set<unsigned int> kept;
    std::set<unsigned int> done;
    for (const TextField& field : textFields) {
      const unsigned int index = referenceIn(structure, field);
      if (index != 0 && field.identifies && maskText(structure.string(index))) {
        add(field.name);
      }
      // A text that two fields share is masked if either identifies.
      (field.identifies ? done : kept).insert(index);
    }
    structure.eachString([&](unsigned int index, Bytes text) {
      if (!kept.contains(index) && !done.contains(index) && maskText(text)) {
        add("text " + std::to_string(index));
      }
    });
    if (structure.type == Smbios::StructureType::system && maskUuid(structure)) {
      add("UUID");
    }
    if (structure.formatted.size() > knownLength && clear(structure.formatted.subspan(knownLength))) {
      add("fields after the known ones");
    }
    if (!note.empty()) {
      notes_.push_back(Smbios::placeOf(structure) + ": " + note);
    }
  }

  // The number of the text that the structure's field refers to; 0 for none.
  static unsigned int referenceIn(const Structure& structure, const TextField& field) {
    const bool isThere = field.type == structure.type && field.offset < structure.formatted.size();
    return isThere ? std::to_integer<unsigned int>(structure.formatted[field.offset]) : 0;
  }

  bool maskWhole(const Structure& structure) {
    bool any = clear(structure.formatted.subspan(Structure::headerLength));
    structure.eachString([&](unsigned int, Bytes text) { any = maskText(text) || any; });
    return any;
  }

  // What follows the last structure is no structure; the header of what broke the table off stays, as it
  // says why. Zeros stay, as they may mean that nothing follows.
  void maskBehind() {
    std::size_t end = 0;
    if (!tables_.structures.empty()) {
      const Structure& last = tables_.structures.back();
      end = last.offset + last.formatted.size() + std::max<std::size_t>(last.strings.size() + 1, 2);
    }
    bool any = false;
    for (std::size_t i = end + Structure::headerLength; i < table_.size(); ++i) {
      if (table_[i] != '\0' && table_[i] != masked) {
        table_[i] = masked;
        any = true;
      }
    }
    if (any) {
      notes_.emplace_back("what follows the last SMBIOS structure");
    }
  }

  void noteWhole() {
    if (whole_.empty()) {
      return;
    }
    std::string types;
    for (const unsigned int type : whole_) {
      types.append(types.empty() ? "" : ", ").append(std::to_string(type));
    }
    notes_.push_back("SMBIOS types " + types + ": everything, the inventory is not read from them");
  }

  bool maskText(const std::optional<Bytes>& text) {
    if (!text) {
      return false;
    }
    const std::size_t begin = offsetOf(*text);
    const std::string_view characters = Common::trimmed(std::string_view(table_).substr(begin, text->size()));
    const bool isMasked = std::ranges::all_of(characters, [](char c) { return c == masked; });
    if (isMasked || isPlaceholder(characters)) {
      return false;
    }
    table_.replace(begin, text->size(), text->size(), masked);
    return true;
  }

  bool maskUuid(const Structure& structure) {
    if (structure.formatted.size() < uuidOffset + uuidLength) {
      return false;
    }
    const std::size_t begin = structure.offset + uuidOffset;
    const std::string_view uuid = std::string_view(table_).substr(begin, uuidLength);
    if (std::ranges::count(uuid, uuid.front()) == uuidLength) {
      return false;  // none, not set, or masked already
    }
    table_.replace(begin, uuidLength, uuidLength, masked);
    return true;
  }

  bool clear(Bytes bytes) {
    const bool any = std::ranges::any_of(bytes, [](std::byte byte) { return byte != std::byte{0}; });
    table_.replace(offsetOf(bytes), bytes.size(), bytes.size(), '\0');
    return any;
  }

  std::size_t offsetOf(Bytes part) const { return static_cast<std::size_t>(part.data() - original_.data()); }

  const Smbios::Tables& tables_;
  Bytes original_;
  std::string& table_;
  std::set<unsigned int> whole_;
  std::vector<std::string> notes_;
};

}  // namespace

std::vector<std::string> maskTable(std::string_view entryPoint, std::string& table) {
  const std::string original = table;
  const Smbios::Decoded decoded = Smbios::decode(Smbios::bytesOf(entryPoint), Smbios::bytesOf(original));
  if (const auto* const tables = std::get_if<Smbios::Tables>(&decoded)) {
    return Masker(*tables, Smbios::bytesOf(original), table).mask();
  }
  if (std::ranges::count(table, masked) == std::ssize(table)) {
    return {};
  }
  table.assign(table.size(), masked);
  return {"everything, as its entry point cannot be read"};
}

}  // namespace Tarn::Inventory
