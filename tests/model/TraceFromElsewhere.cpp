#include "tests/model/TraceFromElsewhere.h"

#include <Trace.h>

char* traceFromElsewhere(const char* text) {
  return Tarn::trace(text, "Else.cpp", 1, Tarn::ENTERING);
}

char* traceparaFromElsewhere(const char* text) {
  return Tarn::tracepara(text, "Else.cpp", 1, " a=1", Tarn::ENTERING);
}

char* traceTextFromElsewhere(const char* value) {
  return Tarn::trace("name", "Else.cpp", 1, value);
}

char* traceNumberFromElsewhere(unsigned int value) {
  return Tarn::trace("name", "Else.cpp", 1, value);
}
