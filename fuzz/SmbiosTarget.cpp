// The SMBIOS decoder, over dump files, and over tables behind entry points of either kind.

#include <algorithm>
#include <functional>
#include <span>

#include "fuzz/Target.h"
#include "platform/inventory/sources/smbios/Tables.h"

namespace {

using Corvane::Fuzz::require;
using namespace Tarn::Smbios;

bool within(Bytes part, Bytes whole) {
  const std::less_equal<> notAfter;
  return part.empty() ||
         (notAfter(whole.data(), part.data()) && notAfter(part.data() + part.size(), whole.data() + whole.size()));
}

template <class Value>
void checkField(const Structure& structure, const Field<Value>& field) {
  require(within(field.raw, structure.formatted), "raw bytes are the structure's own");
  require(!field || !field.raw.empty(), "a value comes from bytes");
  require(field.raw.empty() || field.raw.data() == structure.formatted.data() + field.offset,
          "raw bytes stand at the field's offset");
}

void checkText(const Structure& structure, const Field<std::string>& field) {
  checkField(structure, field);
  if (field) {
    const auto text = structure.string(std::to_integer<unsigned int>(field.raw.front()));
    require(text && std::ranges::equal(*text, bytesOf(*field)), "a text is the string that its field names");
  }
}

void checkRecords(const Tables& tables) {
  for (const System& s : tables.systems) {
    for (const auto* const field : {&s.manufacturer, &s.product, &s.version, &s.serialNumber, &s.sku, &s.family}) {
      checkText(s.structure, *field);
    }
    checkField(s.structure, s.uuid);
  }
  for (const Processor& p : tables.processors) {
    for (const auto* const field :
         {&p.socket, &p.manufacturer, &p.version, &p.serialNumber, &p.assetTag, &p.partNumber}) {
      checkText(p.structure, *field);
    }
    for (const auto* const field :
         {&p.family, &p.externalClock, &p.maxSpeed, &p.currentSpeed, p.caches.data(), &p.caches[1], &p.caches[2],
          &p.cores, &p.coresEnabled, &p.threads, &p.characteristics}) {
      checkField(p.structure, *field);
    }
    checkField(p.structure, p.id);
    checkField(p.structure, p.status);
    checkField(p.structure, p.populated);
    checkField(p.structure, p.upgrade);
  }
  for (const Cache& c : tables.caches) {
    checkText(c.structure, c.socket);
    checkField(c.structure, c.level);
    checkField(c.structure, c.installedSize);
    checkField(c.structure, c.ways);
    require(!c.level || (*c.level >= 1 && *c.level <= 8), "a level is one of eight");
  }
}

void checkTables(const Tables& tables, Bytes table) {
  std::size_t end = 0;
  for (std::size_t i = 0; i < tables.structures.size(); ++i) {
    const Structure& structure = tables.structures[i];
    require(structure.number == i, "structures are counted");
    require(structure.offset >= end, "structures do not overlap");
    require(within(structure.formatted, table) && within(structure.strings, table), "structures are in the table");
    require(structure.formatted.size() >= Structure::headerLength, "structures have a header");
    require(structure.formatted.data() == table.data() + structure.offset, "structures stand at their offset");
    require(structure.stringCount() == 0 || structure.string(structure.stringCount()), "the last string is there");
    require(!structure.string(structure.stringCount() + 1), "no string follows the last");
    require(tables.structure(structure.handle) != nullptr, "structures are found by their handle");
    end = structure.offset + structure.formatted.size() + structure.strings.size();
  }
  require(tables.problems.size() <= Problems::most + 1, "there is a limit to problems");
  for (const Problem& problem : tables.problems) {
    require(!problem.text.empty() && !describe(problem).empty(), "problems have words");
    require(problem.place == Problem::Place::EntryPoint || problem.offset <= table.size(), "problems are in the table");
  }
  checkRecords(tables);
}

void check(const Decoded& decoded, Bytes table) {
  if (const auto* const tables = std::get_if<Tables>(&decoded)) {
    checkTables(*tables, table);
  } else {
    require(!describe(std::get<Problem>(decoded)).empty(), "a failure has words");
  }
}

/// An entry point that leads to as many bytes as there are.
std::string entryPointTo(const std::string& anchor, std::size_t length) {
  std::string bytes = anchor;
  bytes.resize(0x20);
  const auto low = static_cast<char>(static_cast<unsigned char>(length & 0xFFU));
  const auto high = static_cast<char>(static_cast<unsigned char>(length >> 8U & 0xFFU));
  const std::size_t at = anchor == "_SM3_" ? 0x0C : 0x16;
  bytes[at] = low;
  bytes[at + 1] = high;
  bytes[0x1C] = 3;  // structures, under 32 bits
  return bytes;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const Bytes bytes = std::as_bytes(std::span(data, size));
  const Decoded dump = decodeDump(bytes);
  const auto* const tables = std::get_if<Tables>(&dump);
  check(dump, tables == nullptr ? Bytes() : tableInDump(tables->entryPoint, bytes));
  for (const char* const anchor : {"_SM3_", "_SM_"}) {
    check(decode(bytesOf(entryPointTo(anchor, size)), bytes), bytes);
  }
  return 0;
}
