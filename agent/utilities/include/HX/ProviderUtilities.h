//===- HX/ProviderUtilities.h - Helpers the providers share ---------------===//
//
/// \file
/// Small CMPI helpers every provider needs: reading string keys and
/// properties, writing string-array properties, comparing object paths, and
/// cleaning text for use in keys. All of them tolerate null arguments and
/// function tables with missing entries: they report failure, never crash.
///
/// Also includes HX/SystemName.h (HX::getSystemName).
//
//===----------------------------------------------------------------------===//

#ifndef HX_PROVIDERUTILITIES_H
#define HX_PROVIDERUTILITIES_H

#include "HX/SystemName.h"

#include "cmpidt.h"
#include "cmpift.h"

#include <string>
#include <vector>

namespace HX {

class ProviderUtilities {
public:
  /// Reads the string key \p name of \p path.
  ///
  /// \returns true and sets \p value when the key exists, is not null and
  ///   holds a string (CMPI_string or CMPI_chars); otherwise false, leaving
  ///   \p value untouched. False when any argument is null.
  static bool getKeyProperty(const CMPIObjectPath *path, const char *name,
                             std::string &value);

  /// Reads the string property \p name of \p instance.
  ///
  /// \param caseInsensitive false: the property named exactly \p name (what
  ///   the providers use). true: the exact name is tried first; failing
  ///   that, the first property whose name equals \p name without regard to
  ///   ASCII case.
  /// \returns true and sets \p value when the property exists, is not null
  ///   and holds a string (CMPI_string or CMPI_chars); otherwise false,
  ///   leaving \p value untouched. False when any argument is null.
  static bool getProperty(const CMPIInstance *instance, const char *name,
                          std::string &value, bool caseInsensitive);

  /// Sets property \p name of \p instance to a string array (CMPI_stringA)
  /// holding \p values in order, made with CMNewArray(CMPI_string) and
  /// filled with CMPI_chars elements.
  ///
  /// \returns true on success; false when any argument is null, the broker
  ///   or the instance lacks a needed function, or any step fails.
  static bool setProperty(const CMPIBroker *broker, CMPIInstance *instance,
                          const char *name, std::vector<std::string> &values);
};

/// Returns \p text with every blank (space and tab) removed.
std::string stripSpaces(std::string text);

/// Tells whether two object paths name the same object.
///
/// Class names are compared without regard to ASCII case. Keys are matched
/// by name without regard to case, in any order, and both paths must have
/// the same number of keys. String keys (CMPI_string, CMPI_chars) compare
/// exactly; numeric keys (integers of any width and sign, reals, char16)
/// by value; boolean keys by truth; reference keys recursively by these
/// same rules; null keys equal only null keys. Keys of different kinds
/// (a string and a number) differ.
///
/// \param ignoreHostAndNamespace true: host names and namespaces are not
///   compared. false: they are compared too, without regard to case.
/// \returns true when both are null; false when only one is null or a
///   path cannot be read.
bool isObjPathsEqual(const CMPIObjectPath *a, const CMPIObjectPath *b,
                     bool ignoreHostAndNamespace);

} // namespace HX

#endif // HX_PROVIDERUTILITIES_H
