#include "tests/host/broker/ScriptedProvider.h"

namespace Corvcim {

const CMPIInstanceMIFT ScriptedProvider::instanceTable = {
    CMPI_VERSION,
    CMPI_VERSION,
    "instanceScripted",
    [](CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
      return CMPIStatus{CMPI_RC_OK, nullptr};
    },
    [](CMPIInstanceMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path) {
      return run(mi->hdl, "enumerateInstanceNames", {context, result, path, nullptr, {}});
    },
    [](CMPIInstanceMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path,
       const char** properties) {
      return run(mi->hdl, "enumerateInstances", {context, result, path, properties, {}});
    },
    [](CMPIInstanceMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path,
       const char** properties) {
      return run(mi->hdl, "getInstance", {context, result, path, properties, {}});
    },
    nullptr,
    nullptr,
    nullptr,
    nullptr,
};

const CMPIAssociationMIFT ScriptedProvider::associationTable = {
    CMPI_VERSION,
    CMPI_VERSION,
    "associationScripted",
    [](CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
      return CMPIStatus{CMPI_RC_OK, nullptr};
    },
    [](CMPIAssociationMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path,
       const char* assocClass, const char* resultClass, const char* role, const char* resultRole,
       const char** properties) {
      return run(mi->hdl, "associators",
                 {context, result, path, properties, {assocClass, resultClass, role, resultRole}});
    },
    [](CMPIAssociationMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path,
       const char* assocClass, const char* resultClass, const char* role, const char* resultRole) {
      return run(mi->hdl, "associatorNames",
                 {context, result, path, nullptr, {assocClass, resultClass, role, resultRole}});
    },
    [](CMPIAssociationMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path,
       const char* resultClass, const char* role, const char** properties) {
      return run(mi->hdl, "references", {context, result, path, properties, {resultClass, role}});
    },
    [](CMPIAssociationMI* mi, const CMPIContext* context, const CMPIResult* result, const CMPIObjectPath* path,
       const char* resultClass, const char* role) {
      return run(mi->hdl, "referenceNames", {context, result, path, nullptr, {resultClass, role}});
    },
};

}  // namespace Corvcim
