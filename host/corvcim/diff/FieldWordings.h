#ifndef HOST_CORVCIM_DIFF_FIELDWORDINGS_H
#define HOST_CORVCIM_DIFF_FIELDWORDINGS_H

#include <tarn/NodeLexicon.h>

#include "host/corvcim/diff/InventoryDiff.h"
#include "host/corvcim/diff/Sentences.h"

namespace Corvcim {

/// What became of a field, in words: "the maximum clock is 3.6 GHz now, was 3.5 GHz". A field without
/// words of its own is shown by its name.
Predicate describeFieldChange(const FieldChange& change);

/// What became of a part of that type whose status differs: "went offline". Both values are there.
Predicate describeStatusChange(const FieldChange& change, Tarn::NodeLexicon::NodeType type);

}  // namespace Corvcim

#endif
