#pragma once

/// Marks a loop that the compiler is to build twice, for the baseline processor and for AVX2, choosing at
/// load time. Contraction is off, so both give the same bytes. Sanitizers run before the choice could, and
/// get the baseline.
#if defined(__x86_64__) && defined(__linux__) && !defined(__SANITIZE_ADDRESS__) &&                           \
    !defined(__SANITIZE_THREAD__)
#define ORVELA_SIMD __attribute__((target_clones("default", "avx2")))
#else
#define ORVELA_SIMD
#endif
