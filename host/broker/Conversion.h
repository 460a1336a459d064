#ifndef CORVCIM_CONVERSION_H
#define CORVCIM_CONVERSION_H

#include <cmpidt.h>

#include <string>

#include "host/broker/Arena.h"
#include "host/broker/Value.h"

namespace Corvcim {

/// What a provider passed as (value, type). rc is CMPI_RC_OK or says, with the problem's text, why it
/// is no value: CMPI_RC_ERR_INVALID_DATA_TYPE for a type code that nothing has, CMPI_RC_ERR_TYPE_MISMATCH
/// for an array of another type.
struct ConvertedValue {
  Value value;
  CMPIrc rc = CMPI_RC_OK;
  std::string problem;
};

/// A NULL `value`, a NULL text or object inside it and an object without handle are NULL of that type.
[[nodiscard]] ConvertedValue fromCmpi(const CMPIValue* value, CMPIType type);

/// As a provider reads it; texts, paths and arrays become objects of the arena.
[[nodiscard]] CMPIData toCmpi(Arena& arena, const Value& value);

/// CMPI_chars becomes CMPI_string, also as an array's element type: texts are always handed out as objects.
[[nodiscard]] CMPIType normalizedType(CMPIType type);

/// Whether it is the code of a type that a value can have (arrays included).
[[nodiscard]] bool isValueType(CMPIType type);

}  // namespace Corvcim

#endif
