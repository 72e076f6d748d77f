// Provider libraries loaded with dlopen, and the MIs their entry points gave.
#pragma once

#include <cmpift.h>

#include <map>
#include <mutex>
#include <string>
#include <vector>

namespace tvr::broker::detail {

class ProviderLibraries {
public:
  ProviderLibraries(std::vector<std::string> directories, std::map<std::string, std::string> files);
  ~ProviderLibraries();
  ProviderLibraries(const ProviderLibraries&) = delete;
  ProviderLibraries& operator=(const ProviderLibraries&) = delete;

  /// A symbol of the library registered under `location` (loaded on first use).
  void* symbol(const std::string& location, const std::string& name, std::string* error);

  /// The provider's MI, made by its entry point on first use with `broker`.
  CMPIInstanceMI* instanceMI(const std::string& location, const std::string& provider,
                             const CMPIBroker* broker, const CMPIContext* ctx, std::string* error);
  CMPIAssociationMI* associationMI(const std::string& location, const std::string& provider,
                                   const CMPIBroker* broker, const CMPIContext* ctx, std::string* error);

  /// Calls the provider's entry points again with `broker` (which may be
  /// null), as an object manager that re-creates a provider does.
  void recreate(const std::string& location, const std::string& provider, const CMPIBroker* broker,
                const CMPIContext* ctx);

  /// Calls the cleanup function of every MI made so far, once.
  void cleanupAll(const CMPIContext* ctx);

private:
  struct Provider {
    CMPIInstanceMI* instance = nullptr;
    CMPIAssociationMI* association = nullptr;
  };
  void* openLocked(const std::string& location, std::string* error);
  std::string fileFor(const std::string& location) const;

  std::vector<std::string> directories_;
  std::map<std::string, std::string> files_;
  // Recursive: an entry point may make an up-call, which may need another
  // provider's MI, while its own is being made.
  std::recursive_mutex mutex_;
  std::map<std::string, void*> handles_;
  std::map<std::string, Provider> providers_;
};

} // namespace tvr::broker::detail
