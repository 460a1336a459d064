#ifndef CORVCIM_PROVIDER_LIBRARY_H
#define CORVCIM_PROVIDER_LIBRARY_H

#include <cmpift.h>

#include <stdexcept>
#include <string>
#include <string_view>

namespace Corvcim {

class Broker;

/// One line: which file or factory function, and what the loader said.
class ProviderError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

enum class LoadScope : unsigned char {
  Global,  ///< RTLD_GLOBAL, as production brokers load: exported names interpose each other
  Local,
};

/// A provider library in memory, loaded RTLD_NOW. Unloading is the destructor's; no MI of the library
/// may be used afterwards. The factory calls may throw ProviderError.
class ProviderLibrary {
 public:
  explicit ProviderLibrary(const std::string& file, LoadScope scope = LoadScope::Global);
  ~ProviderLibrary();
  ProviderLibrary(const ProviderLibrary&) = delete;
  ProviderLibrary& operator=(const ProviderLibrary&) = delete;
  ProviderLibrary(ProviderLibrary&& other) noexcept;
  ProviderLibrary& operator=(ProviderLibrary&& other) noexcept;

  [[nodiscard]] const std::string& file() const { return file_; }

  /// What <provider>_Create_InstanceMI gives for this broker, called anew each time.
  [[nodiscard]] CMPIInstanceMI* instanceMI(Broker& broker, std::string_view provider) const;
  [[nodiscard]] CMPIAssociationMI* associationMI(Broker& broker, std::string_view provider) const;

  /// The library stays in memory when this object goes, until the process ends. A broker that it was
  /// given has to stay as well.
  void keepLoaded() { staysLoaded_ = true; }

  /// The address of an exported name; nullptr if there is none.
  [[nodiscard]] void* find(const std::string& symbol) const;

 private:
  template <class MI>
  MI* create(Broker& broker, std::string_view provider, std::string_view suffix) const;

  std::string file_;
  void* handle_ = nullptr;
  bool staysLoaded_ = false;
};

}  // namespace Corvcim

#endif
