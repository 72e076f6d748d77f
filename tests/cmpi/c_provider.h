// A provider written in C (c_provider.c), for checking that the headers and
// the stub macros work for C providers too.

#ifndef TVR_TESTS_CMPI_C_PROVIDER_H
#define TVR_TESTS_CMPI_C_PROVIDER_H

#include <cmpift.h>

#ifdef __cplusplus
extern "C" {
#endif

/// The broker variable the C provider's stubs assign.
const CMPIBroker *tvr_c_provider_broker(void);

#ifdef __cplusplus
}
#endif

#endif // TVR_TESTS_CMPI_C_PROVIDER_H
