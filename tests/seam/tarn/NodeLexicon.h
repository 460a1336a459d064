#ifndef TESTS_SEAM_NODELEXICON_H
#define TESTS_SEAM_NODELEXICON_H

// Numbers only, so there is nothing to script. By a relative path: the product must build without this
// repository's root among its include directories.
#include "../../../platform/include/tarn/NodeLexicon.h"

#endif
