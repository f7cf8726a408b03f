/// @file
/// How the library's symbols cross its border: export marks and the printf check.
#pragma once

#if defined(TESSALUTILITY_STATIC)
#define TESSAL_API
#elif defined(_WIN32)
#if defined(TESSALUTILITY_BUILD)
#define TESSAL_API __declspec(dllexport)
#else
#define TESSAL_API __declspec(dllimport)
#endif
#else
#define TESSAL_API __attribute__((visibility("default")))
#endif

/// Lets the compiler check a format text against its arguments; both positions count from 1.
#if defined(__MINGW32__) && !defined(__clang__)
#define TESSAL_PRINTF(formatPosition, firstArgument) __attribute__((format(gnu_printf, formatPosition, firstArgument)))
#elif defined(__GNUC__)
#define TESSAL_PRINTF(formatPosition, firstArgument) __attribute__((format(printf, formatPosition, firstArgument)))
#else
#define TESSAL_PRINTF(formatPosition, firstArgument)
#endif
