/* The headers serve providers in C as well: this file only has to compile. */

#include <cmpimacs.h>

CMPIStatus refuse(const CMPIBroker* broker);
CMPICount count(const CMPIObjectPath* path);

CMPIStatus refuse(const CMPIBroker* broker) {
  CMReturnWithChars(broker, CMPI_RC_ERR_NOT_SUPPORTED, "not supported");
}

CMPICount count(const CMPIObjectPath* path) {
  CMPIStatus status = {CMPI_RC_OK, NULL};
  return CMGetKeyCount(path, &status);
}
