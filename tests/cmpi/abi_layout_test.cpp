// Layout checks for the project's CMPI headers (cmpi/include).
//
// Providers built against these headers are loaded into object managers
// built against other copies of the same interface, so every size, offset,
// member type and constant value below is part of a binary contract. The
// checks are static_asserts: a header change that moves a slot, changes a
// parameter type (including const on a pointee) or renumbers a constant
// stops the build. The values were taken from the record layouts and
// constant values measured on the reference header set (x86_64, LP64).
//
// The tests at the end compare the layout as seen by the C compiler (see
// abi_layout_c.c) with the layout seen here, so C and C++ providers agree.

#include <cmpift.h>

#ifndef TVR_CMPI_CMPIFT_H
#error "the layout checks must see the project's own CMPI headers first"
#endif

#include "abi_layout_c.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string>
#include <type_traits>

namespace {

/// Compares a member's offset and its exact declared type (decltype of a
/// member access yields the declared type, including const on pointees and
/// on the member itself).
#define TVR_CHECK_MEMBER(Struct, member, offset, ...)                          \
  static_assert(offsetof(Struct, member) == (offset),                          \
                #Struct "." #member " is at offset " #offset);                 \
  static_assert(                                                               \
      std::is_same<decltype(((Struct *)0)->member), __VA_ARGS__>::value,       \
      #Struct "." #member " has type " #__VA_ARGS__)

/// A plain C enum as g++ lays it out: 4 bytes over unsigned int.
template <typename E> constexpr bool isUnsignedIntEnum() {
  return std::is_enum<E>::value &&
         std::is_same<typename std::underlying_type<E>::type,
                      unsigned int>::value;
}

constexpr bool sameText(const char *a, const char *b) {
  return *a == *b && (*a == '\0' || sameText(a + 1, b + 1));
}

#define TVR_STRINGIFY(x) #x
#define TVR_EXPANDED_TEXT(x) TVR_STRINGIFY(x)

// ---------------------------------------------------------------------------
// Version selection: a default build is a 2.0 build that also offers 1.0
// ---------------------------------------------------------------------------

#ifndef CMPI_VER_200
#error "CMPI_VER_200 must be defined in a default build"
#endif
#ifndef CMPI_VER_100
#error "CMPI_VER_100 must be defined in a 2.0 build"
#endif
#if defined(CMPI_VER_80) || defined(CMPI_VER_85) || defined(CMPI_VER_86) ||   \
    defined(CMPI_VER_87) || defined(CMPI_VER_90)
#error "the historical CMPI_VER_8x/9x symbols must stay undefined"
#endif
static_assert(CMPIVersion100 == 100, "CMPIVersion100");
static_assert(CMPIVersion200 == 200, "CMPIVersion200");
static_assert(CMPICurrentVersion == 200, "a default build is level 200");
static_assert(sizeof(TVR_EXPANDED_TEXT(CMPI_VER_200)) == 1,
              "the default CMPI_VER_200 is defined empty");

// ---------------------------------------------------------------------------
// Platform types of cmpios.h (Linux x86_64)
// ---------------------------------------------------------------------------

static_assert(std::is_same<CMPI_THREAD_RETURN, void *>::value, "thread return");
static_assert(std::is_same<CMPI_THREAD_TYPE, void *>::value, "thread type");
static_assert(std::is_same<CMPI_MUTEX_TYPE, void *>::value, "mutex type");
static_assert(std::is_same<CMPI_COND_TYPE, void *>::value, "condition type");
static_assert(std::is_same<CMPI_THREAD_KEY_TYPE, unsigned long>::value &&
                  sizeof(CMPI_THREAD_KEY_TYPE) == 8,
              "the thread key is an 8-byte unsigned long int");
static_assert(sizeof(TVR_EXPANDED_TEXT(CMPI_THREAD_CDECL)) == 1,
              "no calling-convention decoration on Linux");
static_assert(sameText(TVR_EXPANDED_TEXT(CMPI_EXPORT),
                       "__attribute__((visibility(\"default\")))"),
              "entry points are exported with default visibility");
static_assert(sameText(TVR_EXPANDED_TEXT(CMPI_EXTERN_C),
                       "extern \"C\" __attribute__((visibility(\"default\")))"),
              "entry points have C linkage in C++");

// ---------------------------------------------------------------------------
// Struct tags: C++ name mangling of provider functions uses them
// ---------------------------------------------------------------------------

static_assert(std::is_same<CMPIValuePtr, struct _CMPIValuePtr>::value, "tag");
static_assert(std::is_same<CMPIValue, union _CMPIValue>::value, "tag");
static_assert(std::is_same<CMPIData, struct _CMPIData>::value, "tag");
static_assert(std::is_same<CMPIStatus, struct _CMPIStatus>::value, "tag");
static_assert(std::is_same<CMPIrc, enum _CMPIrc>::value, "tag");
static_assert(std::is_same<CMPIBroker, struct _CMPIBroker>::value, "tag");
static_assert(std::is_same<CMPIContext, struct _CMPIContext>::value, "tag");
static_assert(std::is_same<CMPIResult, struct _CMPIResult>::value, "tag");
static_assert(std::is_same<CMPIInstance, struct _CMPIInstance>::value, "tag");
static_assert(std::is_same<CMPIObjectPath, struct _CMPIObjectPath>::value,
              "tag");
static_assert(std::is_same<CMPIString, struct _CMPIString>::value, "tag");
static_assert(std::is_same<CMPIArray, struct _CMPIArray>::value, "tag");
static_assert(std::is_same<CMPIEnumeration, struct _CMPIEnumeration>::value,
              "tag");
static_assert(std::is_same<CMPIArgs, struct _CMPIArgs>::value, "tag");
static_assert(std::is_same<CMPIDateTime, struct _CMPIDateTime>::value, "tag");
static_assert(std::is_same<CMPISelectExp, struct _CMPISelectExp>::value, "tag");
static_assert(std::is_same<CMPISelectCond, struct _CMPISelectCond>::value,
              "tag");
static_assert(std::is_same<CMPISubCond, struct _CMPISubCond>::value, "tag");
static_assert(std::is_same<CMPIPredicate, struct _CMPIPredicate>::value, "tag");
static_assert(std::is_same<CMPIError, struct _CMPIError>::value, "tag");
static_assert(std::is_same<CMPIBrokerFT, struct _CMPIBrokerFT>::value, "tag");
static_assert(std::is_same<CMPIBrokerEncFT, struct _CMPIBrokerEncFT>::value,
              "tag");
static_assert(std::is_same<CMPIBrokerExtFT, struct _CMPIBrokerExtFT>::value,
              "tag");
static_assert(std::is_same<CMPIBrokerMemFT, struct _CMPIBrokerMemFT>::value,
              "tag");
static_assert(std::is_same<CMPIContextFT, struct _CMPIContextFT>::value, "tag");
static_assert(std::is_same<CMPIResultFT, struct _CMPIResultFT>::value, "tag");
static_assert(std::is_same<CMPIErrorFT, struct _CMPIErrorFT>::value, "tag");
static_assert(std::is_same<CMPIInstanceFT, struct _CMPIInstanceFT>::value,
              "tag");
static_assert(std::is_same<CMPIObjectPathFT, struct _CMPIObjectPathFT>::value,
              "tag");
static_assert(std::is_same<CMPISelectExpFT, struct _CMPISelectExpFT>::value,
              "tag");
static_assert(std::is_same<CMPISelectCondFT, struct _CMPISelectCondFT>::value,
              "tag");
static_assert(std::is_same<CMPISubCondFT, struct _CMPISubCondFT>::value, "tag");
static_assert(std::is_same<CMPIPredicateFT, struct _CMPIPredicateFT>::value,
              "tag");
static_assert(std::is_same<CMPIArgsFT, struct _CMPIArgsFT>::value, "tag");
static_assert(std::is_same<CMPIStringFT, struct _CMPIStringFT>::value, "tag");
static_assert(std::is_same<CMPIArrayFT, struct _CMPIArrayFT>::value, "tag");
static_assert(std::is_same<CMPIEnumerationFT, struct _CMPIEnumerationFT>::value,
              "tag");
static_assert(std::is_same<CMPIDateTimeFT, struct _CMPIDateTimeFT>::value,
              "tag");
static_assert(std::is_same<CMPIInstanceMI, struct _CMPIInstanceMI>::value,
              "tag");
static_assert(std::is_same<CMPIAssociationMI, struct _CMPIAssociationMI>::value,
              "tag");
static_assert(std::is_same<CMPIMethodMI, struct _CMPIMethodMI>::value, "tag");
static_assert(std::is_same<CMPIPropertyMI, struct _CMPIPropertyMI>::value,
              "tag");
static_assert(std::is_same<CMPIIndicationMI, struct _CMPIIndicationMI>::value,
              "tag");
static_assert(std::is_same<CMPIInstanceMIFT, struct _CMPIInstanceMIFT>::value,
              "tag");
static_assert(std::is_same<CMPIAssociationMIFT, struct _CMPIAssociationMIFT>::value,
              "tag");
static_assert(std::is_same<CMPIMethodMIFT, struct _CMPIMethodMIFT>::value,
              "tag");
static_assert(std::is_same<CMPIPropertyMIFT, struct _CMPIPropertyMIFT>::value,
              "tag");
static_assert(std::is_same<CMPIIndicationMIFT, struct _CMPIIndicationMIFT>::value,
              "tag");

// ---------------------------------------------------------------------------
// Other type definitions
// ---------------------------------------------------------------------------

static_assert(std::is_same<CMPIAccessor, CMPIData(const char *, void *)>::value,
              "CMPIAccessor is a function type, not a pointer type");

// ---------------------------------------------------------------------------
// Basic types: underlying type, size, alignment, signedness
// ---------------------------------------------------------------------------

static_assert(std::is_same<CMPIBoolean, unsigned char>::value,
              "CMPIBoolean is unsigned char");
static_assert(sizeof(CMPIBoolean) == 1 && alignof(CMPIBoolean) == 1,
              "CMPIBoolean size/alignment");
static_assert(std::is_signed<CMPIBoolean>::value == false,
              "CMPIBoolean signedness");
static_assert(std::is_same<CMPIChar16, unsigned short>::value,
              "CMPIChar16 is unsigned short");
static_assert(sizeof(CMPIChar16) == 2 && alignof(CMPIChar16) == 2,
              "CMPIChar16 size/alignment");
static_assert(std::is_signed<CMPIChar16>::value == false,
              "CMPIChar16 signedness");
static_assert(std::is_same<CMPIUint8, unsigned char>::value,
              "CMPIUint8 is unsigned char");
static_assert(sizeof(CMPIUint8) == 1 && alignof(CMPIUint8) == 1,
              "CMPIUint8 size/alignment");
static_assert(std::is_signed<CMPIUint8>::value == false,
              "CMPIUint8 signedness");
static_assert(std::is_same<CMPIUint16, unsigned short>::value,
              "CMPIUint16 is unsigned short");
static_assert(sizeof(CMPIUint16) == 2 && alignof(CMPIUint16) == 2,
              "CMPIUint16 size/alignment");
static_assert(std::is_signed<CMPIUint16>::value == false,
              "CMPIUint16 signedness");
static_assert(std::is_same<CMPIUint32, unsigned int>::value,
              "CMPIUint32 is unsigned int");
static_assert(sizeof(CMPIUint32) == 4 && alignof(CMPIUint32) == 4,
              "CMPIUint32 size/alignment");
static_assert(std::is_signed<CMPIUint32>::value == false,
              "CMPIUint32 signedness");
static_assert(std::is_same<CMPIUint64, unsigned long long>::value,
              "CMPIUint64 is unsigned long long");
static_assert(sizeof(CMPIUint64) == 8 && alignof(CMPIUint64) == 8,
              "CMPIUint64 size/alignment");
static_assert(std::is_signed<CMPIUint64>::value == false,
              "CMPIUint64 signedness");
static_assert(std::is_same<CMPISint8, signed char>::value,
              "CMPISint8 is signed char");
static_assert(sizeof(CMPISint8) == 1 && alignof(CMPISint8) == 1,
              "CMPISint8 size/alignment");
static_assert(std::is_signed<CMPISint8>::value == true, "CMPISint8 signedness");
static_assert(std::is_same<CMPISint16, short>::value, "CMPISint16 is short");
static_assert(sizeof(CMPISint16) == 2 && alignof(CMPISint16) == 2,
              "CMPISint16 size/alignment");
static_assert(std::is_signed<CMPISint16>::value == true,
              "CMPISint16 signedness");
static_assert(std::is_same<CMPISint32, signed int>::value,
              "CMPISint32 is signed int");
static_assert(sizeof(CMPISint32) == 4 && alignof(CMPISint32) == 4,
              "CMPISint32 size/alignment");
static_assert(std::is_signed<CMPISint32>::value == true,
              "CMPISint32 signedness");
static_assert(std::is_same<CMPISint64, long long>::value,
              "CMPISint64 is long long");
static_assert(sizeof(CMPISint64) == 8 && alignof(CMPISint64) == 8,
              "CMPISint64 size/alignment");
static_assert(std::is_signed<CMPISint64>::value == true,
              "CMPISint64 signedness");
static_assert(std::is_same<CMPIReal32, float>::value, "CMPIReal32 is float");
static_assert(sizeof(CMPIReal32) == 4 && alignof(CMPIReal32) == 4,
              "CMPIReal32 size/alignment");
static_assert(std::is_same<CMPIReal64, double>::value, "CMPIReal64 is double");
static_assert(sizeof(CMPIReal64) == 8 && alignof(CMPIReal64) == 8,
              "CMPIReal64 size/alignment");
static_assert(std::is_same<CMPIType, unsigned short>::value,
              "CMPIType is unsigned short");
static_assert(sizeof(CMPIType) == 2 && alignof(CMPIType) == 2,
              "CMPIType size/alignment");
static_assert(std::is_signed<CMPIType>::value == false, "CMPIType signedness");
static_assert(std::is_same<CMPIValueState, unsigned short>::value,
              "CMPIValueState is unsigned short");
static_assert(sizeof(CMPIValueState) == 2 && alignof(CMPIValueState) == 2,
              "CMPIValueState size/alignment");
static_assert(std::is_signed<CMPIValueState>::value == false,
              "CMPIValueState signedness");
static_assert(std::is_same<CMPICount, unsigned int>::value,
              "CMPICount is unsigned int");
static_assert(sizeof(CMPICount) == 4 && alignof(CMPICount) == 4,
              "CMPICount size/alignment");
static_assert(std::is_signed<CMPICount>::value == false,
              "CMPICount signedness");
static_assert(std::is_same<CMPIFlags, unsigned int>::value,
              "CMPIFlags is unsigned int");
static_assert(sizeof(CMPIFlags) == 4 && alignof(CMPIFlags) == 4,
              "CMPIFlags size/alignment");
static_assert(std::is_signed<CMPIFlags>::value == false,
              "CMPIFlags signedness");
static_assert(isUnsignedIntEnum<CMPIrc>(), "CMPIrc: enum over unsigned int");
static_assert(sizeof(CMPIrc) == 4 && alignof(CMPIrc) == 4,
              "CMPIrc size/alignment");
static_assert(std::is_same<CMPIMsgFileHandle, void *>::value,
              "CMPIMsgFileHandle is void *");
static_assert(sizeof(CMPIMsgFileHandle) == 8 && alignof(CMPIMsgFileHandle) == 8,
              "CMPIMsgFileHandle size/alignment");
static_assert(std::is_same<CMPIGcStat, void>::value, "CMPIGcStat is void");

// ---------------------------------------------------------------------------
// CMPIType codes, including derived, array, key, predicate and synonym codes
// ---------------------------------------------------------------------------

static_assert(CMPI_null == 0, "CMPI_null");
static_assert(CMPI_SIMPLE == 2, "CMPI_SIMPLE");
static_assert(CMPI_boolean == 2, "CMPI_boolean");
static_assert(CMPI_char16 == 3, "CMPI_char16");
static_assert(CMPI_REAL == 8, "CMPI_REAL");
static_assert(CMPI_real32 == 8, "CMPI_real32");
static_assert(CMPI_real64 == 12, "CMPI_real64");
static_assert(CMPI_UINT == 128, "CMPI_UINT");
static_assert(CMPI_uint8 == 128, "CMPI_uint8");
static_assert(CMPI_uint16 == 144, "CMPI_uint16");
static_assert(CMPI_uint32 == 160, "CMPI_uint32");
static_assert(CMPI_uint64 == 176, "CMPI_uint64");
static_assert(CMPI_SINT == 192, "CMPI_SINT");
static_assert(CMPI_sint8 == 192, "CMPI_sint8");
static_assert(CMPI_sint16 == 208, "CMPI_sint16");
static_assert(CMPI_sint32 == 224, "CMPI_sint32");
static_assert(CMPI_sint64 == 240, "CMPI_sint64");
static_assert(CMPI_INTEGER == 192, "CMPI_INTEGER");
static_assert(CMPI_ENC == 4096, "CMPI_ENC");
static_assert(CMPI_instance == 4096, "CMPI_instance");
static_assert(CMPI_ref == 4352, "CMPI_ref");
static_assert(CMPI_args == 4608, "CMPI_args");
static_assert(CMPI_class == 4864, "CMPI_class");
static_assert(CMPI_filter == 5120, "CMPI_filter");
static_assert(CMPI_enumeration == 5376, "CMPI_enumeration");
static_assert(CMPI_string == 5632, "CMPI_string");
static_assert(CMPI_chars == 5888, "CMPI_chars");
static_assert(CMPI_dateTime == 6144, "CMPI_dateTime");
static_assert(CMPI_ptr == 6400, "CMPI_ptr");
static_assert(CMPI_charsptr == 6656, "CMPI_charsptr");
static_assert(CMPI_ARRAY == 8192, "CMPI_ARRAY");
static_assert(CMPI_SIMPLEA == 8194, "CMPI_SIMPLEA");
static_assert(CMPI_booleanA == 8194, "CMPI_booleanA");
static_assert(CMPI_char16A == 8195, "CMPI_char16A");
static_assert(CMPI_REALA == 8200, "CMPI_REALA");
static_assert(CMPI_real32A == 8200, "CMPI_real32A");
static_assert(CMPI_real64A == 8204, "CMPI_real64A");
static_assert(CMPI_UINTA == 8320, "CMPI_UINTA");
static_assert(CMPI_uint8A == 8320, "CMPI_uint8A");
static_assert(CMPI_uint16A == 8336, "CMPI_uint16A");
static_assert(CMPI_uint32A == 8352, "CMPI_uint32A");
static_assert(CMPI_uint64A == 8368, "CMPI_uint64A");
static_assert(CMPI_SINTA == 8384, "CMPI_SINTA");
static_assert(CMPI_sint8A == 8384, "CMPI_sint8A");
static_assert(CMPI_sint16A == 8400, "CMPI_sint16A");
static_assert(CMPI_sint32A == 8416, "CMPI_sint32A");
static_assert(CMPI_sint64A == 8432, "CMPI_sint64A");
static_assert(CMPI_INTEGERA == 8384, "CMPI_INTEGERA");
static_assert(CMPI_ENCA == 12288, "CMPI_ENCA");
static_assert(CMPI_stringA == 13824, "CMPI_stringA");
static_assert(CMPI_charsA == 14080, "CMPI_charsA");
static_assert(CMPI_dateTimeA == 14336, "CMPI_dateTimeA");
static_assert(CMPI_instanceA == 12288, "CMPI_instanceA");
static_assert(CMPI_refA == 12544, "CMPI_refA");
static_assert(CMPI_charsptrA == 14848, "CMPI_charsptrA");
static_assert(CMPI_keyInteger == 240, "CMPI_keyInteger");
static_assert(CMPI_keyString == 5632, "CMPI_keyString");
static_assert(CMPI_keyBoolean == 2, "CMPI_keyBoolean");
static_assert(CMPI_keyRef == 4352, "CMPI_keyRef");
static_assert(CMPI_charString == 5632, "CMPI_charString");
static_assert(CMPI_integerString == 5872, "CMPI_integerString");
static_assert(CMPI_realString == 5644, "CMPI_realString");
static_assert(CMPI_numericString == 5884, "CMPI_numericString");
static_assert(CMPI_booleanString == 5634, "CMPI_booleanString");
static_assert(CMPI_dateTimeString == 7680, "CMPI_dateTimeString");
static_assert(CMPI_classNameString == 5888, "CMPI_classNameString");
static_assert(CMPI_nameString == 7680, "CMPI_nameString");
static_assert(CMPI_Byte == 192, "CMPI_Byte");
static_assert(CMPI_Short == 208, "CMPI_Short");
static_assert(CMPI_Int == 224, "CMPI_Int");
static_assert(CMPI_Long == 240, "CMPI_Long");
static_assert(CMPI_Float == 8, "CMPI_Float");
static_assert(CMPI_Double == 12, "CMPI_Double");
static_assert(CMPI_ByteA == 8384, "CMPI_ByteA");
static_assert(CMPI_ShortA == 8400, "CMPI_ShortA");
static_assert(CMPI_IntA == 8416, "CMPI_IntA");
static_assert(CMPI_LongA == 8432, "CMPI_LongA");
static_assert(CMPI_FloatA == 8200, "CMPI_FloatA");
static_assert(CMPI_DoubleA == 8204, "CMPI_DoubleA");

// ---------------------------------------------------------------------------
// CMPIValueState bits
// ---------------------------------------------------------------------------

static_assert(CMPI_goodValue == 0, "CMPI_goodValue");
static_assert(CMPI_nullValue == 256, "CMPI_nullValue");
static_assert(CMPI_keyValue == 512, "CMPI_keyValue");
static_assert(CMPI_notFound == 1024, "CMPI_notFound");
static_assert(CMPI_badValue == 32768, "CMPI_badValue");

// ---------------------------------------------------------------------------
// CMPIrc codes
// ---------------------------------------------------------------------------

static_assert(CMPI_RC_OK == 0, "CMPI_RC_OK");
static_assert(CMPI_RC_ERR_FAILED == 1, "CMPI_RC_ERR_FAILED");
static_assert(CMPI_RC_ERR_ACCESS_DENIED == 2, "CMPI_RC_ERR_ACCESS_DENIED");
static_assert(CMPI_RC_ERR_INVALID_NAMESPACE == 3,
              "CMPI_RC_ERR_INVALID_NAMESPACE");
static_assert(CMPI_RC_ERR_INVALID_PARAMETER == 4,
              "CMPI_RC_ERR_INVALID_PARAMETER");
static_assert(CMPI_RC_ERR_INVALID_CLASS == 5, "CMPI_RC_ERR_INVALID_CLASS");
static_assert(CMPI_RC_ERR_NOT_FOUND == 6, "CMPI_RC_ERR_NOT_FOUND");
static_assert(CMPI_RC_ERR_NOT_SUPPORTED == 7, "CMPI_RC_ERR_NOT_SUPPORTED");
static_assert(CMPI_RC_ERR_CLASS_HAS_CHILDREN == 8,
              "CMPI_RC_ERR_CLASS_HAS_CHILDREN");
static_assert(CMPI_RC_ERR_CLASS_HAS_INSTANCES == 9,
              "CMPI_RC_ERR_CLASS_HAS_INSTANCES");
static_assert(CMPI_RC_ERR_INVALID_SUPERCLASS == 10,
              "CMPI_RC_ERR_INVALID_SUPERCLASS");
static_assert(CMPI_RC_ERR_ALREADY_EXISTS == 11, "CMPI_RC_ERR_ALREADY_EXISTS");
static_assert(CMPI_RC_ERR_NO_SUCH_PROPERTY == 12,
              "CMPI_RC_ERR_NO_SUCH_PROPERTY");
static_assert(CMPI_RC_ERR_TYPE_MISMATCH == 13, "CMPI_RC_ERR_TYPE_MISMATCH");
static_assert(CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED == 14,
              "CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED");
static_assert(CMPI_RC_ERR_INVALID_QUERY == 15, "CMPI_RC_ERR_INVALID_QUERY");
static_assert(CMPI_RC_ERR_METHOD_NOT_AVAILABLE == 16,
              "CMPI_RC_ERR_METHOD_NOT_AVAILABLE");
static_assert(CMPI_RC_ERR_METHOD_NOT_FOUND == 17,
              "CMPI_RC_ERR_METHOD_NOT_FOUND");
static_assert(CMPI_RC_DO_NOT_UNLOAD == 50, "CMPI_RC_DO_NOT_UNLOAD");
static_assert(CMPI_RC_NEVER_UNLOAD == 51, "CMPI_RC_NEVER_UNLOAD");
static_assert(CMPI_RC_ERR_INVALID_HANDLE == 60, "CMPI_RC_ERR_INVALID_HANDLE");
static_assert(CMPI_RC_ERR_INVALID_DATA_TYPE == 61,
              "CMPI_RC_ERR_INVALID_DATA_TYPE");
static_assert(CMPI_RC_ERROR_SYSTEM == 100, "CMPI_RC_ERROR_SYSTEM");
static_assert(CMPI_RC_ERROR == 200, "CMPI_RC_ERROR");

// ---------------------------------------------------------------------------
// CMPIFlags bits and context entry names
// ---------------------------------------------------------------------------

static_assert(CMPI_FLAG_LocalOnly == 1, "CMPI_FLAG_LocalOnly");
static_assert(CMPI_FLAG_DeepInheritance == 2, "CMPI_FLAG_DeepInheritance");
static_assert(CMPI_FLAG_IncludeQualifiers == 4, "CMPI_FLAG_IncludeQualifiers");
static_assert(CMPI_FLAG_IncludeClassOrigin == 8,
              "CMPI_FLAG_IncludeClassOrigin");
static_assert(sameText(CMPIPrincipal, "CMPIPrincipal"), "CMPIPrincipal");
static_assert(sameText(CMPIInvocationFlags, "CMPIInvocationFlags"),
              "CMPIInvocationFlags");
static_assert(sameText(CMPIInitNameSpace, "CMPIInitNameSpace"),
              "CMPIInitNameSpace");
static_assert(sameText(CMPIRole, "CMPIRole"), "CMPIRole");
static_assert(sameText(CMPIAcceptLanguage, "CMPIAcceptLanguage"),
              "CMPIAcceptLanguage");
static_assert(sameText(CMPIContentLanguage, "CMPIContentLanguage"),
              "CMPIContentLanguage");

// ---------------------------------------------------------------------------
// Broker capability bits
// ---------------------------------------------------------------------------

static_assert(CMPI_MB_Class_0 == 0x00000001, "CMPI_MB_Class_0");
static_assert(CMPI_MB_Class_1 == 0x00000003, "CMPI_MB_Class_1");
static_assert(CMPI_MB_Class_2 == 0x00000007, "CMPI_MB_Class_2");
static_assert(CMPI_MB_Supports_PropertyMI == 0x00000100,
              "CMPI_MB_Supports_PropertyMI");
static_assert(CMPI_MB_Supports_IndicationMI == 0x00000200,
              "CMPI_MB_Supports_IndicationMI");
static_assert(CMPI_MB_Supports_IndicationPolling == 0x00000400,
              "CMPI_MB_Supports_IndicationPolling");
static_assert(CMPI_MB_Supports_QueryNormalization == 0x00000800,
              "CMPI_MB_Supports_QueryNormalization");
static_assert(CMPI_MB_Supports_Qualifier == 0x00001000,
              "CMPI_MB_Supports_Qualifier");
static_assert(CMPI_MB_Supports_Schema == 0x00003000, "CMPI_MB_Supports_Schema");
static_assert(CMPI_MB_Supports_MemEnhancements == 0x00004000,
              "CMPI_MB_Supports_MemEnhancements");
static_assert(CMPI_MB_Supports_Extended_Error == 0x00008000,
              "CMPI_MB_Supports_Extended_Error");
static_assert(CMPI_MB_BasicRead == 0x00000001, "CMPI_MB_BasicRead");
static_assert(CMPI_MB_BasicWrite == 0x00000003, "CMPI_MB_BasicWrite");
static_assert(CMPI_MB_InstanceManipulation == 0x00000007,
              "CMPI_MB_InstanceManipulation");
static_assert(CMPI_MB_AssociationTraversal == 0x00000009,
              "CMPI_MB_AssociationTraversal");
static_assert(CMPI_MB_QueryExecution == 0x00000011, "CMPI_MB_QueryExecution");
static_assert(CMPI_MB_QueryNormalization == 0x00000031,
              "CMPI_MB_QueryNormalization");
static_assert(CMPI_MB_Indications == 0x00000081, "CMPI_MB_Indications");
static_assert(CMPI_MB_BasicQualifierSupport == 0x00000047,
              "CMPI_MB_BasicQualifierSupport");
static_assert(CMPI_MB_OSEncapsulationSupport == 0x00000100,
              "CMPI_MB_OSEncapsulationSupport");

// ---------------------------------------------------------------------------
// Enumerations used by the function tables
// ---------------------------------------------------------------------------

static_assert(sizeof(CMPIPredOp) == 4 && alignof(CMPIPredOp) == 4,
              "CMPIPredOp size");
static_assert(isUnsignedIntEnum<CMPIPredOp>(),
              "CMPIPredOp: enum over unsigned int");
static_assert(CMPI_PredOp_Equals == 1, "CMPIPredOp::CMPI_PredOp_Equals");
static_assert(CMPI_PredOp_NotEquals == 2, "CMPIPredOp::CMPI_PredOp_NotEquals");
static_assert(CMPI_PredOp_LessThan == 3, "CMPIPredOp::CMPI_PredOp_LessThan");
static_assert(CMPI_PredOp_GreaterThanOrEquals == 4,
              "CMPIPredOp::CMPI_PredOp_GreaterThanOrEquals");
static_assert(CMPI_PredOp_GreaterThan == 5,
              "CMPIPredOp::CMPI_PredOp_GreaterThan");
static_assert(CMPI_PredOp_LessThanOrEquals == 6,
              "CMPIPredOp::CMPI_PredOp_LessThanOrEquals");
static_assert(CMPI_PredOp_Isa == 7, "CMPIPredOp::CMPI_PredOp_Isa");
static_assert(CMPI_PredOp_NotIsa == 8, "CMPIPredOp::CMPI_PredOp_NotIsa");
static_assert(CMPI_PredOp_Like == 9, "CMPIPredOp::CMPI_PredOp_Like");
static_assert(CMPI_PredOp_NotLike == 10, "CMPIPredOp::CMPI_PredOp_NotLike");
static_assert(CMPI_PredOp_Not_Null == 11, "CMPIPredOp::CMPI_PredOp_Not_Null");
static_assert(CMPI_PredOp_Null == 12, "CMPIPredOp::CMPI_PredOp_Null");
static_assert(CMPI_PredOp_And == 13, "CMPIPredOp::CMPI_PredOp_And");
static_assert(CMPI_PredOp_Or == 14, "CMPIPredOp::CMPI_PredOp_Or");

static_assert(sizeof(CMPISeverity) == 4 && alignof(CMPISeverity) == 4,
              "CMPISeverity size");
static_assert(isUnsignedIntEnum<CMPISeverity>(),
              "CMPISeverity: enum over unsigned int");
static_assert(CMPI_SEV_ERROR == 1, "CMPISeverity::CMPI_SEV_ERROR");
static_assert(CMPI_SEV_INFO == 2, "CMPISeverity::CMPI_SEV_INFO");
static_assert(CMPI_SEV_WARNING == 3, "CMPISeverity::CMPI_SEV_WARNING");
static_assert(CMPI_DEV_DEBUG == 4, "CMPISeverity::CMPI_DEV_DEBUG");

static_assert(sizeof(CMPILevel) == 4 && alignof(CMPILevel) == 4,
              "CMPILevel size");
static_assert(isUnsignedIntEnum<CMPILevel>(),
              "CMPILevel: enum over unsigned int");
static_assert(CMPI_LEV_INFO == 1, "CMPILevel::CMPI_LEV_INFO");
static_assert(CMPI_LEV_WARNING == 2, "CMPILevel::CMPI_LEV_WARNING");
static_assert(CMPI_LEV_VERBOSE == 3, "CMPILevel::CMPI_LEV_VERBOSE");

static_assert(sizeof(CMPISelectCondType) == 4 && alignof(CMPISelectCondType) == 4,
              "CMPISelectCondType size");
static_assert(isUnsignedIntEnum<CMPISelectCondType>(),
              "CMPISelectCondType: enum over unsigned int");
static_assert(CMPI_COND_DOC == 0, "CMPISelectCondType::CMPI_COND_DOC");
static_assert(CMPI_COND_COD == 1, "CMPISelectCondType::CMPI_COND_COD");

static_assert(sizeof(CMPIErrorType) == 4 && alignof(CMPIErrorType) == 4,
              "CMPIErrorType size");
static_assert(isUnsignedIntEnum<CMPIErrorType>(),
              "CMPIErrorType: enum over unsigned int");
static_assert(UnknownErrorType == 0, "CMPIErrorType::UnknownErrorType");
static_assert(OtherErrorType == 1, "CMPIErrorType::OtherErrorType");
static_assert(CommunicationsError == 2, "CMPIErrorType::CommunicationsError");
static_assert(QualityOfServiceError == 3,
              "CMPIErrorType::QualityOfServiceError");
static_assert(SoftwareError == 4, "CMPIErrorType::SoftwareError");
static_assert(HardwareError == 5, "CMPIErrorType::HardwareError");
static_assert(EnvironmentalError == 6, "CMPIErrorType::EnvironmentalError");
static_assert(SecurityError == 7, "CMPIErrorType::SecurityError");
static_assert(Oversubscription_Error == 8,
              "CMPIErrorType::Oversubscription_Error");
static_assert(UnavailableResourceError == 9,
              "CMPIErrorType::UnavailableResourceError");
static_assert(UnsupportedOperationError == 10,
              "CMPIErrorType::UnsupportedOperationError");

static_assert(sizeof(CMPIErrorSeverity) == 4 && alignof(CMPIErrorSeverity) == 4,
              "CMPIErrorSeverity size");
static_assert(isUnsignedIntEnum<CMPIErrorSeverity>(),
              "CMPIErrorSeverity: enum over unsigned int");
static_assert(ErrorSevUnknown == 0, "CMPIErrorSeverity::ErrorSevUnknown");
static_assert(ErrorSevLow == 2, "CMPIErrorSeverity::ErrorSevLow");
static_assert(ErrorSevMedium == 3, "CMPIErrorSeverity::ErrorSevMedium");
static_assert(ErrorSevHigh == 4, "CMPIErrorSeverity::ErrorSevHigh");
static_assert(ErrorSevFatal == 5, "CMPIErrorSeverity::ErrorSevFatal");

static_assert(sizeof(CMPIErrorSrcFormat) == 4 && alignof(CMPIErrorSrcFormat) == 4,
              "CMPIErrorSrcFormat size");
static_assert(isUnsignedIntEnum<CMPIErrorSrcFormat>(),
              "CMPIErrorSrcFormat: enum over unsigned int");
static_assert(CMPIErrSrcUnknown == 0, "CMPIErrorSrcFormat::CMPIErrSrcUnknown");
static_assert(CMPIErrSrcOther == 1, "CMPIErrorSrcFormat::CMPIErrSrcOther");
static_assert(CIMObjectHandle == 2, "CMPIErrorSrcFormat::CIMObjectHandle");

static_assert(sizeof(CMPIErrorProbableCause) == 4 && alignof(CMPIErrorProbableCause) == 4,
              "CMPIErrorProbableCause size");
static_assert(isUnsignedIntEnum<CMPIErrorProbableCause>(),
              "CMPIErrorProbableCause: enum over unsigned int");
static_assert(ErrorProbCauseUnknown == 0,
              "CMPIErrorProbableCause::ErrorProbCauseUnknown");
static_assert(ErrorProbCauseOther == 1,
              "CMPIErrorProbableCause::ErrorProbCauseOther");
static_assert(Adapter_Card_Error == 2,
              "CMPIErrorProbableCause::Adapter_Card_Error");
static_assert(Application_Subsystem_Failure == 3,
              "CMPIErrorProbableCause::Application_Subsystem_Failure");
static_assert(Bandwidth_Reduced == 4,
              "CMPIErrorProbableCause::Bandwidth_Reduced");
static_assert(Connection_Establishment_Error == 5,
              "CMPIErrorProbableCause::Connection_Establishment_Error");
static_assert(Communications_Protocol_Error == 6,
              "CMPIErrorProbableCause::Communications_Protocol_Error");
static_assert(Communications_Subsystem_Failure == 7,
              "CMPIErrorProbableCause::Communications_Subsystem_Failure");
static_assert(ConfigurationCustomization_Error == 8,
              "CMPIErrorProbableCause::ConfigurationCustomization_Error");
static_assert(Congestion == 9, "CMPIErrorProbableCause::Congestion");
static_assert(Corrupt_Data == 10, "CMPIErrorProbableCause::Corrupt_Data");
static_assert(CPU_Cycles_Limit_Exceeded == 11,
              "CMPIErrorProbableCause::CPU_Cycles_Limit_Exceeded");
static_assert(DatasetModem_Error == 12,
              "CMPIErrorProbableCause::DatasetModem_Error");
static_assert(Degraded_Signal == 13, "CMPIErrorProbableCause::Degraded_Signal");
static_assert(DTE_DCE_Interface_Error == 14,
              "CMPIErrorProbableCause::DTE_DCE_Interface_Error");
static_assert(Enclosure_Door_Open == 15,
              "CMPIErrorProbableCause::Enclosure_Door_Open");
static_assert(Equipment_Malfunction == 16,
              "CMPIErrorProbableCause::Equipment_Malfunction");
static_assert(Excessive_Vibration == 17,
              "CMPIErrorProbableCause::Excessive_Vibration");
static_assert(File_Format_Error == 18,
              "CMPIErrorProbableCause::File_Format_Error");
static_assert(Fire_Detected == 19, "CMPIErrorProbableCause::Fire_Detected");
static_assert(Flood_Detected == 20, "CMPIErrorProbableCause::Flood_Detected");
static_assert(Framing_Error == 21, "CMPIErrorProbableCause::Framing_Error");
static_assert(HVAC_Problem == 22, "CMPIErrorProbableCause::HVAC_Problem");
static_assert(Humidity_Unacceptable == 23,
              "CMPIErrorProbableCause::Humidity_Unacceptable");
static_assert(IO_Device_Error == 24, "CMPIErrorProbableCause::IO_Device_Error");
static_assert(Input_Device_Error == 25,
              "CMPIErrorProbableCause::Input_Device_Error");
static_assert(LAN_Error == 26, "CMPIErrorProbableCause::LAN_Error");
static_assert(Non_Toxic_Leak_Detected == 27,
              "CMPIErrorProbableCause::Non_Toxic_Leak_Detected");
static_assert(Local_Node_Transmission_Error == 28,
              "CMPIErrorProbableCause::Local_Node_Transmission_Error");
static_assert(Loss_of_Frame == 29, "CMPIErrorProbableCause::Loss_of_Frame");
static_assert(Loss_of_Signal == 30, "CMPIErrorProbableCause::Loss_of_Signal");
static_assert(Material_Supply_Exhausted == 31,
              "CMPIErrorProbableCause::Material_Supply_Exhausted");
static_assert(Multiplexer_Problem == 32,
              "CMPIErrorProbableCause::Multiplexer_Problem");
static_assert(Out_of_Memory == 33, "CMPIErrorProbableCause::Out_of_Memory");
static_assert(Output_Device_Error == 34,
              "CMPIErrorProbableCause::Output_Device_Error");
static_assert(Performance_Degraded == 35,
              "CMPIErrorProbableCause::Performance_Degraded");
static_assert(Power_Problem == 36, "CMPIErrorProbableCause::Power_Problem");
static_assert(Pressure_Unacceptable == 37,
              "CMPIErrorProbableCause::Pressure_Unacceptable");
static_assert(Processor_Problem == 38,
              "CMPIErrorProbableCause::Processor_Problem");
static_assert(Pump_Failure == 39, "CMPIErrorProbableCause::Pump_Failure");
static_assert(Queue_Size_Exceeded == 40,
              "CMPIErrorProbableCause::Queue_Size_Exceeded");
static_assert(Receive_Failure == 41, "CMPIErrorProbableCause::Receive_Failure");
static_assert(Receiver_Failure == 42,
              "CMPIErrorProbableCause::Receiver_Failure");
static_assert(Remote_Node_Transmission_Error == 43,
              "CMPIErrorProbableCause::Remote_Node_Transmission_Error");
static_assert(Resource_at_or_Nearing_Capacity == 44,
              "CMPIErrorProbableCause::Resource_at_or_Nearing_Capacity");
static_assert(Response_Time_Excessive == 45,
              "CMPIErrorProbableCause::Response_Time_Excessive");
static_assert(Retransmission_Rate_Excessive == 46,
              "CMPIErrorProbableCause::Retransmission_Rate_Excessive");
static_assert(Software_Error == 47, "CMPIErrorProbableCause::Software_Error");
static_assert(Software_Program_Abnormally_Terminated == 48,
              "CMPIErrorProbableCause::Software_Program_Abnormally_Terminated");
static_assert(Software_Program_Error == 49,
              "CMPIErrorProbableCause::Software_Program_Error");
static_assert(Storage_Capacity_Problem == 50,
              "CMPIErrorProbableCause::Storage_Capacity_Problem");
static_assert(Temperature_Unacceptable == 51,
              "CMPIErrorProbableCause::Temperature_Unacceptable");
static_assert(Threshold_Crossed == 52,
              "CMPIErrorProbableCause::Threshold_Crossed");
static_assert(Timing_Problem == 53, "CMPIErrorProbableCause::Timing_Problem");
static_assert(Toxic_Leak_Detected == 54,
              "CMPIErrorProbableCause::Toxic_Leak_Detected");
static_assert(Transmit_Failure == 55,
              "CMPIErrorProbableCause::Transmit_Failure");
static_assert(Transmitter_Failure == 56,
              "CMPIErrorProbableCause::Transmitter_Failure");
static_assert(Underlying_Resource_Unavailable == 57,
              "CMPIErrorProbableCause::Underlying_Resource_Unavailable");
static_assert(Version_Mismatch == 58,
              "CMPIErrorProbableCause::Version_Mismatch");
static_assert(Previous_Alert_Cleared == 59,
              "CMPIErrorProbableCause::Previous_Alert_Cleared");
static_assert(Login_Attempts_Failed == 60,
              "CMPIErrorProbableCause::Login_Attempts_Failed");
static_assert(Software_Virus_Detected == 61,
              "CMPIErrorProbableCause::Software_Virus_Detected");
static_assert(Hardware_Security_Breached == 62,
              "CMPIErrorProbableCause::Hardware_Security_Breached");
static_assert(Denial_of_Service_Detected == 63,
              "CMPIErrorProbableCause::Denial_of_Service_Detected");
static_assert(Security_Credential_Mismatch == 64,
              "CMPIErrorProbableCause::Security_Credential_Mismatch");
static_assert(Unauthorized_Access == 65,
              "CMPIErrorProbableCause::Unauthorized_Access");
static_assert(Alarm_Received == 66, "CMPIErrorProbableCause::Alarm_Received");
static_assert(Loss_of_Pointer == 67, "CMPIErrorProbableCause::Loss_of_Pointer");
static_assert(Payload_Mismatch == 68,
              "CMPIErrorProbableCause::Payload_Mismatch");
static_assert(Transmission_Error == 69,
              "CMPIErrorProbableCause::Transmission_Error");
static_assert(Excessive_Error_Rate == 70,
              "CMPIErrorProbableCause::Excessive_Error_Rate");
static_assert(Trace_Problem == 71, "CMPIErrorProbableCause::Trace_Problem");
static_assert(Element_Unavailable == 72,
              "CMPIErrorProbableCause::Element_Unavailable");
static_assert(Element_Missing == 73, "CMPIErrorProbableCause::Element_Missing");
static_assert(Loss_of_Multi_Frame == 74,
              "CMPIErrorProbableCause::Loss_of_Multi_Frame");
static_assert(Broadcast_Channel_Failure == 75,
              "CMPIErrorProbableCause::Broadcast_Channel_Failure");
static_assert(Invalid_Message_Received == 76,
              "CMPIErrorProbableCause::Invalid_Message_Received");
static_assert(Routing_Failure == 77, "CMPIErrorProbableCause::Routing_Failure");
static_assert(Backplane_Failure == 78,
              "CMPIErrorProbableCause::Backplane_Failure");
static_assert(Identifier_Duplication == 79,
              "CMPIErrorProbableCause::Identifier_Duplication");
static_assert(Protection_Path_Failure == 80,
              "CMPIErrorProbableCause::Protection_Path_Failure");
static_assert(Sync_Loss_or_Mismatch == 81,
              "CMPIErrorProbableCause::Sync_Loss_or_Mismatch");
static_assert(Terminal_Problem == 82,
              "CMPIErrorProbableCause::Terminal_Problem");
static_assert(Real_Time_Clock_Failure == 83,
              "CMPIErrorProbableCause::Real_Time_Clock_Failure");
static_assert(Antenna_Failure == 84, "CMPIErrorProbableCause::Antenna_Failure");
static_assert(Battery_Charging_Failure == 85,
              "CMPIErrorProbableCause::Battery_Charging_Failure");
static_assert(Disk_Failure == 86, "CMPIErrorProbableCause::Disk_Failure");
static_assert(Frequency_Hopping_Failure == 87,
              "CMPIErrorProbableCause::Frequency_Hopping_Failure");
static_assert(Loss_of_Redundancy == 88,
              "CMPIErrorProbableCause::Loss_of_Redundancy");
static_assert(Power_Supply_Failure == 89,
              "CMPIErrorProbableCause::Power_Supply_Failure");
static_assert(Signal_Quality_Problem == 90,
              "CMPIErrorProbableCause::Signal_Quality_Problem");
static_assert(Battery_Discharging == 91,
              "CMPIErrorProbableCause::Battery_Discharging");
static_assert(Battery_Failure == 92, "CMPIErrorProbableCause::Battery_Failure");
static_assert(Commercial_Power_Problem == 93,
              "CMPIErrorProbableCause::Commercial_Power_Problem");
static_assert(Fan_Failure == 94, "CMPIErrorProbableCause::Fan_Failure");
static_assert(Engine_Failure == 95, "CMPIErrorProbableCause::Engine_Failure");
static_assert(Sensor_Failure == 96, "CMPIErrorProbableCause::Sensor_Failure");
static_assert(Fuse_Failure == 97, "CMPIErrorProbableCause::Fuse_Failure");
static_assert(Generator_Failure == 98,
              "CMPIErrorProbableCause::Generator_Failure");
static_assert(Low_Battery == 99, "CMPIErrorProbableCause::Low_Battery");
static_assert(Low_Fuel == 100, "CMPIErrorProbableCause::Low_Fuel");
static_assert(Low_Water == 101, "CMPIErrorProbableCause::Low_Water");
static_assert(Explosive_Gas == 102, "CMPIErrorProbableCause::Explosive_Gas");
static_assert(High_Winds == 103, "CMPIErrorProbableCause::High_Winds");
static_assert(Ice_Buildup == 104, "CMPIErrorProbableCause::Ice_Buildup");
static_assert(Smoke == 105, "CMPIErrorProbableCause::Smoke");
static_assert(Memory_Mismatch == 106,
              "CMPIErrorProbableCause::Memory_Mismatch");
static_assert(Out_of_CPU_Cycles == 107,
              "CMPIErrorProbableCause::Out_of_CPU_Cycles");
static_assert(Software_Environment_Problem == 108,
              "CMPIErrorProbableCause::Software_Environment_Problem");
static_assert(Software_Download_Failure == 109,
              "CMPIErrorProbableCause::Software_Download_Failure");
static_assert(Element_Reinitialized == 110,
              "CMPIErrorProbableCause::Element_Reinitialized");
static_assert(Timeout == 111, "CMPIErrorProbableCause::Timeout");
static_assert(Logging_Problems == 112,
              "CMPIErrorProbableCause::Logging_Problems");
static_assert(Leak_Detected_113 == 113,
              "CMPIErrorProbableCause::Leak_Detected_113");
static_assert(Protection_Mechanism_Failure == 114,
              "CMPIErrorProbableCause::Protection_Mechanism_Failure");
static_assert(Protecting_Resource_Failure == 115,
              "CMPIErrorProbableCause::Protecting_Resource_Failure");
static_assert(Database_Inconsistency == 116,
              "CMPIErrorProbableCause::Database_Inconsistency");
static_assert(Authentication_Failure == 117,
              "CMPIErrorProbableCause::Authentication_Failure");
static_assert(Breach_of_Confidentiality == 118,
              "CMPIErrorProbableCause::Breach_of_Confidentiality");
static_assert(Cable_Tamper == 119, "CMPIErrorProbableCause::Cable_Tamper");
static_assert(Delayed_Information == 120,
              "CMPIErrorProbableCause::Delayed_Information");
static_assert(Duplicate_Information == 121,
              "CMPIErrorProbableCause::Duplicate_Information");
static_assert(Information_Missing == 122,
              "CMPIErrorProbableCause::Information_Missing");
static_assert(Information_Modification == 123,
              "CMPIErrorProbableCause::Information_Modification");
static_assert(Information_Out_of_Sequence == 124,
              "CMPIErrorProbableCause::Information_Out_of_Sequence");
static_assert(Key_Expired == 125, "CMPIErrorProbableCause::Key_Expired");
static_assert(Non_Repudiation_Failure == 126,
              "CMPIErrorProbableCause::Non_Repudiation_Failure");
static_assert(Out_of_Hours_Activity == 127,
              "CMPIErrorProbableCause::Out_of_Hours_Activity");
static_assert(Out_of_Service == 128, "CMPIErrorProbableCause::Out_of_Service");
static_assert(Procedural_Error == 129,
              "CMPIErrorProbableCause::Procedural_Error");
static_assert(Unexpected_Information == 130,
              "CMPIErrorProbableCause::Unexpected_Information");

// ---------------------------------------------------------------------------
// Function tables: size, and offset and exact type of every member
// ---------------------------------------------------------------------------

// CMPIBrokerFT
static_assert(sizeof(CMPIBrokerFT) == 160, "CMPIBrokerFT size");
static_assert(alignof(CMPIBrokerFT) == 8, "CMPIBrokerFT alignment");
TVR_CHECK_MEMBER(CMPIBrokerFT, brokerCapabilities, 0, unsigned int);
TVR_CHECK_MEMBER(CMPIBrokerFT, brokerVersion, 4, unsigned int);
TVR_CHECK_MEMBER(CMPIBrokerFT, brokerName, 8, const char *);
TVR_CHECK_MEMBER(CMPIBrokerFT, prepareAttachThread, 16,
                 CMPIContext *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx));
TVR_CHECK_MEMBER(CMPIBrokerFT, attachThread, 24,
                 CMPIStatus (*)(const CMPIBroker *, const CMPIContext *));
TVR_CHECK_MEMBER(CMPIBrokerFT, detachThread, 32,
                 CMPIStatus (*)(const CMPIBroker *mb, const CMPIContext *ctx));
TVR_CHECK_MEMBER(CMPIBrokerFT, deliverIndication, 40,
                 CMPIStatus (*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const char *ns, const CMPIInstance *ind));
TVR_CHECK_MEMBER(CMPIBrokerFT, enumerateInstanceNames, 48,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, getInstance, 56,
                 CMPIInstance *(*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const CMPIObjectPath *op, const char **properties,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, createInstance, 64,
                 CMPIObjectPath *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const CMPIInstance *inst, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, modifyInstance, 72,
                 CMPIStatus (*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const CMPIObjectPath *op, const CMPIInstance *inst,
                     const char **properties));
TVR_CHECK_MEMBER(CMPIBrokerFT, deleteInstance, 80,
                 CMPIStatus (*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const CMPIObjectPath *op));
TVR_CHECK_MEMBER(CMPIBrokerFT, execQuery, 88,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const char *query, const char *lang, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, enumerateInstances, 96,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const char **properties, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, associators, 104,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const char *assocClass, const char *resultClass,
                     const char *role, const char *resultRole,
                     const char **properties, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, associatorNames, 112,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const char *assocClass, const char *resultClass,
                     const char *role, const char *resultRole, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, references, 120,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const char *resultClass, const char *role,
                     const char **properties, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, referenceNames, 128,
                 CMPIEnumeration *(*)(const CMPIBroker *mb,
                     const CMPIContext *ctx, const CMPIObjectPath *op,
                     const char *resultClass, const char *role,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, invokeMethod, 136,
                 CMPIData (*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const CMPIObjectPath *op, const char *method,
                     const CMPIArgs *in, CMPIArgs *out, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerFT, setProperty, 144,
                 CMPIStatus (*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const CMPIObjectPath *op, const char *name,
                     const CMPIValue *value, CMPIType type));
TVR_CHECK_MEMBER(CMPIBrokerFT, getProperty, 152,
                 CMPIData (*)(const CMPIBroker *mb, const CMPIContext *ctx,
                     const CMPIObjectPath *op, const char *name,
                     CMPIStatus *rc));

// CMPIBrokerEncFT
static_assert(sizeof(CMPIBrokerEncFT) == 168, "CMPIBrokerEncFT size");
static_assert(alignof(CMPIBrokerEncFT) == 8, "CMPIBrokerEncFT alignment");
TVR_CHECK_MEMBER(CMPIBrokerEncFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newInstance, 8,
                 CMPIInstance *(*)(const CMPIBroker *mb,
                     const CMPIObjectPath *op, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newObjectPath, 16,
                 CMPIObjectPath *(*)(const CMPIBroker *mb, const char *ns,
                     const char *cn, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newArgs, 24,
                 CMPIArgs *(*)(const CMPIBroker *mb, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newString, 32,
                 CMPIString *(*)(const CMPIBroker *mb, const char *data,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newArray, 40,
                 CMPIArray *(*)(const CMPIBroker *mb, CMPICount max,
                     CMPIType type, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newDateTime, 48,
                 CMPIDateTime *(*)(const CMPIBroker *mb, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newDateTimeFromBinary, 56,
                 CMPIDateTime *(*)(const CMPIBroker *mb, CMPIUint64 binTime,
                     CMPIBoolean interval, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newDateTimeFromChars, 64,
                 CMPIDateTime *(*)(const CMPIBroker *mb, const char *utcTime,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newSelectExp, 72,
                 CMPISelectExp *(*)(const CMPIBroker *mb, const char *query,
                     const char *lang, CMPIArray **projection, CMPIStatus *st));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, classPathIsA, 80,
                 CMPIBoolean (*)(const CMPIBroker *mb, const CMPIObjectPath *op,
                     const char *type, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, toString, 88,
                 CMPIString *(*)(const CMPIBroker *mb, const void *object,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, isOfType, 96,
                 CMPIBoolean (*)(const CMPIBroker *mb, const void *object,
                     const char *type, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, getType, 104,
                 CMPIString *(*)(const CMPIBroker *mb, const void *object,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, getMessage, 112,
                 CMPIString *(*)(const CMPIBroker *mb, const char *msgId,
                     const char *defMsg, CMPIStatus *rc, CMPICount count, ...));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, logMessage, 120,
                 CMPIStatus (*)(const CMPIBroker *, int severity,
                     const char *id, const char *text,
                     const CMPIString *string));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, trace, 128,
                 CMPIStatus (*)(const CMPIBroker *, int level,
                     const char *component, const char *text,
                     const CMPIString *string));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, newCMPIError, 136,
                 CMPIError *(*)(const CMPIBroker *, const char *, const char *,
                     const char *, const CMPIErrorSeverity,
                     const CMPIErrorProbableCause, const CMPIrc,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, openMessageFile, 144,
                 CMPIStatus (*)(const CMPIBroker *mb, const char *msgFile,
                     CMPIMsgFileHandle *msgFileHandle));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, closeMessageFile, 152,
                 CMPIStatus (*)(const CMPIBroker *mb,
                     const CMPIMsgFileHandle msgFileHandle));
TVR_CHECK_MEMBER(CMPIBrokerEncFT, getMessage2, 160,
                 CMPIString *(*)(const CMPIBroker *mb, const char *msgId,
                     const CMPIMsgFileHandle msgFileHandle, const char *defMsg,
                     CMPIStatus *rc, CMPICount count, ...));

// CMPIBrokerExtFT
static_assert(sizeof(CMPIBrokerExtFT) == 168, "CMPIBrokerExtFT size");
static_assert(alignof(CMPIBrokerExtFT) == 8, "CMPIBrokerExtFT alignment");
TVR_CHECK_MEMBER(CMPIBrokerExtFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIBrokerExtFT, resolveFileName, 8,
                 char *(*)(const char *filename));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, newThread, 16,
                 void *(*)(void *(*start)(void *), void *parm, int detached));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, joinThread, 24,
                 int (*)(void *thread, void **retval));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, exitThread, 32, int (*)(void *return_code));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, cancelThread, 40, int (*)(void *thread));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, threadSleep, 48, int (*)(CMPIUint32 msec));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, threadOnce, 56,
                 int (*)(int *once, void (*init)(void)));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, createThreadKey, 64,
                 int (*)(unsigned long *key, void (*cleanup)(void *)));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, destroyThreadKey, 72,
                 int (*)(unsigned long key));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, getThreadSpecific, 80,
                 void *(*)(unsigned long key));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, setThreadSpecific, 88,
                 int (*)(unsigned long key, void *value));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, newMutex, 96, void *(*)(int opt));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, destroyMutex, 104, void (*)(void *));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, lockMutex, 112, void (*)(void *));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, unlockMutex, 120, void (*)(void *));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, newCondition, 128, void *(*)(int opt));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, destroyCondition, 136, void (*)(void *));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, condWait, 144,
                 int (*)(void *cond, void *mutex));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, timedCondWait, 152,
                 int (*)(void *cond, void *mutex, struct timespec *wait));
TVR_CHECK_MEMBER(CMPIBrokerExtFT, signalCondition, 160, int (*)(void *cond));

// CMPIBrokerMemFT
static_assert(sizeof(CMPIBrokerMemFT) == 120, "CMPIBrokerMemFT size");
static_assert(alignof(CMPIBrokerMemFT) == 8, "CMPIBrokerMemFT alignment");
TVR_CHECK_MEMBER(CMPIBrokerMemFT, ftVersion, 0, const int);
TVR_CHECK_MEMBER(CMPIBrokerMemFT, mark, 8,
                 CMPIGcStat *(*)(const CMPIBroker *mb, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, release, 16,
                 CMPIStatus (*)(const CMPIBroker *mb, const CMPIGcStat *gc));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, cmpiMalloc, 24,
                 void *(*)(const CMPIBroker *mb, size_t size));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, cmpiCalloc, 32,
                 void *(*)(const CMPIBroker *mb, size_t, size_t));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, cmpiRealloc, 40,
                 void *(*)(const CMPIBroker *mb, void *, size_t));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, cmpiStrDup, 48,
                 char *(*)(const CMPIBroker *mb, const char *));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, cmpiFree, 56,
                 void (*)(const CMPIBroker *mb, void *));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeInstance, 64,
                 void (*)(const CMPIBroker *mb, CMPIInstance *inst));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeObjectPath, 72,
                 void (*)(const CMPIBroker *mb, CMPIObjectPath *obj));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeArgs, 80,
                 void (*)(const CMPIBroker *mb, CMPIArgs *args));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeString, 88,
                 void (*)(const CMPIBroker *mb, CMPIString *str));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeArray, 96,
                 void (*)(const CMPIBroker *mb, CMPIArray *array));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeDateTime, 104,
                 void (*)(const CMPIBroker *mb, CMPIDateTime *date));
TVR_CHECK_MEMBER(CMPIBrokerMemFT, freeSelectExp, 112,
                 void (*)(const CMPIBroker *mb, CMPISelectExp *se));

// CMPIContextFT
static_assert(sizeof(CMPIContextFT) == 56, "CMPIContextFT size");
static_assert(alignof(CMPIContextFT) == 8, "CMPIContextFT alignment");
TVR_CHECK_MEMBER(CMPIContextFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIContextFT, release, 8, CMPIStatus (*)(CMPIContext *ctx));
TVR_CHECK_MEMBER(CMPIContextFT, clone, 16,
                 CMPIContext *(*)(const CMPIContext *ctx, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIContextFT, getEntry, 24,
                 CMPIData (*)(const CMPIContext *ctx, const char *name,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIContextFT, getEntryAt, 32,
                 CMPIData (*)(const CMPIContext *ctx, CMPICount index,
                     CMPIString **name, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIContextFT, getEntryCount, 40,
                 CMPICount (*)(const CMPIContext *ctx, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIContextFT, addEntry, 48,
                 CMPIStatus (*)(const CMPIContext *ctx, const char *name,
                     const CMPIValue *value, const CMPIType type));

// CMPIResultFT
static_assert(sizeof(CMPIResultFT) == 64, "CMPIResultFT size");
static_assert(alignof(CMPIResultFT) == 8, "CMPIResultFT alignment");
TVR_CHECK_MEMBER(CMPIResultFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIResultFT, release, 8, CMPIStatus (*)(CMPIResult *rslt));
TVR_CHECK_MEMBER(CMPIResultFT, clone, 16,
                 CMPIResult *(*)(const CMPIResult *rslt, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIResultFT, returnData, 24,
                 CMPIStatus (*)(const CMPIResult *rslt, const CMPIValue *value,
                     const CMPIType type));
TVR_CHECK_MEMBER(CMPIResultFT, returnInstance, 32,
                 CMPIStatus (*)(const CMPIResult *rslt,
                     const CMPIInstance *inst));
TVR_CHECK_MEMBER(CMPIResultFT, returnObjectPath, 40,
                 CMPIStatus (*)(const CMPIResult *rslt,
                     const CMPIObjectPath *ref));
TVR_CHECK_MEMBER(CMPIResultFT, returnDone, 48,
                 CMPIStatus (*)(const CMPIResult *rslt));
TVR_CHECK_MEMBER(CMPIResultFT, returnError, 56,
                 CMPIStatus (*)(const CMPIResult *rslt, const CMPIError *er));

// CMPIErrorFT
static_assert(sizeof(CMPIErrorFT) == 216, "CMPIErrorFT size");
static_assert(alignof(CMPIErrorFT) == 8, "CMPIErrorFT alignment");
TVR_CHECK_MEMBER(CMPIErrorFT, ftVersion, 0, CMPISint32);
TVR_CHECK_MEMBER(CMPIErrorFT, release, 8, CMPIStatus (*)(CMPIError *));
TVR_CHECK_MEMBER(CMPIErrorFT, clone, 16,
                 CMPIError *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getErrorType, 24,
                 CMPIErrorType (*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getOtherErrorType, 32,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getOwningEntity, 40,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getMessageID, 48,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getMessage, 56,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getPerceivedSeverity, 64,
                 CMPIErrorSeverity (*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getProbableCause, 72,
                 CMPIErrorProbableCause (*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getProbableCauseDescription, 80,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getRecommendedActions, 88,
                 CMPIArray *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getErrorSource, 96,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getErrorSourceFormat, 104,
                 CMPIErrorSrcFormat (*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getOtherErrorSourceFormat, 112,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getCIMStatusCode, 120,
                 CMPIrc (*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getCIMStatusCodeDescription, 128,
                 CMPIString *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, getMessageArguments, 136,
                 CMPIArray *(*)(const CMPIError *, CMPIStatus *));
TVR_CHECK_MEMBER(CMPIErrorFT, setErrorType, 144,
                 CMPIStatus (*)(CMPIError *, const CMPIErrorType));
TVR_CHECK_MEMBER(CMPIErrorFT, setOtherErrorType, 152,
                 CMPIStatus (*)(CMPIError *, const char *));
TVR_CHECK_MEMBER(CMPIErrorFT, setProbableCauseDescription, 160,
                 CMPIStatus (*)(CMPIError *, const char *));
TVR_CHECK_MEMBER(CMPIErrorFT, setRecommendedActions, 168,
                 CMPIStatus (*)(CMPIError *, const CMPIArray *));
TVR_CHECK_MEMBER(CMPIErrorFT, setErrorSource, 176,
                 CMPIStatus (*)(CMPIError *, const char *));
TVR_CHECK_MEMBER(CMPIErrorFT, setErrorSourceFormat, 184,
                 CMPIStatus (*)(CMPIError *, const CMPIErrorSrcFormat));
TVR_CHECK_MEMBER(CMPIErrorFT, setOtherErrorSourceFormat, 192,
                 CMPIStatus (*)(CMPIError *, const char *));
TVR_CHECK_MEMBER(CMPIErrorFT, setCIMStatusCodeDescription, 200,
                 CMPIStatus (*)(CMPIError *, const char *));
TVR_CHECK_MEMBER(CMPIErrorFT, setMessageArguments, 208,
                 CMPIStatus (*)(CMPIError *, CMPIArray *));

// CMPIInstanceFT
static_assert(sizeof(CMPIInstanceFT) == 88, "CMPIInstanceFT size");
static_assert(alignof(CMPIInstanceFT) == 8, "CMPIInstanceFT alignment");
TVR_CHECK_MEMBER(CMPIInstanceFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIInstanceFT, release, 8,
                 CMPIStatus (*)(CMPIInstance *inst));
TVR_CHECK_MEMBER(CMPIInstanceFT, clone, 16,
                 CMPIInstance *(*)(const CMPIInstance *inst, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIInstanceFT, getProperty, 24,
                 CMPIData (*)(const CMPIInstance *inst, const char *name,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIInstanceFT, getPropertyAt, 32,
                 CMPIData (*)(const CMPIInstance *inst, CMPICount index,
                     CMPIString **name, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIInstanceFT, getPropertyCount, 40,
                 CMPICount (*)(const CMPIInstance *inst, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIInstanceFT, setProperty, 48,
                 CMPIStatus (*)(const CMPIInstance *inst, const char *name,
                     const CMPIValue *value, CMPIType type));
TVR_CHECK_MEMBER(CMPIInstanceFT, getObjectPath, 56,
                 CMPIObjectPath *(*)(const CMPIInstance *inst, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIInstanceFT, setPropertyFilter, 64,
                 CMPIStatus (*)(CMPIInstance *inst, const char **propertyList,
                     const char **keys));
TVR_CHECK_MEMBER(CMPIInstanceFT, setObjectPath, 72,
                 CMPIStatus (*)(CMPIInstance *inst, const CMPIObjectPath *op));
TVR_CHECK_MEMBER(CMPIInstanceFT, setPropertyWithOrigin, 80,
                 CMPIStatus (*)(const CMPIInstance *, const char *,
                     const CMPIValue *, const CMPIType, const char *));

// CMPIObjectPathFT
static_assert(sizeof(CMPIObjectPathFT) == 160, "CMPIObjectPathFT size");
static_assert(alignof(CMPIObjectPathFT) == 8, "CMPIObjectPathFT alignment");
TVR_CHECK_MEMBER(CMPIObjectPathFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIObjectPathFT, release, 8,
                 CMPIStatus (*)(CMPIObjectPath *op));
TVR_CHECK_MEMBER(CMPIObjectPathFT, clone, 16,
                 CMPIObjectPath *(*)(const CMPIObjectPath *op, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, setNameSpace, 24,
                 CMPIStatus (*)(CMPIObjectPath *op, const char *ns));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getNameSpace, 32,
                 CMPIString *(*)(const CMPIObjectPath *op, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, setHostname, 40,
                 CMPIStatus (*)(CMPIObjectPath *op, const char *hn));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getHostname, 48,
                 CMPIString *(*)(const CMPIObjectPath *op, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, setClassName, 56,
                 CMPIStatus (*)(CMPIObjectPath *op, const char *cn));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getClassName, 64,
                 CMPIString *(*)(const CMPIObjectPath *op, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, addKey, 72,
                 CMPIStatus (*)(CMPIObjectPath *op, const char *name,
                     const CMPIValue *value, const CMPIType type));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getKey, 80,
                 CMPIData (*)(const CMPIObjectPath *op, const char *name,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getKeyAt, 88,
                 CMPIData (*)(const CMPIObjectPath *op, CMPICount index,
                     CMPIString **name, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getKeyCount, 96,
                 CMPICount (*)(const CMPIObjectPath *op, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, setNameSpaceFromObjectPath, 104,
                 CMPIStatus (*)(CMPIObjectPath *op, const CMPIObjectPath *src));
TVR_CHECK_MEMBER(CMPIObjectPathFT, setHostAndNameSpaceFromObjectPath, 112,
                 CMPIStatus (*)(CMPIObjectPath *op, const CMPIObjectPath *src));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getClassQualifier, 120,
                 CMPIData (*)(const CMPIObjectPath *op, const char *qName,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getPropertyQualifier, 128,
                 CMPIData (*)(const CMPIObjectPath *op, const char *pName,
                     const char *qName, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getMethodQualifier, 136,
                 CMPIData (*)(const CMPIObjectPath *op, const char *methodName,
                     const char *qName, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, getParameterQualifier, 144,
                 CMPIData (*)(const CMPIObjectPath *op, const char *mName,
                     const char *pName, const char *qName, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIObjectPathFT, toString, 152,
                 CMPIString *(*)(const CMPIObjectPath *op, CMPIStatus *rc));

// CMPISelectExpFT
static_assert(sizeof(CMPISelectExpFT) == 64, "CMPISelectExpFT size");
static_assert(alignof(CMPISelectExpFT) == 8, "CMPISelectExpFT alignment");
TVR_CHECK_MEMBER(CMPISelectExpFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPISelectExpFT, release, 8,
                 CMPIStatus (*)(CMPISelectExp *se));
TVR_CHECK_MEMBER(CMPISelectExpFT, clone, 16,
                 CMPISelectExp *(*)(const CMPISelectExp *se, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectExpFT, evaluate, 24,
                 CMPIBoolean (*)(const CMPISelectExp *se,
                     const CMPIInstance *inst, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectExpFT, getString, 32,
                 CMPIString *(*)(const CMPISelectExp *se, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectExpFT, getDOC, 40,
                 CMPISelectCond *(*)(const CMPISelectExp *se, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectExpFT, getCOD, 48,
                 CMPISelectCond *(*)(const CMPISelectExp *se, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectExpFT, evaluateUsingAccessor, 56,
                 CMPIBoolean (*)(const CMPISelectExp *se,
                     CMPIAccessor *accessor, void *parm, CMPIStatus *rc));

// CMPISelectCondFT
static_assert(sizeof(CMPISelectCondFT) == 40, "CMPISelectCondFT size");
static_assert(alignof(CMPISelectCondFT) == 8, "CMPISelectCondFT alignment");
TVR_CHECK_MEMBER(CMPISelectCondFT, ftVersion, 0, const int);
TVR_CHECK_MEMBER(CMPISelectCondFT, release, 8,
                 CMPIStatus (*)(CMPISelectCond *sc));
TVR_CHECK_MEMBER(CMPISelectCondFT, clone, 16,
                 CMPISelectCond *(*)(const CMPISelectCond *sc, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectCondFT, getCountAndType, 24,
                 CMPICount (*)(const CMPISelectCond *sc, int *type,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISelectCondFT, getSubCondAt, 32,
                 CMPISubCond *(*)(const CMPISelectCond *sc, CMPICount index,
                     CMPIStatus *rc));

// CMPISubCondFT
static_assert(sizeof(CMPISubCondFT) == 48, "CMPISubCondFT size");
static_assert(alignof(CMPISubCondFT) == 8, "CMPISubCondFT alignment");
TVR_CHECK_MEMBER(CMPISubCondFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPISubCondFT, release, 8, CMPIStatus (*)(CMPISubCond *sc));
TVR_CHECK_MEMBER(CMPISubCondFT, clone, 16,
                 CMPISubCond *(*)(const CMPISubCond *sc, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISubCondFT, getCount, 24,
                 CMPICount (*)(const CMPISubCond *sc, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISubCondFT, getPredicateAt, 32,
                 CMPIPredicate *(*)(const CMPISubCond *sc, CMPICount index,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPISubCondFT, getPredicate, 40,
                 CMPIPredicate *(*)(const CMPISubCond *sc, const char *name,
                     CMPIStatus *rc));

// CMPIPredicateFT
static_assert(sizeof(CMPIPredicateFT) == 40, "CMPIPredicateFT size");
static_assert(alignof(CMPIPredicateFT) == 8, "CMPIPredicateFT alignment");
TVR_CHECK_MEMBER(CMPIPredicateFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIPredicateFT, release, 8,
                 CMPIStatus (*)(CMPIPredicate *pr));
TVR_CHECK_MEMBER(CMPIPredicateFT, clone, 16,
                 CMPIPredicate *(*)(const CMPIPredicate *pr, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIPredicateFT, getData, 24,
                 CMPIStatus (*)(const CMPIPredicate *pr, CMPIType *type,
                     CMPIPredOp *op, CMPIString **lhs, CMPIString **rhs));
TVR_CHECK_MEMBER(CMPIPredicateFT, evaluateUsingAccessor, 32,
                 CMPIBoolean (*)(const CMPIPredicate *pr,
                     CMPIAccessor *accessorFnc, void *parm, CMPIStatus *rc));

// CMPIArgsFT
static_assert(sizeof(CMPIArgsFT) == 56, "CMPIArgsFT size");
static_assert(alignof(CMPIArgsFT) == 8, "CMPIArgsFT alignment");
TVR_CHECK_MEMBER(CMPIArgsFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIArgsFT, release, 8, CMPIStatus (*)(CMPIArgs *as));
TVR_CHECK_MEMBER(CMPIArgsFT, clone, 16,
                 CMPIArgs *(*)(const CMPIArgs *as, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArgsFT, addArg, 24,
                 CMPIStatus (*)(const CMPIArgs *as, const char *name,
                     const CMPIValue *value, const CMPIType type));
TVR_CHECK_MEMBER(CMPIArgsFT, getArg, 32,
                 CMPIData (*)(const CMPIArgs *as, const char *name,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArgsFT, getArgAt, 40,
                 CMPIData (*)(const CMPIArgs *as, CMPICount index,
                     CMPIString **name, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArgsFT, getArgCount, 48,
                 CMPICount (*)(const CMPIArgs *as, CMPIStatus *rc));

// CMPIStringFT
static_assert(sizeof(CMPIStringFT) == 32, "CMPIStringFT size");
static_assert(alignof(CMPIStringFT) == 8, "CMPIStringFT alignment");
TVR_CHECK_MEMBER(CMPIStringFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIStringFT, release, 8, CMPIStatus (*)(CMPIString *st));
TVR_CHECK_MEMBER(CMPIStringFT, clone, 16,
                 CMPIString *(*)(const CMPIString *st, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIStringFT, getCharPtr, 24,
                 const char *(*)(const CMPIString *st, CMPIStatus *rc));

// CMPIArrayFT
static_assert(sizeof(CMPIArrayFT) == 56, "CMPIArrayFT size");
static_assert(alignof(CMPIArrayFT) == 8, "CMPIArrayFT alignment");
TVR_CHECK_MEMBER(CMPIArrayFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIArrayFT, release, 8, CMPIStatus (*)(CMPIArray *ar));
TVR_CHECK_MEMBER(CMPIArrayFT, clone, 16,
                 CMPIArray *(*)(const CMPIArray *ar, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArrayFT, getSize, 24,
                 CMPICount (*)(const CMPIArray *ar, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArrayFT, getSimpleType, 32,
                 CMPIType (*)(const CMPIArray *ar, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArrayFT, getElementAt, 40,
                 CMPIData (*)(const CMPIArray *ar, CMPICount index,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIArrayFT, setElementAt, 48,
                 CMPIStatus (*)(CMPIArray *ar, CMPICount index,
                     const CMPIValue *value, CMPIType type));

// CMPIEnumerationFT
static_assert(sizeof(CMPIEnumerationFT) == 48, "CMPIEnumerationFT size");
static_assert(alignof(CMPIEnumerationFT) == 8, "CMPIEnumerationFT alignment");
TVR_CHECK_MEMBER(CMPIEnumerationFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIEnumerationFT, release, 8,
                 CMPIStatus (*)(CMPIEnumeration *en));
TVR_CHECK_MEMBER(CMPIEnumerationFT, clone, 16,
                 CMPIEnumeration *(*)(const CMPIEnumeration *en,
                     CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIEnumerationFT, getNext, 24,
                 CMPIData (*)(const CMPIEnumeration *en, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIEnumerationFT, hasNext, 32,
                 CMPIBoolean (*)(const CMPIEnumeration *en, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIEnumerationFT, toArray, 40,
                 CMPIArray *(*)(const CMPIEnumeration *en, CMPIStatus *rc));

// CMPIDateTimeFT
static_assert(sizeof(CMPIDateTimeFT) == 48, "CMPIDateTimeFT size");
static_assert(alignof(CMPIDateTimeFT) == 8, "CMPIDateTimeFT alignment");
TVR_CHECK_MEMBER(CMPIDateTimeFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIDateTimeFT, release, 8, CMPIStatus (*)(CMPIDateTime *dt));
TVR_CHECK_MEMBER(CMPIDateTimeFT, clone, 16,
                 CMPIDateTime *(*)(const CMPIDateTime *dt, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIDateTimeFT, getBinaryFormat, 24,
                 CMPIUint64 (*)(const CMPIDateTime *dt, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIDateTimeFT, getStringFormat, 32,
                 CMPIString *(*)(const CMPIDateTime *dt, CMPIStatus *rc));
TVR_CHECK_MEMBER(CMPIDateTimeFT, isInterval, 40,
                 CMPIBoolean (*)(const CMPIDateTime *dt, CMPIStatus *rc));

// CMPIInstanceMIFT
static_assert(sizeof(CMPIInstanceMIFT) == 80, "CMPIInstanceMIFT size");
static_assert(alignof(CMPIInstanceMIFT) == 8, "CMPIInstanceMIFT alignment");
TVR_CHECK_MEMBER(CMPIInstanceMIFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIInstanceMIFT, miVersion, 4, int);
TVR_CHECK_MEMBER(CMPIInstanceMIFT, miName, 8, const char *);
TVR_CHECK_MEMBER(CMPIInstanceMIFT, cleanup, 16,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     CMPIBoolean terminating));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, enumerateInstanceNames, 24,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, enumerateInstances, 32,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char **properties));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, getInstance, 40,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char **properties));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, createInstance, 48,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const CMPIInstance *inst));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, modifyInstance, 56,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const CMPIInstance *inst, const char **properties));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, deleteInstance, 64,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op));
TVR_CHECK_MEMBER(CMPIInstanceMIFT, execQuery, 72,
                 CMPIStatus (*)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *query, const char *lang));

// CMPIAssociationMIFT
static_assert(sizeof(CMPIAssociationMIFT) == 56, "CMPIAssociationMIFT size");
static_assert(alignof(CMPIAssociationMIFT) == 8,
              "CMPIAssociationMIFT alignment");
TVR_CHECK_MEMBER(CMPIAssociationMIFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIAssociationMIFT, miVersion, 4, const CMPISint32);
TVR_CHECK_MEMBER(CMPIAssociationMIFT, miName, 8, const char *);
TVR_CHECK_MEMBER(CMPIAssociationMIFT, cleanup, 16,
                 CMPIStatus (*)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                     CMPIBoolean terminating));
TVR_CHECK_MEMBER(CMPIAssociationMIFT, associators, 24,
                 CMPIStatus (*)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *asscClass, const char *resultClass,
                     const char *role, const char *resultRole,
                     const char **properties));
TVR_CHECK_MEMBER(CMPIAssociationMIFT, associatorNames, 32,
                 CMPIStatus (*)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *assocClass, const char *resultClass,
                     const char *role, const char *resultRole));
TVR_CHECK_MEMBER(CMPIAssociationMIFT, references, 40,
                 CMPIStatus (*)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *resultClass, const char *role,
                     const char **properties));
TVR_CHECK_MEMBER(CMPIAssociationMIFT, referenceNames, 48,
                 CMPIStatus (*)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *resultClass, const char *role));

// CMPIMethodMIFT
static_assert(sizeof(CMPIMethodMIFT) == 32, "CMPIMethodMIFT size");
static_assert(alignof(CMPIMethodMIFT) == 8, "CMPIMethodMIFT alignment");
TVR_CHECK_MEMBER(CMPIMethodMIFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIMethodMIFT, miVersion, 4, int);
TVR_CHECK_MEMBER(CMPIMethodMIFT, miName, 8, const char *);
TVR_CHECK_MEMBER(CMPIMethodMIFT, cleanup, 16,
                 CMPIStatus (*)(CMPIMethodMI *mi, const CMPIContext *ctx,
                     CMPIBoolean terminating));
TVR_CHECK_MEMBER(CMPIMethodMIFT, invokeMethod, 24,
                 CMPIStatus (*)(CMPIMethodMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *method, const CMPIArgs *in, CMPIArgs *out));

// CMPIPropertyMIFT
static_assert(sizeof(CMPIPropertyMIFT) == 48, "CMPIPropertyMIFT size");
static_assert(alignof(CMPIPropertyMIFT) == 8, "CMPIPropertyMIFT alignment");
TVR_CHECK_MEMBER(CMPIPropertyMIFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIPropertyMIFT, miVersion, 4, int);
TVR_CHECK_MEMBER(CMPIPropertyMIFT, miName, 8, const char *);
TVR_CHECK_MEMBER(CMPIPropertyMIFT, cleanup, 16,
                 CMPIStatus (*)(CMPIPropertyMI *mi, const CMPIContext *ctx,
                     CMPIBoolean terminating));
TVR_CHECK_MEMBER(CMPIPropertyMIFT, setProperty, 24,
                 CMPIStatus (*)(CMPIPropertyMI *mi, const CMPIContext *ctx,
                     const CMPIResult *rslt, const CMPIObjectPath *op,
                     const char *name, const CMPIData data));
TVR_CHECK_MEMBER(CMPIPropertyMIFT, getProperty, 32,
                 CMPIStatus (*)(CMPIPropertyMI *, const CMPIContext *,
                     const CMPIResult *, const CMPIObjectPath *,
                     const char *name));
TVR_CHECK_MEMBER(CMPIPropertyMIFT, setPropertyWithOrigin, 40,
                 CMPIStatus (*)(CMPIPropertyMI *, const CMPIContext *,
                     const CMPIResult *, CMPIObjectPath *op, const char *name,
                     const CMPIData data, const char *));

// CMPIIndicationMIFT
static_assert(sizeof(CMPIIndicationMIFT) == 72, "CMPIIndicationMIFT size");
static_assert(alignof(CMPIIndicationMIFT) == 8, "CMPIIndicationMIFT alignment");
TVR_CHECK_MEMBER(CMPIIndicationMIFT, ftVersion, 0, int);
TVR_CHECK_MEMBER(CMPIIndicationMIFT, miVersion, 4, int);
TVR_CHECK_MEMBER(CMPIIndicationMIFT, miName, 8, const char *);
TVR_CHECK_MEMBER(CMPIIndicationMIFT, cleanup, 16,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                     CMPIBoolean terminating));
TVR_CHECK_MEMBER(CMPIIndicationMIFT, authorizeFilter, 24,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                     const CMPISelectExp *filter, const char *className,
                     const CMPIObjectPath *op, const char *owner));
TVR_CHECK_MEMBER(CMPIIndicationMIFT, mustPoll, 32,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                     const CMPISelectExp *filter, const char *className,
                     const CMPIObjectPath *classPath));
TVR_CHECK_MEMBER(CMPIIndicationMIFT, activateFilter, 40,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                     const CMPISelectExp *filter, const char *className,
                     const CMPIObjectPath *classPath,
                     CMPIBoolean firstActivation));
TVR_CHECK_MEMBER(CMPIIndicationMIFT, deActivateFilter, 48,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                     const CMPISelectExp *filter, const char *className,
                     const CMPIObjectPath *classPath,
                     CMPIBoolean lastActiviation));
TVR_CHECK_MEMBER(CMPIIndicationMIFT, enableIndications, 56,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *));
TVR_CHECK_MEMBER(CMPIIndicationMIFT, disableIndications, 64,
                 CMPIStatus (*)(CMPIIndicationMI *mi, const CMPIContext *));


// ---------------------------------------------------------------------------
// Data structures
// ---------------------------------------------------------------------------

static_assert(sizeof(CMPIValuePtr) == 16 && alignof(CMPIValuePtr) == 8,
              "CMPIValuePtr size");
TVR_CHECK_MEMBER(CMPIValuePtr, ptr, 0, void *);
TVR_CHECK_MEMBER(CMPIValuePtr, length, 8, CMPICount);

static_assert(sizeof(CMPIValue) == 16 && alignof(CMPIValue) == 8,
              "CMPIValue size");
TVR_CHECK_MEMBER(CMPIValue, uint64, 0, CMPIUint64);
TVR_CHECK_MEMBER(CMPIValue, uint32, 0, CMPIUint32);
TVR_CHECK_MEMBER(CMPIValue, uint16, 0, CMPIUint16);
TVR_CHECK_MEMBER(CMPIValue, uint8, 0, CMPIUint8);
TVR_CHECK_MEMBER(CMPIValue, sint64, 0, CMPISint64);
TVR_CHECK_MEMBER(CMPIValue, sint32, 0, CMPISint32);
TVR_CHECK_MEMBER(CMPIValue, sint16, 0, CMPISint16);
TVR_CHECK_MEMBER(CMPIValue, sint8, 0, CMPISint8);
TVR_CHECK_MEMBER(CMPIValue, real64, 0, CMPIReal64);
TVR_CHECK_MEMBER(CMPIValue, real32, 0, CMPIReal32);
TVR_CHECK_MEMBER(CMPIValue, boolean, 0, CMPIBoolean);
TVR_CHECK_MEMBER(CMPIValue, char16, 0, CMPIChar16);
TVR_CHECK_MEMBER(CMPIValue, inst, 0, CMPIInstance *);
TVR_CHECK_MEMBER(CMPIValue, ref, 0, CMPIObjectPath *);
TVR_CHECK_MEMBER(CMPIValue, args, 0, CMPIArgs *);
TVR_CHECK_MEMBER(CMPIValue, filter, 0, CMPISelectExp *);
TVR_CHECK_MEMBER(CMPIValue, Enum, 0, CMPIEnumeration *);
TVR_CHECK_MEMBER(CMPIValue, array, 0, CMPIArray *);
TVR_CHECK_MEMBER(CMPIValue, string, 0, CMPIString *);
TVR_CHECK_MEMBER(CMPIValue, chars, 0, char *);
TVR_CHECK_MEMBER(CMPIValue, dateTime, 0, CMPIDateTime *);
TVR_CHECK_MEMBER(CMPIValue, dataPtr, 0, CMPIValuePtr);
TVR_CHECK_MEMBER(CMPIValue, Byte, 0, CMPISint8);
TVR_CHECK_MEMBER(CMPIValue, Short, 0, CMPISint16);
TVR_CHECK_MEMBER(CMPIValue, Int, 0, CMPISint32);
TVR_CHECK_MEMBER(CMPIValue, Long, 0, CMPISint64);
TVR_CHECK_MEMBER(CMPIValue, Float, 0, CMPIReal32);
TVR_CHECK_MEMBER(CMPIValue, Double, 0, CMPIReal64);

static_assert(sizeof(CMPIData) == 24 && alignof(CMPIData) == 8,
              "CMPIData size");
TVR_CHECK_MEMBER(CMPIData, type, 0, CMPIType);
TVR_CHECK_MEMBER(CMPIData, state, 2, CMPIValueState);
TVR_CHECK_MEMBER(CMPIData, value, 8, CMPIValue);

static_assert(sizeof(CMPIStatus) == 16 && alignof(CMPIStatus) == 8,
              "CMPIStatus size");
TVR_CHECK_MEMBER(CMPIStatus, rc, 0, CMPIrc);
TVR_CHECK_MEMBER(CMPIStatus, msg, 8, CMPIString *);

// Passed and returned in registers / by hidden pointer only while they stay
// trivially copyable plain aggregates.
static_assert(std::is_trivially_copyable<CMPIValue>::value &&
                  std::is_trivially_copyable<CMPIData>::value &&
                  std::is_trivially_copyable<CMPIStatus>::value &&
                  std::is_trivially_copyable<CMPIValuePtr>::value,
              "value types stay trivially copyable");
static_assert(std::is_standard_layout<CMPIData>::value &&
                  std::is_standard_layout<CMPIStatus>::value,
              "value types stay standard layout");

// ---------------------------------------------------------------------------
// Encapsulated objects: {hdl, ft}, 16 bytes each
// ---------------------------------------------------------------------------

#define TVR_CHECK_HANDLE(Handle, HdlType)                                      \
  static_assert(sizeof(Handle) == 16 && alignof(Handle) == 8,                  \
                #Handle " size");                                              \
  TVR_CHECK_MEMBER(Handle, hdl, 0, HdlType);                                   \
  TVR_CHECK_MEMBER(Handle, ft, 8, Handle##FT *)

TVR_CHECK_HANDLE(CMPIContext, void *);
TVR_CHECK_HANDLE(CMPIResult, void *);
TVR_CHECK_HANDLE(CMPIInstance, void *);
TVR_CHECK_HANDLE(CMPIObjectPath, void *);
TVR_CHECK_HANDLE(CMPIString, void *);
TVR_CHECK_HANDLE(CMPIArray, void *);
TVR_CHECK_HANDLE(CMPIEnumeration, void *);
TVR_CHECK_HANDLE(CMPIArgs, void *);
TVR_CHECK_HANDLE(CMPIDateTime, void *);
TVR_CHECK_HANDLE(CMPISelectExp, void *);
TVR_CHECK_HANDLE(CMPISelectCond, void *);
TVR_CHECK_HANDLE(CMPISubCond, void *);
TVR_CHECK_HANDLE(CMPIPredicate, void *);
TVR_CHECK_HANDLE(CMPIError, void *);
// Only the instance MI object has a pointer-to-const hdl.
TVR_CHECK_HANDLE(CMPIInstanceMI, const void *);
TVR_CHECK_HANDLE(CMPIAssociationMI, void *);
TVR_CHECK_HANDLE(CMPIMethodMI, void *);
TVR_CHECK_HANDLE(CMPIPropertyMI, void *);
TVR_CHECK_HANDLE(CMPIIndicationMI, void *);

static_assert(sizeof(CMPIBroker) == 40 && alignof(CMPIBroker) == 8,
              "CMPIBroker size");
TVR_CHECK_MEMBER(CMPIBroker, hdl, 0, void *);
TVR_CHECK_MEMBER(CMPIBroker, bft, 8, CMPIBrokerFT *);
TVR_CHECK_MEMBER(CMPIBroker, eft, 16, CMPIBrokerEncFT *);
TVR_CHECK_MEMBER(CMPIBroker, xft, 24, CMPIBrokerExtFT *);
TVR_CHECK_MEMBER(CMPIBroker, mft, 32, CMPIBrokerMemFT *);

// ---------------------------------------------------------------------------
// Convenience macros: every macro of a 2.0 build exists, and none of those
// that a 2.0 build leaves out
// ---------------------------------------------------------------------------

#ifndef CMReturn
#error "CMReturn is missing"
#endif
#ifndef CMReturnWithString
#error "CMReturnWithString is missing"
#endif
#ifndef CMReturnWithChars
#error "CMReturnWithChars is missing"
#endif
#ifndef CMSetStatus
#error "CMSetStatus is missing"
#endif
#ifndef CMSetStatusWithString
#error "CMSetStatusWithString is missing"
#endif
#ifndef CMSetStatusWithChars
#error "CMSetStatusWithChars is missing"
#endif
#ifndef CMIsNullObject
#error "CMIsNullObject is missing"
#endif
#ifndef CMIsNullValue
#error "CMIsNullValue is missing"
#endif
#ifndef CMIsKeyValue
#error "CMIsKeyValue is missing"
#endif
#ifndef CMIsArray
#error "CMIsArray is missing"
#endif
#ifndef CMClone
#error "CMClone is missing"
#endif
#ifndef CMRelease
#error "CMRelease is missing"
#endif
#ifndef CMNewInstance
#error "CMNewInstance is missing"
#endif
#ifndef CMNewObjectPath
#error "CMNewObjectPath is missing"
#endif
#ifndef CMNewString
#error "CMNewString is missing"
#endif
#ifndef CMNewArgs
#error "CMNewArgs is missing"
#endif
#ifndef CMNewArray
#error "CMNewArray is missing"
#endif
#ifndef CMNewDateTime
#error "CMNewDateTime is missing"
#endif
#ifndef CMNewDateTimeFromBinary
#error "CMNewDateTimeFromBinary is missing"
#endif
#ifndef CMNewDateTimeFromChars
#error "CMNewDateTimeFromChars is missing"
#endif
#ifndef CMNewSelectExp
#error "CMNewSelectExp is missing"
#endif
#ifndef CMClassPathIsA
#error "CMClassPathIsA is missing"
#endif
#ifndef CDToString
#error "CDToString is missing"
#endif
#ifndef CDIsOfType
#error "CDIsOfType is missing"
#endif
#ifndef CDGetType
#error "CDGetType is missing"
#endif
#ifndef CMLogMessage
#error "CMLogMessage is missing"
#endif
#ifndef CMTraceMessage
#error "CMTraceMessage is missing"
#endif
#ifndef CMNewCMPIError
#error "CMNewCMPIError is missing"
#endif
#ifndef CMOpenMessageFile
#error "CMOpenMessageFile is missing"
#endif
#ifndef CMCloseMessageFile
#error "CMCloseMessageFile is missing"
#endif
#ifndef CMGetMessage2
#error "CMGetMessage2 is missing"
#endif
#ifndef CMGetProperty
#error "CMGetProperty is missing"
#endif
#ifndef CMGetPropertyAt
#error "CMGetPropertyAt is missing"
#endif
#ifndef CMSetProperty
#error "CMSetProperty is missing"
#endif
#ifndef CMGetPropertyCount
#error "CMGetPropertyCount is missing"
#endif
#ifndef CMGetObjectPath
#error "CMGetObjectPath is missing"
#endif
#ifndef CMSetObjectPath
#error "CMSetObjectPath is missing"
#endif
#ifndef CMSetPropertyFilter
#error "CMSetPropertyFilter is missing"
#endif
#ifndef CMSetPropertyWithOrigin
#error "CMSetPropertyWithOrigin is missing"
#endif
#ifndef CMSetHostname
#error "CMSetHostname is missing"
#endif
#ifndef CMGetHostname
#error "CMGetHostname is missing"
#endif
#ifndef CMSetNameSpace
#error "CMSetNameSpace is missing"
#endif
#ifndef CMGetNameSpace
#error "CMGetNameSpace is missing"
#endif
#ifndef CMSetClassName
#error "CMSetClassName is missing"
#endif
#ifndef CMGetClassName
#error "CMGetClassName is missing"
#endif
#ifndef CMAddKey
#error "CMAddKey is missing"
#endif
#ifndef CMGetKey
#error "CMGetKey is missing"
#endif
#ifndef CMGetKeyAt
#error "CMGetKeyAt is missing"
#endif
#ifndef CMGetKeyCount
#error "CMGetKeyCount is missing"
#endif
#ifndef CMSetNameSpaceFromObjectPath
#error "CMSetNameSpaceFromObjectPath is missing"
#endif
#ifndef CMSetHostAndNameSpaceFromObjectPath
#error "CMSetHostAndNameSpaceFromObjectPath is missing"
#endif
#ifndef CMGetClassQualifier
#error "CMGetClassQualifier is missing"
#endif
#ifndef CMGetPropertyQualifier
#error "CMGetPropertyQualifier is missing"
#endif
#ifndef CMGetMethodQualifier
#error "CMGetMethodQualifier is missing"
#endif
#ifndef CMGetParameterQualifier
#error "CMGetParameterQualifier is missing"
#endif
#ifndef CMGetArrayCount
#error "CMGetArrayCount is missing"
#endif
#ifndef CMGetArrayType
#error "CMGetArrayType is missing"
#endif
#ifndef CMGetArrayElementAt
#error "CMGetArrayElementAt is missing"
#endif
#ifndef CMSetArrayElementAt
#error "CMSetArrayElementAt is missing"
#endif
#ifndef CMAddArg
#error "CMAddArg is missing"
#endif
#ifndef CMGetArg
#error "CMGetArg is missing"
#endif
#ifndef CMGetArgAt
#error "CMGetArgAt is missing"
#endif
#ifndef CMGetArgCount
#error "CMGetArgCount is missing"
#endif
#ifndef CMGetCharPtr
#error "CMGetCharPtr is missing"
#endif
#ifndef CMGetCharsPtr
#error "CMGetCharsPtr is missing"
#endif
#ifndef CMGetStringFormat
#error "CMGetStringFormat is missing"
#endif
#ifndef CMGetBinaryFormat
#error "CMGetBinaryFormat is missing"
#endif
#ifndef CMIsInterval
#error "CMIsInterval is missing"
#endif
#ifndef CMGetNext
#error "CMGetNext is missing"
#endif
#ifndef CMHasNext
#error "CMHasNext is missing"
#endif
#ifndef CMToArray
#error "CMToArray is missing"
#endif
#ifndef CMReturnData
#error "CMReturnData is missing"
#endif
#ifndef CMReturnInstance
#error "CMReturnInstance is missing"
#endif
#ifndef CMReturnObjectPath
#error "CMReturnObjectPath is missing"
#endif
#ifndef CMReturnDone
#error "CMReturnDone is missing"
#endif
#ifndef CMReturnError
#error "CMReturnError is missing"
#endif
#ifndef CMGetContextEntry
#error "CMGetContextEntry is missing"
#endif
#ifndef CMGetContextEntryAt
#error "CMGetContextEntryAt is missing"
#endif
#ifndef CMGetContextEntryCount
#error "CMGetContextEntryCount is missing"
#endif
#ifndef CMAddContextEntry
#error "CMAddContextEntry is missing"
#endif
#ifndef CMGetSelExpString
#error "CMGetSelExpString is missing"
#endif
#ifndef CMEvaluateSelExp
#error "CMEvaluateSelExp is missing"
#endif
#ifndef CMGetDoc
#error "CMGetDoc is missing"
#endif
#ifndef CMGetCod
#error "CMGetCod is missing"
#endif
#ifndef CMGetSubCondCountAndType
#error "CMGetSubCondCountAndType is missing"
#endif
#ifndef CMGetSubCondAt
#error "CMGetSubCondAt is missing"
#endif
#ifndef CMGetPredicateCount
#error "CMGetPredicateCount is missing"
#endif
#ifndef CMGetPredicateAt
#error "CMGetPredicateAt is missing"
#endif
#ifndef CMGetPredicate
#error "CMGetPredicate is missing"
#endif
#ifndef CMGetPredicateData
#error "CMGetPredicateData is missing"
#endif
#ifndef CMEvaluatePredicateUsingAccessor
#error "CMEvaluatePredicateUsingAccessor is missing"
#endif
#ifndef CMGetErrorType
#error "CMGetErrorType is missing"
#endif
#ifndef CMGetOtherErrorType
#error "CMGetOtherErrorType is missing"
#endif
#ifndef CMGetOwningEntity
#error "CMGetOwningEntity is missing"
#endif
#ifndef CMGetMessageID
#error "CMGetMessageID is missing"
#endif
#ifndef CMGetErrorMessage
#error "CMGetErrorMessage is missing"
#endif
#ifndef CMGetPerceivedSeverity
#error "CMGetPerceivedSeverity is missing"
#endif
#ifndef CMGetProbableCause
#error "CMGetProbableCause is missing"
#endif
#ifndef CMGetProbableCauseDescription
#error "CMGetProbableCauseDescription is missing"
#endif
#ifndef CMGetRecommendedActions
#error "CMGetRecommendedActions is missing"
#endif
#ifndef CMGetErrorSource
#error "CMGetErrorSource is missing"
#endif
#ifndef CMGetErrorSourceFormat
#error "CMGetErrorSourceFormat is missing"
#endif
#ifndef CMGetOtherErrorSourceFormat
#error "CMGetOtherErrorSourceFormat is missing"
#endif
#ifndef CMGetCIMStatusCode
#error "CMGetCIMStatusCode is missing"
#endif
#ifndef CMGetCIMStatusCodeDescription
#error "CMGetCIMStatusCodeDescription is missing"
#endif
#ifndef CMGetMessageArguments
#error "CMGetMessageArguments is missing"
#endif
#ifndef CMSetErrorType
#error "CMSetErrorType is missing"
#endif
#ifndef CMSetOtherErrorType
#error "CMSetOtherErrorType is missing"
#endif
#ifndef CMSetProbableCauseDescription
#error "CMSetProbableCauseDescription is missing"
#endif
#ifndef CMSetRecommendedActions
#error "CMSetRecommendedActions is missing"
#endif
#ifndef CMSetErrorSource
#error "CMSetErrorSource is missing"
#endif
#ifndef CMSetErrorSourceFormat
#error "CMSetErrorSourceFormat is missing"
#endif
#ifndef CMSetOtherErrorSourceFormat
#error "CMSetOtherErrorSourceFormat is missing"
#endif
#ifndef CMSetCIMStatusCodeDescription
#error "CMSetCIMStatusCodeDescription is missing"
#endif
#ifndef CMSetMessageArguments
#error "CMSetMessageArguments is missing"
#endif
#ifndef CBGetClassification
#error "CBGetClassification is missing"
#endif
#ifndef CBBrokerVersion
#error "CBBrokerVersion is missing"
#endif
#ifndef CBBrokerName
#error "CBBrokerName is missing"
#endif
#ifndef CBPrepareAttachThread
#error "CBPrepareAttachThread is missing"
#endif
#ifndef CBAttachThread
#error "CBAttachThread is missing"
#endif
#ifndef CBDetachThread
#error "CBDetachThread is missing"
#endif
#ifndef CBDeliverIndication
#error "CBDeliverIndication is missing"
#endif
#ifndef CBEnumInstanceNames
#error "CBEnumInstanceNames is missing"
#endif
#ifndef CBEnumInstances
#error "CBEnumInstances is missing"
#endif
#ifndef CBGetInstance
#error "CBGetInstance is missing"
#endif
#ifndef CBCreateInstance
#error "CBCreateInstance is missing"
#endif
#ifndef CBSetInstance
#error "CBSetInstance is missing"
#endif
#ifndef CBDeleteInstance
#error "CBDeleteInstance is missing"
#endif
#ifndef CBExecQuery
#error "CBExecQuery is missing"
#endif
#ifndef CBAssociators
#error "CBAssociators is missing"
#endif
#ifndef CBAssociatorNames
#error "CBAssociatorNames is missing"
#endif
#ifndef CBReferences
#error "CBReferences is missing"
#endif
#ifndef CBReferenceNames
#error "CBReferenceNames is missing"
#endif
#ifndef CBInvokeMethod
#error "CBInvokeMethod is missing"
#endif
#ifndef CBSetProperty
#error "CBSetProperty is missing"
#endif
#ifndef CBGetProperty
#error "CBGetProperty is missing"
#endif

#ifdef CMGetMessage
#error "CMGetMessage must not be defined in a 2.0 build"
#endif
#ifdef CMFmtArgs0
#error "CMFmtArgs0 must not be defined in a 2.0 build"
#endif
#ifdef CMFmtArgs10
#error "CMFmtArgs10 must not be defined in a 2.0 build"
#endif
#ifdef CMFmtSint
#error "CMFmtSint must not be defined in a 2.0 build"
#endif
#ifdef CMFmtUint
#error "CMFmtUint must not be defined in a 2.0 build"
#endif
#ifdef CMFmtSint64
#error "CMFmtSint64 must not be defined in a 2.0 build"
#endif
#ifdef CMFmtUint64
#error "CMFmtUint64 must not be defined in a 2.0 build"
#endif
#ifdef CMFmtReal
#error "CMFmtReal must not be defined in a 2.0 build"
#endif
#ifdef CMFmtBoolean
#error "CMFmtBoolean must not be defined in a 2.0 build"
#endif
#ifdef CMFmtChars
#error "CMFmtChars must not be defined in a 2.0 build"
#endif
#ifdef CMFmtString
#error "CMFmtString must not be defined in a 2.0 build"
#endif
#ifdef CMObjectPathToString
#error "CMObjectPathToString must not be defined in a 2.0 build"
#endif
#ifdef CMEvaluateSelExpUsingAccessor
#error "CMEvaluateSelExpUsingAccessor must not be defined in a 2.0 build"
#endif
#ifdef CMEvaluatePredicate
#error "CMEvaluatePredicate must not be defined in a 2.0 build"
#endif
#ifdef CBModifyInstance
#error "CBModifyInstance must not be defined in a 2.0 build"
#endif

// ---------------------------------------------------------------------------
// C and C++ see the same layout
// ---------------------------------------------------------------------------

struct LayoutProbe {
  const char *expression;
  std::size_t value;
};

const LayoutProbe kCxxLayout[] = {
#define TVR_CMPI_PROBE(expr) {#expr, expr},
#include "abi_layout_probes.def"
#undef TVR_CMPI_PROBE
};

TEST(CmpiAbiLayout, CAndCxxMeasureTheSameNumberOfLayoutFacts) {
  EXPECT_EQ(tvr_cmpi_c_layout_count(),
            sizeof(kCxxLayout) / sizeof(kCxxLayout[0]));
}

TEST(CmpiAbiLayout, CSeesTheSameSizesAndOffsetsAsCxx) {
  const std::size_t count = sizeof(kCxxLayout) / sizeof(kCxxLayout[0]);
  ASSERT_EQ(tvr_cmpi_c_layout_count(), count);
  for (std::size_t i = 0; i < count; ++i) {
    const TvrCmpiLayoutProbe &c = tvr_cmpi_c_layout()[i];
    EXPECT_EQ(std::string(c.expression), kCxxLayout[i].expression);
    EXPECT_EQ(c.value, kCxxLayout[i].value) << kCxxLayout[i].expression;
  }
}

} // namespace
