#ifndef TESTS_SEAM_NODELEXICON_H
#define TESTS_SEAM_NODELEXICON_H

// Numbers only, so there is nothing to script.
#include "platform/include/tarn/NodeLexicon.h"

#endif
