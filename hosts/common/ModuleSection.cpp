#include "common/ModuleSection.h"

#include "common/FilterProperties.h"

#include <elf.h>
#include <link.h>

#include <cerrno>
#include <cstring>
#include <fstream>

namespace orvela {

namespace {

using FileHead = ElfW(Ehdr);
using SectionHead = ElfW(Shdr);

constexpr std::uint64_t kMostBytes = 1 << 16; // of a section of names or of properties

// Parts of a file by their place.
class FileParts {
public:
    explicit FileParts(const std::filesystem::path& path) : mFile(path, std::ios::binary) {
        if (!mFile)
            throw ModuleError(std::string("cannot be opened: ") + std::strerror(errno));
    }

    std::vector<std::uint8_t> bytes(std::uint64_t offset, std::uint64_t size) {
        if (size > kMostBytes)
            throw ModuleError("is damaged");
        std::vector<std::uint8_t> part(size);
        read(offset, part.data(), part.size());
        return part;
    }

    template <typename Value>
    Value value(std::uint64_t offset) {
        Value value{};
        read(offset, &value, sizeof value);
        return value;
    }

private:
    void read(std::uint64_t offset, void* to, std::size_t size) {
        mFile.seekg(static_cast<std::streamoff>(offset));
        if (!mFile.read(static_cast<char*>(to), static_cast<std::streamsize>(size)))
            throw ModuleError("is no module of this system or cut");
    }

    std::ifstream mFile;
};

bool isModule(const FileHead& head) {
    return std::memcmp(head.e_ident, ELFMAG, SELFMAG) == 0 &&
           head.e_ident[EI_CLASS] == (sizeof(void*) == 8 ? ELFCLASS64 : ELFCLASS32) &&
           head.e_shentsize == sizeof(SectionHead);
}

} // namespace

std::vector<std::uint8_t> sectionOf(const std::filesystem::path& file, std::string_view name) {
    FileParts parts(file);
    const auto head = parts.value<FileHead>(0);
    if (!isModule(head))
        throw ModuleError("is no module of this system or cut");
    const auto section = [&](unsigned index) {
        return parts.value<SectionHead>(head.e_shoff + std::uint64_t{index} * sizeof(SectionHead));
    };
    const SectionHead nameHead = section(head.e_shstrndx);
    const auto names = parts.bytes(nameHead.sh_offset, nameHead.sh_size);
    for (unsigned i = 0; i < head.e_shnum; ++i) {
        const SectionHead candidate = section(i);
        const std::string_view rest =
            candidate.sh_name < names.size()
                ? std::string_view(reinterpret_cast<const char*>(names.data()), names.size())
                      .substr(candidate.sh_name)
                : std::string_view();
        if (rest.substr(0, rest.find('\0')) == name)
            return parts.bytes(candidate.sh_offset, candidate.sh_size);
    }
    throw ModuleError("has no property list");
}

} // namespace orvela
