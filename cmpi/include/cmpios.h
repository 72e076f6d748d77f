/* Copyright (c) 2026 TVR. CMPI 2.0 interface declarations. */

/// \file
/// Operating-system types used by the broker's thread and mutex services
/// (CMPIBrokerExtFT), and the decoration of MI entry points.

#ifndef TVR_CMPI_CMPIOS_H
#define TVR_CMPI_CMPIOS_H

#include "cmpipl.h"
#include <stdlib.h> /* size_t */

/// Return type of a thread start routine and of joinThread's result.
#define CMPI_THREAD_RETURN void *
/// Opaque thread handle handed out by newThread.
#define CMPI_THREAD_TYPE void *
/// Opaque mutex handle handed out by newMutex.
#define CMPI_MUTEX_TYPE void *
/// Opaque condition handle handed out by newCondition.
#define CMPI_COND_TYPE void *

#if defined(CMPI_PLATFORM_WIN32_IX86_MSVC)
/// Calling convention of thread start routines.
#define CMPI_THREAD_CDECL __stdcall
#else
/// Calling convention of thread start routines (the default one on Linux).
#define CMPI_THREAD_CDECL
#endif

/// Thread-specific-data key used by createThreadKey and its siblings.
///
/// This is `unsigned long int` (8 bytes on x86_64), the type of interface
/// level 2.0. One widely used object manager's copy of these headers uses
/// `pthread_key_t` (`unsigned int`, 4 bytes) on Linux instead; slot positions
/// are the same, but such a broker writes only 4 bytes through the key
/// pointer of createThreadKey. Zero a key variable before passing it there.
#define CMPI_THREAD_KEY_TYPE unsigned long int

/// Marks an MI entry point as exported from the provider library, even when
/// the library is built with -fvisibility=hidden.
#if defined(CMPI_PLATFORM_WIN32_IX86_MSVC)
#define CMPI_EXPORT __declspec(dllexport)
#elif defined(CMPI_PLATFORM_LINUX_GENERIC_GNU) && defined(__GNUC__) && \
    __GNUC__ >= 4
#define CMPI_EXPORT __attribute__((visibility("default")))
#else
#define CMPI_EXPORT
#endif

/// Prefix for a single declaration of an MI entry point: exported and, in
/// C++, with C linkage so the broker finds it under its plain name.
#ifdef __cplusplus
#define CMPI_EXTERN_C extern "C" CMPI_EXPORT
#else
#define CMPI_EXTERN_C CMPI_EXPORT
#endif

#endif /* TVR_CMPI_CMPIOS_H */
