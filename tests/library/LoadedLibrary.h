#ifndef TESTS_LIBRARY_LOADEDLIBRARY_H
#define TESTS_LIBRARY_LOADEDLIBRARY_H

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "host/broker/Broker.h"
#include "host/broker/ProviderLibrary.h"

/// The finished shared object as a broker has it: from loading to unloading.
namespace Library {

/// The file that brokers load, by its unversioned name.
extern const std::string file;

/// Sets variables for its lifetime; an absent value unsets.
class Environment {
 public:
  using Variables = std::map<std::string, std::optional<std::string>>;
  explicit Environment(const Variables& variables);
  ~Environment();
  Environment(const Environment&) = delete;
  Environment& operator=(const Environment&) = delete;

 private:
  void set(const std::string& name, const std::optional<std::string>& value);

  Variables before_;
};

/// What the library reads its inventory from; it logs nowhere and reads no configuration of the machine.
Environment::Variables quietly(const std::string& inventory);

/// The machines of tests/fixtures, with the generated ones.
inline const std::string fixtures = CORVANE_BINARY_DIR "/tests/fixtures/";

/// "json:" and the tree of one of these machines.
std::string fixture(const std::string& machine);

/// The library, loaded, with a broker that knows one computer system.
class LoadedLibrary {
 public:
  explicit LoadedLibrary(Corvcim::LoadScope scope = Corvcim::LoadScope::Global);

  /// What a broker does before the first request: calls every factory function.
  void createInterfaces();

  Corvcim::Response enumerateInstances(const std::string& className);
  Corvcim::Response enumerateInstanceNames(const std::string& className);
  Corvcim::Response getInstance(const Corvcim::ObjectPath& path);
  /// Any association operation, asked of one association class's provider.
  Corvcim::Response associate(const std::string& associationClass, Corvcim::OperationKind kind,
                              const Corvcim::ObjectPath& source);

  /// Asks everything of everything once; the number of results.
  std::size_t askEverything();

  Corvcim::Broker& broker() { return broker_; }
  const Corvcim::ProviderLibrary& library() const { return library_; }

 private:
  CMPIInstanceMI* instanceMI(const std::string& className);

  Corvcim::Broker broker_;  // outlives the library, which holds its handle
  Corvcim::ProviderLibrary library_;
};

/// The classes that the library serves; those of associations.
std::vector<std::string> servedClasses();
std::vector<std::string> associationClasses();

/// How many mappings of this process are of the library.
std::size_t mappings();

}  // namespace Library

#endif
