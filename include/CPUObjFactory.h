#ifndef TARN_CPUOBJFACTORY_H
#define TARN_CPUOBJFACTORY_H

#include <CPU.h>
#include <cmpidt.h>
#include <cmpift.h>
#include <cmpimacs.h>

#include <map>
#include <string>
#include <vector>

namespace Tarn::CPUProvider {

/// The one object through which the providers reach the inventory. It collects each kind of record
/// once, keeps it as long as the library is loaded, and turns records into CMPI objects.
///
/// Nothing is refreshed: clients see the machine as it was at the first request. Nothing is locked.
///
/// The CMPI objects that the operations make belong to the broker's request. `ref` gives the
/// namespace of what is made; its host name is this system's. Result vectors are appended to, and a
/// builder's NULL is appended like any other result. `properties` is the request's property list, or
/// NULL for all; with `isObjPath` an instance gets its keys only, enough to take its object path.
class CPUObjFactory {
 public:
  /// What the cache associations say of a cache.
  struct ProcCacheData {
    CMPIUint16 level;
    CMPIUint16 writePolicy;
    CMPIUint16 readPolicy;  ///< always 0: the inventory does not know it
    CMPIUint16 cacheType;
    CMPIUint16 associativity;
  };

  /// The factory, with the kinds that the flags ask for collected. A kind whose collection fails is
  /// tried again by every call that asks for it (twice by the call that constructs the factory).
  static CPUObjFactory* getFactoryInstance(bool isProc, bool isMem, bool isProcCore);

  /// For getFactoryInstance.
  CPUObjFactory(bool isProc, bool isMem, bool isProcCore);
  /// Copies share nothing: a copy starts empty, an assignment changes nothing.
  CPUObjFactory(const CPUObjFactory& other);
  CPUObjFactory& operator=(const CPUObjFactory& other);
  ~CPUObjFactory() = default;

  /// Index the collected records by identifier; of records that share one, the last wins. Counts are
  /// 16 bits wide: of more records only the remainder modulo 65536 is indexed.
  void createProcessorMap();
  void createCPUMemoryMap();
  void createProcessorCoreMap();

  /// Numbers of distinct identifiers.
  unsigned short getNumberOfProcInstances() const;
  unsigned short getNumberOfMemInstances() const;
  unsigned short getNumberOfProcCoreInstances() const;

  // Builders: one record to one instance. NULL, or the broker's instance without a handle, when the
  // broker could not make the object path or the instance. `rc` may be NULL.

  CMPIInstance* makeCPUProcInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Processor proc,
                                    const char** properties, bool isObjPath, CMPIStatus* rc);
  CMPIInstance* makeCPUProcCapInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Processor proc,
                                       const char** properties, bool isObjPath, CMPIStatus* rc);
  CMPIInstance* makeCPUProcCoreInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, ProcessorCore procCore,
                                        const char** properties, bool isObjPath, CMPIStatus* rc);
  CMPIInstance* makeCPUMemoryInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Memory cpuMem,
                                      const char** properties, bool isObjPath, CMPIStatus* rc);

  // All instances, in ascending order of their identifiers. 0, or 1 when there is no record (caches:
  // 0 all the same). Capabilities are made from processors.

  unsigned short getAllCPUProcCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                            const char** properties, bool isObjPath,
                                            std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getAllCPUProcCoreCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                const char** properties, bool isObjPath,
                                                std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getAllCPUMemoryCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                              const char** properties, bool isObjPath,
                                              std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getAllCPUProcCapCMPIInstances(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                               const char** properties, bool isObjPath,
                                               std::vector<CMPIInstance*>& instances, CMPIStatus* rc);

  // The instance of one identifier, compared exactly. 0, or 1 when there is none. Capabilities: every
  // processor with that instance id, and 0 also when there is none.

  unsigned short getOneCPUProcCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                           const char** properties, std::vector<CMPIInstance*>& instances,
                                           CMPIStatus* rc);
  unsigned short getOneCPUProcCoreCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                               const char** properties, std::vector<CMPIInstance*>& instances,
                                               CMPIStatus* rc);
  unsigned short getOneCPUMemoryCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                             const char** properties, std::vector<CMPIInstance*>& instances,
                                             CMPIStatus* rc);
  unsigned short getOneCPUProcCapCMPIInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                              const char** properties, std::vector<CMPIInstance*>& instances,
                                              CMPIStatus* rc);

  // All object paths, in the order of the instances. 0, 1 when there is no record, or 2 when the
  // broker could not make one: `status` then says so, and paths made before stay.

  unsigned short getAllCPUProcCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                           std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status);
  unsigned short getAllCPUProcCoreCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                               std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status);
  unsigned short getAllCPUMemoryCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                             std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status);
  unsigned short getAllCPUProcCapCMPIObjPaths(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                              std::vector<CMPIObjectPath*>& objPaths, CMPIStatus* status);

  // Navigation: from the key of one element to the elements related to it. A relationship query that
  // fails is logged and finds nothing; the result is 0 in every case.

  unsigned short getProcessorCoreRefByProcHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                                 const char** properties, bool isObjPath,
                                                 std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getCPUMemoryRefByProcessorCoreHandle(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                                      CMPIString* key, const char** properties, bool isObjPath,
                                                      std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getProcessorCoreRefByMemoryHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                                   const char** properties, bool isObjPath,
                                                   std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getCPUMemoryRefByProcessorHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                                  const char** properties, bool isObjPath,
                                                  std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getProcessorRefByMemoryHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                               const char** properties, bool isObjPath,
                                               std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
  unsigned short getProcessorRefByProcCoreHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                                 const char** properties, bool isObjPath,
                                                 std::vector<CMPIInstance*>& instances, CMPIStatus* rc);

  // Between a processor and its capabilities. 0, or 1 when a processor or its instance is missing.

  unsigned short getProcessorCapRefByProcHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                                const char** properties, std::vector<CMPIInstance*>& instances,
                                                CMPIStatus* rc);
  unsigned short getProcessorRefByProcCapHandle(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIString* key,
                                                const char** properties, std::vector<CMPIInstance*>& instances,
                                                CMPIStatus* rc);

  /// What the associations say of the cache with the given identifier (blanks at its ends do not
  /// count). 0, or 1 when there is none; `procCache` then stays as it is.
  unsigned short getAssocCacheData(const CMPIBroker* broker, CMPIString* cpuMemDeviceid, ProcCacheData& procCache,
                                   CMPIStatus* rc);

  /// The class at the far end of association `_RefLeftClass` seen from the class of `ref`, or "".
  /// Both names compare exactly; `_RefRightClass`, the wanted result class, plays no part.
  const char* get_assoc_targetClass_Name(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                         const char* _RefLeftClass, const char* _RefRightClass, CMPIStatus* rc);
  /// A path of that class without keys, or NULL.
  CMPIObjectPath* get_assoc_targetClass_ObjectPath(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                                   const char* _RefLeftClass, const char* _RefRightClass,
                                                   CMPIStatus* rc);

  std::vector<Processor> _processorList;
  std::vector<Memory> _cpuMemoryList;
  std::vector<ProcessorCore> _cpuProcCoreList;

  static std::map<std::string, Processor> _processorMap;        ///< by DeviceID
  static std::map<std::string, Memory> _cpuMemoryMap;           ///< by DeviceID
  static std::map<std::string, ProcessorCore> _cpuProcCoreMap;  ///< by InstanceID
  static bool _isProcPopulated;
  static bool _isMemPopulated;
  static bool _isProcCorePopulated;

 private:
  void collect(bool isProc, bool isMem, bool isProcCore);
};

/// The name by which the builders' property lists select the property that `name` names in any case of its
/// letters; `name` itself if no class has that property.
const char* selectionName(const char* name);

}  // namespace Tarn::CPUProvider

#endif
