#include "host/corvcim/hwloc/HwlocLibrary.h"

#include <dlfcn.h>

#include <type_traits>

namespace Corvcim {
namespace {

// Of all versions 2, whose types the headers declare.
constexpr const char* fileName = "libhwloc.so.15";
static_assert(HWLOC_API_VERSION >> 16 == 2);

std::string lastError() {
  const char* error = dlerror();
  return error == nullptr ? "not found" : error;
}

}  // namespace

HwlocLibrary::HwlocLibrary() {
  void* const library = dlopen(fileName, RTLD_NOW | RTLD_LOCAL);
  if (library == nullptr) {
    problem = lastError();
    return;
  }
  const auto resolve = [&](const char* name, auto& function) {
    function = reinterpret_cast<std::remove_reference_t<decltype(function)>>(dlsym(library, name));
    if (function == nullptr && problem.empty()) {
      problem = lastError();
    }
  };
  resolve("hwloc_topology_init", topologyInit);
  resolve("hwloc_topology_destroy", topologyDestroy);
  resolve("hwloc_topology_set_all_types_filter", topologySetAllTypesFilter);
  resolve("hwloc_topology_set_io_types_filter", topologySetIoTypesFilter);
  resolve("hwloc_topology_set_flags", topologySetFlags);
  resolve("hwloc_topology_set_xmlbuffer", topologySetXmlbuffer);
  resolve("hwloc_topology_set_synthetic", topologySetSynthetic);
  resolve("hwloc_topology_load", topologyLoad);
  resolve("hwloc_topology_get_depth", topologyGetDepth);
  resolve("hwloc_get_nbobjs_by_depth", getNbobjsByDepth);
  resolve("hwloc_get_obj_by_depth", getObjByDepth);
  resolve("hwloc_obj_type_is_cache", objTypeIsCache);
  resolve("hwloc_cpukinds_get_nr", cpukindsGetNr);
  resolve("hwloc_cpukinds_get_info", cpukindsGetInfo);
  resolve("hwloc_bitmap_alloc", bitmapAlloc);
  resolve("hwloc_bitmap_free", bitmapFree);
  resolve("hwloc_bitmap_iszero", bitmapIszero);
  resolve("hwloc_bitmap_first", bitmapFirst);
  resolve("hwloc_bitmap_next", bitmapNext);
  resolve("hwloc_bitmap_last", bitmapLast);
}

const HwlocLibrary& hwloc() {
  static const HwlocLibrary library;
  return library;
}

}  // namespace Corvcim
