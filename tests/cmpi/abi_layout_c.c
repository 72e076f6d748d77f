// The CMPI headers compiled as C: a few sizes pinned at compile time, and
// the layout facts of abi_layout_probes.def measured for comparison with
// the C++ view (abi_layout_test.cpp).

#include <cmpift.h>

#ifndef TVR_CMPI_CMPIFT_H
#error "the layout checks must see the project's own CMPI headers first"
#endif

#include "abi_layout_c.h"

#include <stddef.h>

_Static_assert(sizeof(CMPIValue) == 16, "CMPIValue size");
_Static_assert(sizeof(CMPIData) == 24, "CMPIData size");
_Static_assert(offsetof(CMPIData, value) == 8, "CMPIData.value offset");
_Static_assert(sizeof(CMPIStatus) == 16, "CMPIStatus size");
_Static_assert(offsetof(CMPIStatus, msg) == 8, "CMPIStatus.msg offset");
_Static_assert(sizeof(CMPIrc) == 4, "CMPIrc size");
_Static_assert(sizeof(CMPIBroker) == 40, "CMPIBroker size");
_Static_assert(sizeof(CMPIInstance) == 16, "CMPIInstance size");
_Static_assert(sizeof(CMPIBrokerFT) == 160, "CMPIBrokerFT size");
_Static_assert(sizeof(CMPIBrokerEncFT) == 168, "CMPIBrokerEncFT size");
_Static_assert(sizeof(CMPIBrokerExtFT) == 168, "CMPIBrokerExtFT size");
_Static_assert(sizeof(CMPIInstanceMIFT) == 80, "CMPIInstanceMIFT size");
_Static_assert(offsetof(CMPIInstanceMIFT, execQuery) == 72,
               "CMPIInstanceMIFT.execQuery offset");
_Static_assert(sizeof(CMPIAssociationMIFT) == 56, "CMPIAssociationMIFT size");
_Static_assert(sizeof(CMPI_THREAD_KEY_TYPE) == 8, "thread key size");
_Static_assert(CMPICurrentVersion == 200, "a default build is level 200");

static const TvrCmpiLayoutProbe kCLayout[] = {
#define TVR_CMPI_PROBE(expr) {#expr, expr},
#include "abi_layout_probes.def"
#undef TVR_CMPI_PROBE
};

const TvrCmpiLayoutProbe *tvr_cmpi_c_layout(void) { return kCLayout; }

size_t tvr_cmpi_c_layout_count(void) {
  return sizeof(kCLayout) / sizeof(kCLayout[0]);
}
