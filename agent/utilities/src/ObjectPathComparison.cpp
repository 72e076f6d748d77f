//===- ObjectPathComparison.cpp - Do two object paths name one object? ----===//

#include "HX/ProviderUtilities.h"

#include "CmpiAccess.h"

#include <cstdint>

namespace HX {
namespace {

using detail::equalIgnoringCase;

/// Reference keys nest; a path that (through a broken object manager or a
/// hostile client) refers to itself must not recurse without end.
constexpr int MaxReferenceDepth = 16;

bool pathsEqual(const CMPIObjectPath *a, const CMPIObjectPath *b,
                bool ignoreHostAndNamespace, int depth);

/// A numeric key value in a form that compares across widths and signs.
struct Number {
  enum class Kind { Unsigned, Signed, Real } kind;
  std::uint64_t unsignedValue = 0;
  std::int64_t signedValue = 0;
  long double realValue = 0;

  long double asReal() const {
    switch (kind) {
    case Kind::Unsigned:
      return static_cast<long double>(unsignedValue);
    case Kind::Signed:
      return static_cast<long double>(signedValue);
    case Kind::Real:
      break;
    }
    return realValue;
  }
};

std::optional<Number> numberOf(const CMPIData &data) {
  const CMPIValue &v = data.value;
  switch (data.type) {
  case CMPI_uint8:
    return Number{Number::Kind::Unsigned, v.uint8, 0, 0};
  case CMPI_uint16:
    return Number{Number::Kind::Unsigned, v.uint16, 0, 0};
  case CMPI_uint32:
    return Number{Number::Kind::Unsigned, v.uint32, 0, 0};
  case CMPI_uint64:
    return Number{Number::Kind::Unsigned, v.uint64, 0, 0};
  case CMPI_char16:
    return Number{Number::Kind::Unsigned, v.char16, 0, 0};
  case CMPI_sint8:
    return Number{Number::Kind::Signed, 0, v.sint8, 0};
  case CMPI_sint16:
    return Number{Number::Kind::Signed, 0, v.sint16, 0};
  case CMPI_sint32:
    return Number{Number::Kind::Signed, 0, v.sint32, 0};
  case CMPI_sint64:
    return Number{Number::Kind::Signed, 0, v.sint64, 0};
  case CMPI_real32:
    return Number{Number::Kind::Real, 0, 0, v.real32};
  case CMPI_real64:
    return Number{Number::Kind::Real, 0, 0, v.real64};
  default:
    return std::nullopt;
  }
}

bool numbersEqual(const Number &a, const Number &b) {
  using Kind = Number::Kind;
  if (a.kind == Kind::Real || b.kind == Kind::Real)
    return a.asReal() == b.asReal();
  auto magnitude = [](const Number &n, std::uint64_t &out) {
    if (n.kind == Kind::Unsigned) {
      out = n.unsignedValue;
      return true;
    }
    if (n.signedValue < 0)
      return false;
    out = static_cast<std::uint64_t>(n.signedValue);
    return true;
  };
  std::uint64_t ua = 0, ub = 0;
  const bool aNonNegative = magnitude(a, ua);
  const bool bNonNegative = magnitude(b, ub);
  if (!aNonNegative || !bNonNegative)
    return !aNonNegative && !bNonNegative && a.signedValue == b.signedValue;
  return ua == ub;
}

std::optional<CMPIUint64> dateTimeOf(const CMPIData &data) {
  const CMPIDateTime *time = data.value.dateTime;
  if (!time || !time->ft || !time->ft->getBinaryFormat)
    return std::nullopt;
  CMPIStatus status{CMPI_RC_OK, nullptr};
  CMPIUint64 binary = time->ft->getBinaryFormat(time, &status);
  if (status.rc != CMPI_RC_OK)
    return std::nullopt;
  return binary;
}

bool keyValuesEqual(const CMPIData &a, const CMPIData &b,
                    bool ignoreHostAndNamespace, int depth) {
  const bool aNull = !detail::holdsValue(a);
  const bool bNull = !detail::holdsValue(b);
  if (aNull || bNull)
    return aNull && bNull;

  std::optional<std::string> aText = detail::stringValueOf(a);
  std::optional<std::string> bText = detail::stringValueOf(b);
  if (aText || bText)
    return aText && bText && *aText == *bText;

  std::optional<Number> aNumber = numberOf(a);
  std::optional<Number> bNumber = numberOf(b);
  if (aNumber || bNumber)
    return aNumber && bNumber && numbersEqual(*aNumber, *bNumber);

  if (a.type != b.type)
    return false;
  switch (a.type) {
  case CMPI_boolean:
    return (a.value.boolean != 0) == (b.value.boolean != 0);
  case CMPI_ref:
    return pathsEqual(a.value.ref, b.value.ref, ignoreHostAndNamespace,
                      depth + 1);
  case CMPI_dateTime: {
    std::optional<CMPIUint64> aTime = dateTimeOf(a);
    std::optional<CMPIUint64> bTime = dateTimeOf(b);
    return aTime && bTime && *aTime == *bTime;
  }
  default:
    return false;
  }
}

/// The key of \p path named \p name without regard to case.
std::optional<CMPIData> keyIgnoringCase(const CMPIObjectPath *path,
                                        const std::string &name,
                                        CMPICount count) {
  if (std::optional<CMPIData> exact = detail::keyOf(path, name.c_str()))
    return exact;
  for (CMPICount index = 0; index < count; ++index) {
    std::optional<detail::NamedData> key = detail::keyAt(path, index);
    if (key && equalIgnoringCase(key->name, name))
      return key->data;
  }
  return std::nullopt;
}

bool textsEqualIgnoringCase(const std::optional<std::string> &a,
                            const std::optional<std::string> &b) {
  return a && b && equalIgnoringCase(*a, *b);
}

bool pathsEqual(const CMPIObjectPath *a, const CMPIObjectPath *b,
                bool ignoreHostAndNamespace, int depth) {
  if (!a || !b)
    return !a && !b;
  if (depth > MaxReferenceDepth)
    return false;

  if (!textsEqualIgnoringCase(detail::classNameOf(a), detail::classNameOf(b)))
    return false;
  if (!ignoreHostAndNamespace &&
      (!textsEqualIgnoringCase(detail::nameSpaceOf(a), detail::nameSpaceOf(b)) ||
       !textsEqualIgnoringCase(detail::hostNameOf(a), detail::hostNameOf(b))))
    return false;

  std::optional<CMPICount> count = detail::keyCountOf(a);
  if (!count || detail::keyCountOf(b) != count)
    return false;
  for (CMPICount index = 0; index < *count; ++index) {
    std::optional<detail::NamedData> key = detail::keyAt(a, index);
    if (!key)
      return false;
    std::optional<CMPIData> other = keyIgnoringCase(b, key->name, *count);
    if (!other ||
        !keyValuesEqual(key->data, *other, ignoreHostAndNamespace, depth))
      return false;
  }
  return true;
}

} // namespace

bool isObjPathsEqual(const CMPIObjectPath *a, const CMPIObjectPath *b,
                     bool ignoreHostAndNamespace) {
  return pathsEqual(a, b, ignoreHostAndNamespace, 0);
}

} // namespace HX
