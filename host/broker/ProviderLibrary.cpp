#include "host/broker/ProviderLibrary.h"

#include <dlfcn.h>

#include <utility>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"

namespace Corvcim {
namespace {

std::string loaderMessage() {
  const char* text = dlerror();
  return text != nullptr ? text : "the loader gives no reason";
}

// Without a slash the loader would search its own directories and never look where the user stands.
std::string pathOf(const std::string& file) {
  return file.find('/') == std::string::npos ? "./" + file : file;
}

}  // namespace

ProviderLibrary::ProviderLibrary(const std::string& file, LoadScope scope) : file_(file) {
  const int mode = RTLD_NOW | (scope == LoadScope::Global ? RTLD_GLOBAL : RTLD_LOCAL);
  handle_ = dlopen(pathOf(file).c_str(), mode);
  if (handle_ == nullptr) {
    throw ProviderError("cannot load provider library: " + loaderMessage());
  }
}

ProviderLibrary::~ProviderLibrary() {
  if (handle_ != nullptr && !staysLoaded_) {
    dlclose(handle_);
  }
}

ProviderLibrary::ProviderLibrary(ProviderLibrary&& other) noexcept
    : file_(std::move(other.file_)), handle_(std::exchange(other.handle_, nullptr)), staysLoaded_(other.staysLoaded_) {}

ProviderLibrary& ProviderLibrary::operator=(ProviderLibrary&& other) noexcept {
  std::swap(file_, other.file_);
  std::swap(handle_, other.handle_);
  std::swap(staysLoaded_, other.staysLoaded_);
  return *this;
}

void* ProviderLibrary::find(const std::string& symbol) const {
  return dlsym(handle_, symbol.c_str());
}

template <class MI>
MI* ProviderLibrary::create(Broker& broker, std::string_view provider, std::string_view suffix) const {
  using Factory = MI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
  const std::string symbol = std::string(provider) + std::string(suffix);
  const auto factory = reinterpret_cast<Factory>(find(symbol));
  if (factory == nullptr) {
    throw ProviderError("provider library " + file_ + " exports no " + symbol + ": it does not serve this class");
  }
  const Request request(broker);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  MI* mi = factory(broker.handle(), request.context(), &status);
  if (mi == nullptr || status.rc != CMPI_RC_OK) {
    throw ProviderError(symbol + " of provider library " + file_ + " failed with " + statusName(status.rc) + " " +
                        textOf(status.msg));
  }
  return mi;
}

CMPIInstanceMI* ProviderLibrary::instanceMI(Broker& broker, std::string_view provider) const {
  return create<CMPIInstanceMI>(broker, provider, "_Create_InstanceMI");
}

CMPIAssociationMI* ProviderLibrary::associationMI(Broker& broker, std::string_view provider) const {
  return create<CMPIAssociationMI>(broker, provider, "_Create_AssociationMI");
}

}  // namespace Corvcim
