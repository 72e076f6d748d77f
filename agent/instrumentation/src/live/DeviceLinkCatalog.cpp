//===- DeviceLinkCatalog.cpp - The PCI function below which a device sits -===//

#include "live/DeviceLinkCatalog.h"

#include "live/PciAddress.h"

#include <algorithm>
#include <cerrno>

namespace HX {
namespace detail {
namespace live {

DeviceLinkCatalog::DeviceLinkCatalog(std::string directory)
    : Directory(std::move(directory)) {}

std::map<std::string, std::vector<DirectoryEntry>>
DeviceLinkCatalog::entriesByFunction(ProblemLog &log) {
  DirectoryListing listing = listDirectory(Directory);
  if (!listing.ok()) {
    if (!isGone(listing.error))
      log.report(Directory + ": cannot list: " + errorText(listing.error));
    return {};
  }

  std::vector<std::optional<Known>> known(listing.entries.size());
  {
    std::lock_guard<std::mutex> guard(Lock);
    std::unordered_map<std::string, Known> kept;
    for (std::size_t i = 0; i < listing.entries.size(); ++i) {
      const DirectoryEntry &entry = listing.entries[i];
      auto found = Cache.find(entry.name);
      if (found != Cache.end() && found->second.inode == entry.inode) {
        known[i] = found->second;
        kept.insert(*found);
      }
    }
    // Entries that are gone or were replaced are forgotten.
    Cache.swap(kept);
  }

  std::map<std::string, std::vector<DirectoryEntry>> byFunction;
  std::vector<std::pair<std::string, Known>> learnt;
  for (std::size_t i = 0; i < listing.entries.size(); ++i) {
    const DirectoryEntry &entry = listing.entries[i];
    if (!known[i]) {
      const std::string path = Directory + "/" + entry.name;
      LinkText link = readLinkText(path);
      if (!link.ok()) {
        // Not a link: a copied tree that lost its links, or a stray file;
        // nothing says where the device sits.
        if (link.error != EINVAL)
          log.report(path + ": cannot read the link: " + errorText(link.error));
        continue;
      }
      known[i] = Known{entry.inode, owningPciFunction(link.target)};
      learnt.emplace_back(entry.name, *known[i]);
    }
    if (known[i]->function)
      byFunction[*known[i]->function].push_back(entry);
  }
  for (auto &[function, entries] : byFunction)
    std::sort(entries.begin(), entries.end(),
              [](const DirectoryEntry &a, const DirectoryEntry &b) {
                return a.name < b.name;
              });

  std::lock_guard<std::mutex> guard(Lock);
  for (auto &[name, entry] : learnt)
    Cache[name] = std::move(entry);
  return byFunction;
}

} // namespace live
} // namespace detail
} // namespace HX
