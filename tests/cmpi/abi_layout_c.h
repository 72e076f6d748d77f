// Layout facts of the CMPI headers as measured by the C compiler.

#ifndef TVR_TESTS_CMPI_ABI_LAYOUT_C_H
#define TVR_TESTS_CMPI_ABI_LAYOUT_C_H

#include <stddef.h>

#ifdef __cplusplus
extern "C" {
#endif

/// One measured fact: the expression's text and its value.
typedef struct TvrCmpiLayoutProbe {
  const char *expression;
  size_t value;
} TvrCmpiLayoutProbe;

/// The facts of abi_layout_probes.def, in file order, evaluated by gcc.
const TvrCmpiLayoutProbe *tvr_cmpi_c_layout(void);
/// Number of entries behind tvr_cmpi_c_layout().
size_t tvr_cmpi_c_layout_count(void);

#ifdef __cplusplus
}
#endif

#endif // TVR_TESTS_CMPI_ABI_LAYOUT_C_H
