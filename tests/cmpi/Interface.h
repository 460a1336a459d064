#ifndef CORVANE_TESTS_CMPI_INTERFACE_H
#define CORVANE_TESTS_CMPI_INTERFACE_H

#include <cstddef>
#include <span>

// The CMPI 2.0 binary interface as data, beside what the headers make of it.

struct Member {
  const char* name;
  std::size_t offset;     // in the header's record
  std::size_t size;       // of the type that the interface gives the member
  std::size_t alignment;  // of that type
  bool sameType;          // whether the header gives it exactly that type
};

struct Record {
  const char* name;
  bool isUnion;
  std::size_t size;  // of the header's record
  std::size_t alignment;
  std::span<const Member> members;  // in the interface's order
};

struct Code {
  const char* name;
  unsigned long actual;    // in the header
  unsigned long expected;  // in the interface
};

std::span<const Record> dataRecords();     // values and object records
std::span<const Record> brokerTables();    // what a broker offers
std::span<const Record> objectTables();    // operations on objects
std::span<const Record> providerTables();  // what a provider offers
std::span<const Code> typeCodes();
std::span<const Code> enumerators();

#endif
