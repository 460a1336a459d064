#ifndef CORVANE_TESTS_CMPI_STANDARD_CMPIDT_H
#define CORVANE_TESTS_CMPI_STANDARD_CMPIDT_H

/* The standard's headers refuse a build that does not name its platform. */

#ifndef CMPI_PLATFORM_LINUX_GENERIC_GNU
#error "CMPI_PLATFORM_LINUX_GENERIC_GNU is not defined"
#endif

#include_next <cmpidt.h>

#endif
