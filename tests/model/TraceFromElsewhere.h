#ifndef TESTS_MODEL_TRACEFROMELSEWHERE_H
#define TESTS_MODEL_TRACEFROMELSEWHERE_H

/// The trace helpers, called in another source file.
char* traceFromElsewhere(const char* text);
char* traceparaFromElsewhere(const char* text);
char* traceTextFromElsewhere(const char* value);
char* traceNumberFromElsewhere(unsigned int value);

#endif
