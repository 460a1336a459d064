#ifndef TARN_MODELEVENTS_H
#define TARN_MODELEVENTS_H

#include <Trace.h>

#include <string>

namespace Tarn::CPUProvider {

static const std::string loggerCPUProvider = "Corvane.CPUProvider";

/// The model reports as one source, whichever of its files speaks.
static constexpr EventLog modelEvents{loggerCPUProvider, "CPU.cpp", LevelDetail};

}  // namespace Tarn::CPUProvider

#endif
