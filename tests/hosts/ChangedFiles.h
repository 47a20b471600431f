#pragma once

#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"

namespace orvela {

/// A command that puts `piece`, given as Python, behind the first `at` bytes of a file.
inline std::string insert(const char* file, int at, const std::string& piece) {
    return "python3 -c \"import struct, zlib\nb = open('" + std::string(file) + "', 'rb').read()\n" +
           "def chunk(n, d): return struct.pack('>I', len(d)) + n + d + struct.pack('>I', zlib.crc32(n + "
           "d))\n" +
           "def segment(m, d): return bytes([255, m]) + struct.pack('>H', len(d) + 2) + d\n" + "open('" +
           file + "', 'wb').write(b[:" + std::to_string(at) + "] + " + piece + " + b[" + std::to_string(at) +
           ":])\"";
}

inline constexpr int kBehindPngHeader = 33;
inline constexpr int kBehindJpegStart = 2;

/// Reads the one and writes the other; returns what there is to tell.
inline std::vector<std::string> convert(const TestFolder& folder, const char* from, const char* to) {
    return writePhotograph(readPhotograph(folder / from), folder / to);
}

} // namespace orvela
