#include "host/broker/Conversion.h"

#include <cstring>

#include "host/broker/Objects.h"

namespace Corvcim {
namespace {

// A provider passes the address of its own variable, which need not be aligned like a CMPIValue: it
// is copied, never read as a member of one.
template <class T>
T read(const void* source) {
  T value;
  std::memcpy(&value, source, sizeof(T));
  return value;
}

struct ScalarConversion {
  CMPIType type;
  Value (*from)(const void* source);
  void (*to)(CMPIValue& target, const Value& value);
};

constexpr ScalarConversion scalarConversions[] = {
    {CMPI_boolean, [](const void* source) { return Value::boolean(read<CMPIBoolean>(source) != 0); },
     [](CMPIValue& t, const Value& v) { t.boolean = v.asBoolean() ? 1 : 0; }},
    {CMPI_char16, [](const void* source) { return Value::char16(read<CMPIChar16>(source)); },
     [](CMPIValue& t, const Value& v) { t.char16 = static_cast<CMPIChar16>(v.asUnsigned()); }},
    {CMPI_real32, [](const void* source) { return Value::real32(read<CMPIReal32>(source)); },
     [](CMPIValue& t, const Value& v) { t.real32 = static_cast<CMPIReal32>(v.asReal()); }},
    {CMPI_real64, [](const void* source) { return Value::real64(read<CMPIReal64>(source)); },
     [](CMPIValue& t, const Value& v) { t.real64 = v.asReal(); }},
    {CMPI_uint8, [](const void* source) { return Value::uint8(read<CMPIUint8>(source)); },
     [](CMPIValue& t, const Value& v) { t.uint8 = static_cast<CMPIUint8>(v.asUnsigned()); }},
    {CMPI_uint16, [](const void* source) { return Value::uint16(read<CMPIUint16>(source)); },
     [](CMPIValue& t, const Value& v) { t.uint16 = static_cast<CMPIUint16>(v.asUnsigned()); }},
    {CMPI_uint32, [](const void* source) { return Value::uint32(read<CMPIUint32>(source)); },
     [](CMPIValue& t, const Value& v) { t.uint32 = static_cast<CMPIUint32>(v.asUnsigned()); }},
    {CMPI_uint64, [](const void* source) { return Value::uint64(read<CMPIUint64>(source)); },
     [](CMPIValue& t, const Value& v) { t.uint64 = v.asUnsigned(); }},
    {CMPI_sint8, [](const void* source) { return Value::sint8(read<CMPISint8>(source)); },
     [](CMPIValue& t, const Value& v) { t.sint8 = static_cast<CMPISint8>(v.asSigned()); }},
    {CMPI_sint16, [](const void* source) { return Value::sint16(read<CMPISint16>(source)); },
     [](CMPIValue& t, const Value& v) { t.sint16 = static_cast<CMPISint16>(v.asSigned()); }},
    {CMPI_sint32, [](const void* source) { return Value::sint32(read<CMPISint32>(source)); },
     [](CMPIValue& t, const Value& v) { t.sint32 = static_cast<CMPISint32>(v.asSigned()); }},
    {CMPI_sint64, [](const void* source) { return Value::sint64(read<CMPISint64>(source)); },
     [](CMPIValue& t, const Value& v) { t.sint64 = v.asSigned(); }},
};

const ScalarConversion* findScalar(CMPIType type) {
  for (const ScalarConversion& each : scalarConversions) {
    if (each.type == type) {
      return &each;
    }
  }
  return nullptr;
}

Value fromObject(const void* source, CMPIType type) {
  switch (type) {
    case CMPI_string:
      if (const auto* text = StringObject::of(read<CMPIString*>(source))) {
        return Value::string(text->text);
      }
      break;
    case CMPI_ref:
      if (const auto* path = ObjectPathObject::of(read<CMPIObjectPath*>(source))) {
        return Value::reference(path->path);
      }
      break;
    case CMPI_instance:
      if (const auto* instance = InstanceObject::of(read<CMPIInstance*>(source))) {
        return Value::instance(instance->complete());
      }
      break;
    case CMPI_dateTime:
      if (const auto* moment = DateTimeObject::of(read<CMPIDateTime*>(source))) {
        return Value::dateTime(moment->value.text());
      }
      break;
    default:
      break;
  }
  return Value::null(type);
}

ConvertedValue fromArray(const void* source, CMPIType type) {
  const auto* array = ArrayObject::of(read<CMPIArray*>(source));
  if (array == nullptr) {
    return {Value::null(type), CMPI_RC_OK, {}};
  }
  if ((array->elementType | CMPI_ARRAY) != type) {
    return {Value::null(type), CMPI_RC_ERR_TYPE_MISMATCH,
            "the array holds elements of type " + typeName(array->elementType) + ", not " + typeName(type)};
  }
  return {Value::array(array->elementType, array->elements), CMPI_RC_OK, {}};
}

void toObject(Arena& arena, CMPIValue& target, const Value& value) {
  switch (value.type()) {
    case CMPI_string:
      target.string = arena.make<StringObject>(value.asString())->record();
      break;
    case CMPI_ref:
      target.ref = arena.make<ObjectPathObject>(value.asReference())->record();
      break;
    case CMPI_instance:
      target.inst = arena.make<InstanceObject>(value.asInstance())->record();
      break;
    case CMPI_dateTime:
      target.dateTime = arena.make<DateTimeObject>(DateTime::parse(value.asString()).value_or(DateTime{}))->record();
      break;
    default:
      break;
  }
}

}  // namespace

CMPIType normalizedType(CMPIType type) {
  const auto arrayFlag = static_cast<CMPIType>(type & CMPI_ARRAY);
  return (type & ~CMPI_ARRAY) == CMPI_chars ? static_cast<CMPIType>(CMPI_string | arrayFlag) : type;
}

bool isValueType(CMPIType type) {
  const auto element = static_cast<CMPIType>(normalizedType(type) & ~CMPI_ARRAY);
  return findScalar(element) != nullptr || element == CMPI_string || element == CMPI_ref || element == CMPI_instance ||
         element == CMPI_dateTime;
}

ConvertedValue fromCmpi(const CMPIValue* value, CMPIType type) {
  const CMPIType normalized = normalizedType(type);
  if (!isValueType(type)) {
    return {Value::null(type), CMPI_RC_ERR_INVALID_DATA_TYPE, "type code " + typeName(type) + " is no type of a value"};
  }
  if (value == nullptr) {
    return {Value::null(normalized), CMPI_RC_OK, {}};
  }
  if (type == CMPI_chars) {
    // The one type that is passed as it is and not by its address.
    return {Value::string(reinterpret_cast<const char*>(value)), CMPI_RC_OK, {}};
  }
  if ((normalized & CMPI_ARRAY) != 0) {
    return fromArray(value, normalized);
  }
  if (const ScalarConversion* scalar = findScalar(normalized)) {
    return {scalar->from(value), CMPI_RC_OK, {}};
  }
  return {fromObject(value, normalized), CMPI_RC_OK, {}};
}

CMPIData toCmpi(Arena& arena, const Value& value) {
  CMPIData data{};
  data.type = value.type();
  if (value.isNull()) {
    data.state = CMPI_nullValue;
    return data;
  }
  if (value.isArray()) {
    const auto elementType = static_cast<CMPIType>(value.type() & ~CMPI_ARRAY);
    data.value.array = arena.make<ArrayObject>(elementType, value.elements())->record();
  } else if (const ScalarConversion* scalar = findScalar(value.type())) {
    scalar->to(data.value, value);
  } else {
    toObject(arena, data.value, value);
  }
  return data;
}

}  // namespace Corvcim
