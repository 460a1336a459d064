#ifndef CORVCIM_PROVIDER_PROCESS_H
#define CORVCIM_PROVIDER_PROCESS_H

#include <sys/types.h>

#include <functional>
#include <memory>
#include <string>

#include "host/broker/Channel.h"
#include "host/broker/Operation.h"
#include "schema/ClassTable.h"

namespace Corvcim {

/// A child process that has one provider library loaded and performs operations in it, one at a time.
/// It starts with the first operation and ends with this object; a child that died is started anew
/// with the next operation.
class ProviderProcess {
 public:
  using UpcallHandler = std::function<Response(const Operation&)>;

  ProviderProcess(std::string group, std::string libraryFile, UpcallHandler upcalls);
  ~ProviderProcess();
  ProviderProcess(const ProviderProcess&) = delete;
  ProviderProcess& operator=(const ProviderProcess&) = delete;

  /// The provider's response. A child that cannot be started or dies, a library that cannot be loaded
  /// and a provider that throws give CMPI_RC_ERR_FAILED with a message of one line.
  Response perform(const ClassDefinition& definition, const Operation& operation);

 private:
  Response performInChild(const ClassDefinition& definition, const Operation& operation);
  Response serveUpcall(const Operation& operation) const;
  void start();       ///< throws std::system_error
  std::string end();  ///< waits for the child and says how it ended

  std::string group_;
  std::string libraryFile_;
  UpcallHandler upcalls_;
  std::shared_ptr<Channel> channel_;  ///< to the child that runs; none: there is none
  pid_t child_ = -1;
};

}  // namespace Corvcim

#endif
