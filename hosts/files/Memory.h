#pragma once

#include <cstdint>
#include <string>

namespace orvela {

/// What to do when the memory does not suffice.
inline constexpr char kMemoryAdvice[] = "close other programs, raise the limit or use a smaller photograph";

/// What is granted where nothing limits it.
inline constexpr std::uint64_t kUnlimited = UINT64_MAX / 2;

/// Bytes of memory that the program may still take: the least of what its control groups and the machine
/// leave. What cannot be told does not count.
/// @param root  folder in which "proc" and "sys" stand, without a slash at its end
std::uint64_t grantedMemory(const std::string& root = "");

/// Bytes that the program may still map, whether it uses them or not, by the limits of the process.
std::uint64_t grantedAddresses();

/// Bytes that the program can still get, by both.
std::uint64_t obtainableMemory();

/// Bytes that so many threads and the libraries' own will map for their stacks.
std::uint64_t mappedByThreads(int threads);

/// Bytes that are needed beside the picture, whatever its size.
inline constexpr std::uint64_t kBesideBytes = 10'000'000;

/// Bytes that the libraries map when they begin.
inline constexpr std::uint64_t kLibraryBytes = 25'000'000;

/// "850 MB" or "1.9 GB".
std::string amountOf(std::uint64_t bytes);

} // namespace orvela
