/* Copyright (c) 2026 TVR. CMPI 2.0 interface declarations. */

/// \file
/// Platform selection for the CMPI headers.
///
/// Nothing is detected automatically: the build must name its platform by
/// defining one CMPI_PLATFORM_* symbol (tvr::cmpi defines
/// CMPI_PLATFORM_LINUX_GENERIC_GNU). The other headers pick their
/// platform-dependent types and export decoration from that symbol, so
/// compiling without one is a configuration mistake and stops here.

#ifndef TVR_CMPI_CMPIPL_H
#define TVR_CMPI_CMPIPL_H

#if !defined(CMPI_PLATFORM_LINUX_GENERIC_GNU) && \
    !defined(CMPI_PLATFORM_WIN32_IX86_MSVC)
#error "No CMPI platform selected: define a CMPI_PLATFORM_* symbol"
#endif

#endif /* TVR_CMPI_CMPIPL_H */
