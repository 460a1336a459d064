#ifndef TARN_FACTORYEVENTS_H
#define TARN_FACTORYEVENTS_H

#include <Trace.h>

#include <string>

namespace Tarn::CPUProvider {

static const std::string loggerCPUObject = "Corvane.CPUProvider";

/// The factory reports as one source, whichever of its files speaks.
static constexpr EventLog factoryEvents{loggerCPUObject, "CPUObjFactory.cpp", LevelDetail};

}  // namespace Tarn::CPUProvider

#endif
