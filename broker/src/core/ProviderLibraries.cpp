#include "core/ProviderLibraries.h"

#include <dlfcn.h>
#include <unistd.h>

namespace tvr::broker::detail {

namespace {

using InstanceEntry = CMPIInstanceMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
using AssociationEntry = CMPIAssociationMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);

template <class Entry> Entry entryPoint(void* handle, const std::string& name) {
  return reinterpret_cast<Entry>(dlsym(handle, name.c_str()));
}

} // namespace

ProviderLibraries::ProviderLibraries(std::vector<std::string> directories,
                                     std::map<std::string, std::string> files)
    : directories_(std::move(directories)), files_(std::move(files)) {}

// Libraries stay loaded for the life of the process: providers keep static
// MIs, and unloading code that may still be referenced gains nothing.
ProviderLibraries::~ProviderLibraries() = default;

std::string ProviderLibraries::fileFor(const std::string& location) const {
  if (auto it = files_.find(location); it != files_.end()) return it->second;
  const std::string name = "lib" + location + ".so";
  for (const std::string& dir : directories_) {
    const std::string candidate = dir + "/" + name;
    if (access(candidate.c_str(), R_OK) == 0) return candidate;
  }
  return std::string();
}

void* ProviderLibraries::openLocked(const std::string& location, std::string* error) {
  if (auto it = handles_.find(location); it != handles_.end()) return it->second;
  const std::string file = fileFor(location);
  if (file.empty()) {
    if (error) {
      *error = "provider library lib" + location + ".so not found (searched:";
      for (const std::string& dir : directories_) *error += " " + dir;
      *error += ")";
    }
    return nullptr;
  }
  void* handle = dlopen(file.c_str(), RTLD_NOW | RTLD_LOCAL);
  if (!handle) {
    if (error) *error = "cannot load provider library " + file + ": " + dlerror();
    return nullptr;
  }
  handles_[location] = handle;
  return handle;
}

void* ProviderLibraries::symbol(const std::string& location, const std::string& name, std::string* error) {
  std::lock_guard<std::recursive_mutex> lock(mutex_);
  void* handle = openLocked(location, error);
  if (!handle) return nullptr;
  void* sym = dlsym(handle, name.c_str());
  if (!sym && error) *error = "symbol " + name + " not found in lib" + location + ".so";
  return sym;
}

CMPIInstanceMI* ProviderLibraries::instanceMI(const std::string& location, const std::string& provider,
                                              const CMPIBroker* broker, const CMPIContext* ctx,
                                              std::string* error) {
  std::lock_guard<std::recursive_mutex> lock(mutex_);
  Provider& p = providers_[provider];
  if (p.instance) return p.instance;
  void* handle = openLocked(location, error);
  if (!handle) return nullptr;
  auto create = entryPoint<InstanceEntry>(handle, provider + "_Create_InstanceMI");
  if (!create) {
    if (error) *error = "lib" + location + ".so has no entry point " + provider + "_Create_InstanceMI";
    return nullptr;
  }
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  try {
    p.instance = create(broker, ctx, &rc);
  } catch (...) {
    if (error) *error = provider + "_Create_InstanceMI threw an exception";
    return nullptr;
  }
  if (!p.instance && error) *error = provider + "_Create_InstanceMI returned no MI";
  return p.instance;
}

CMPIAssociationMI* ProviderLibraries::associationMI(const std::string& location, const std::string& provider,
                                                    const CMPIBroker* broker, const CMPIContext* ctx,
                                                    std::string* error) {
  std::lock_guard<std::recursive_mutex> lock(mutex_);
  Provider& p = providers_[provider];
  if (p.association) return p.association;
  void* handle = openLocked(location, error);
  if (!handle) return nullptr;
  auto create = entryPoint<AssociationEntry>(handle, provider + "_Create_AssociationMI");
  if (!create) {
    if (error) *error = "lib" + location + ".so has no entry point " + provider + "_Create_AssociationMI";
    return nullptr;
  }
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  try {
    p.association = create(broker, ctx, &rc);
  } catch (...) {
    if (error) *error = provider + "_Create_AssociationMI threw an exception";
    return nullptr;
  }
  if (!p.association && error) *error = provider + "_Create_AssociationMI returned no MI";
  return p.association;
}

void ProviderLibraries::recreate(const std::string& location, const std::string& provider,
                                 const CMPIBroker* broker, const CMPIContext* ctx) {
  std::lock_guard<std::recursive_mutex> lock(mutex_);
  void* handle = openLocked(location, nullptr);
  if (!handle) return;
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  try {
    if (auto create = entryPoint<InstanceEntry>(handle, provider + "_Create_InstanceMI")) create(broker, ctx, &rc);
    if (auto create = entryPoint<AssociationEntry>(handle, provider + "_Create_AssociationMI"))
      create(broker, ctx, &rc);
  } catch (...) {
    // The MIs made before stay in use; a provider that cannot be made
    // again keeps the broker it had.
  }
}

void ProviderLibraries::cleanupAll(const CMPIContext* ctx) {
  std::lock_guard<std::recursive_mutex> lock(mutex_);
  for (auto& [name, p] : providers_) {
    if (p.instance && p.instance->ft && p.instance->ft->cleanup) p.instance->ft->cleanup(p.instance, ctx, 1);
    if (p.association && p.association->ft && p.association->ft->cleanup)
      p.association->ft->cleanup(p.association, ctx, 1);
    p = Provider{};
  }
}

} // namespace tvr::broker::detail
