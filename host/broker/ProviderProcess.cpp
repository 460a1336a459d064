#include "host/broker/ProviderProcess.h"

#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <exception>
#include <map>
#include <optional>
#include <stdexcept>
#include <system_error>
#include <utility>

#include "host/broker/Broker.h"
#include "host/broker/ProviderLibrary.h"
#include "host/broker/Request.h"

namespace Corvcim {
namespace {

// The child's side: a broker, the library, and the management interfaces made so far.
class ProviderHost {
 public:
  ProviderHost(Channel channel, std::string libraryFile)
      : channel_(std::move(channel)), libraryFile_(std::move(libraryFile)) {
    broker_.serveOthers([this](const Operation& operation) { return upcall(operation); });
  }

  void run() {
    channel_.serve([this](const WireRequest& request) { return perform(request); });
    cleanUp();
  }

 private:
  Response perform(const WireRequest& request) {
    try {
      return performUnguarded(request);
    } catch (const ProviderError& error) {
      return failure(CMPI_RC_ERR_FAILED, error.what());
    } catch (const std::exception& error) {
      return failure(CMPI_RC_ERR_FAILED,
                     "the provider of " + request.className + " threw an exception: " + error.what());
    } catch (...) {
      return failure(CMPI_RC_ERR_FAILED,
                     "the provider of " + request.className + " threw something that is no exception");
    }
  }

  Response performUnguarded(const WireRequest& request) {
    const ClassDefinition* definition = findClass(request.className);
    if (definition == nullptr) {
      throw std::logic_error("there is no such class");
    }
    if (!library_) {
      library_.emplace(libraryFile_);
    }
    if (isAssociationOperation(request.operation.kind)) {
      CMPIAssociationMI*& mi = associationMIs_[definition];
      mi = mi != nullptr ? mi : library_->associationMI(broker_, definition->provider);
      return broker_.perform(mi, request.operation);
    }
    CMPIInstanceMI*& mi = instanceMIs_[definition];
    mi = mi != nullptr ? mi : library_->instanceMI(broker_, definition->provider);
    return broker_.perform(mi, request.operation);
  }

  UpcallReply upcall(const Operation& operation) {
    auto response = channel_.ask({{}, operation}, [this](const WireRequest& request) { return perform(request); });
    if (!response) {
      std::_Exit(EXIT_FAILURE);  // the host is gone, and with it everybody who wants an answer
    }
    return {std::move(*response), false};
  }

  void cleanUp() {
    constexpr CMPIBoolean terminating = 1;
    const Request request(broker_);
    for (const auto& [definition, mi] : instanceMIs_) {
      if (mi != nullptr) {
        mi->ft->cleanup(mi, request.context(), terminating);
      }
    }
    for (const auto& [definition, mi] : associationMIs_) {
      if (mi != nullptr) {
        mi->ft->cleanup(mi, request.context(), terminating);
      }
    }
  }

  Channel channel_;
  std::string libraryFile_;
  Broker broker_;
  std::optional<ProviderLibrary> library_;
  std::map<const ClassDefinition*, CMPIInstanceMI*> instanceMIs_;
  std::map<const ClassDefinition*, CMPIAssociationMI*> associationMIs_;
};

// Ends without the parent's exit handlers and without its unwritten output.
[[noreturn]] void runChild(Channel channel, const std::string& libraryFile) {
  int result = EXIT_SUCCESS;
  try {
    ProviderHost(std::move(channel), libraryFile).run();
  } catch (...) {
    result = EXIT_FAILURE;
  }
  std::_Exit(result);
}

std::string endText(int status) {
  if (WIFSIGNALED(status)) {
    return "was ended by signal " + std::to_string(WTERMSIG(status)) + " (" + strsignal(WTERMSIG(status)) + ")";
  }
  return "exited with status " + std::to_string(WEXITSTATUS(status));
}

}  // namespace

ProviderProcess::ProviderProcess(std::string group, std::string libraryFile, UpcallHandler upcalls)
    : group_(std::move(group)), libraryFile_(std::move(libraryFile)), upcalls_(std::move(upcalls)) {}

ProviderProcess::~ProviderProcess() {
  if (channel_ != nullptr) {
    end();
  }
}

Response ProviderProcess::perform(const ClassDefinition& definition, const Operation& operation) {
  try {
    if (channel_ == nullptr) {
      start();
    }
    return performInChild(definition, operation);
  } catch (const std::exception& error) {
    return failure(CMPI_RC_ERR_FAILED, error.what());
  }
}

Response ProviderProcess::performInChild(const ClassDefinition& definition, const Operation& operation) {
  // An operation nested in this one may see the child die and start another: this one stays with its own.
  const std::shared_ptr<Channel> channel = channel_;
  auto response = channel->ask({std::string(definition.name), operation},
                               [this](const WireRequest& request) { return serveUpcall(request.operation); });
  if (response) {
    return std::move(*response);
  }
  const std::string ending = channel == channel_ ? end() : "has ended";
  return failure(CMPI_RC_ERR_FAILED, "the provider process of group " + group_ + " (" + libraryFile_ + ") " + ending +
                                         " during " + std::string(operationName(operation.kind)) + " of " +
                                         std::string(definition.name) + "; the next request starts it anew");
}

// The child waits for an answer, whatever happens here.
Response ProviderProcess::serveUpcall(const Operation& operation) const {
  try {
    return upcalls_(operation);
  } catch (const std::exception& error) {
    return failure(CMPI_RC_ERR_FAILED, error.what());
  }
}

void ProviderProcess::start() {
  auto [hostEnd, childEnd] = Channel::makePair();
  const pid_t child = fork();
  if (child < 0) {
    throw std::system_error(errno, std::generic_category(), "cannot start a provider process");
  }
  if (child == 0) {
    hostEnd = Channel(-1);
    runChild(std::move(childEnd), libraryFile_);
  }
  child_ = child;
  channel_ = std::make_shared<Channel>(std::move(hostEnd));
}

std::string ProviderProcess::end() {
  // Children started later hold copies of the descriptor, so closing it would not reach this one.
  channel_->shutDown();
  channel_.reset();
  int status = 0;
  while (waitpid(child_, &status, 0) < 0 && errno == EINTR) {
  }
  return endText(status);
}

}  // namespace Corvcim
