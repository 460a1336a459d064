#ifndef HOST_CORVCIM_HWLOC_HWLOCLIBRARY_H
#define HOST_CORVCIM_HWLOC_HWLOCLIBRARY_H

#include <hwloc.h>
#include <hwloc/cpukinds.h>

#include <string>

namespace Corvcim {

/// What is called of hwloc. Only `inventory --from` needs it, so it is loaded when it is called first:
/// linked, it would cost every start of corvcim a tenth of its time.
///
/// hwloc's inline functions that call others cannot be used, as they would have to be linked.
struct HwlocLibrary {
  decltype(&hwloc_topology_init) topologyInit = nullptr;
  decltype(&hwloc_topology_destroy) topologyDestroy = nullptr;
  decltype(&hwloc_topology_set_all_types_filter) topologySetAllTypesFilter = nullptr;
  decltype(&hwloc_topology_set_io_types_filter) topologySetIoTypesFilter = nullptr;
  decltype(&hwloc_topology_set_flags) topologySetFlags = nullptr;
  decltype(&hwloc_topology_set_xmlbuffer) topologySetXmlbuffer = nullptr;
  decltype(&hwloc_topology_set_synthetic) topologySetSynthetic = nullptr;
  decltype(&hwloc_topology_load) topologyLoad = nullptr;
  decltype(&hwloc_topology_get_depth) topologyGetDepth = nullptr;
  decltype(&hwloc_get_nbobjs_by_depth) getNbobjsByDepth = nullptr;
  decltype(&hwloc_get_obj_by_depth) getObjByDepth = nullptr;
  decltype(&hwloc_obj_type_is_cache) objTypeIsCache = nullptr;
  decltype(&hwloc_cpukinds_get_nr) cpukindsGetNr = nullptr;
  decltype(&hwloc_cpukinds_get_info) cpukindsGetInfo = nullptr;
  decltype(&hwloc_bitmap_alloc) bitmapAlloc = nullptr;
  decltype(&hwloc_bitmap_free) bitmapFree = nullptr;
  decltype(&hwloc_bitmap_iszero) bitmapIszero = nullptr;
  decltype(&hwloc_bitmap_first) bitmapFirst = nullptr;
  decltype(&hwloc_bitmap_next) bitmapNext = nullptr;
  decltype(&hwloc_bitmap_last) bitmapLast = nullptr;

  std::string problem;  ///< why it cannot be called; empty where it can

  HwlocLibrary();
};

/// The library, which stays loaded.
const HwlocLibrary& hwloc();

}  // namespace Corvcim

#endif
