#ifndef TESTS_MODEL_MODELEVENTS_H
#define TESTS_MODEL_MODELEVENTS_H

#include "tests/seam/Events.h"

/// How the records and collections report.
inline const Scripted::EventSource model{"Corvane.CPUProvider", "CPU.cpp"};

enum ModelLevel : int { detail = 3000, remark = 5000, error = 6000 };

#endif
