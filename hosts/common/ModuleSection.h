#pragma once

#include <cstdint>
#include <filesystem>
#include <string_view>
#include <vector>

namespace orvela {

/// The bytes of a section of a module's file (ELF of this machine's word size), without loading it.
/// @throws ModuleError, without the file's name, when the file cannot be read, is no module, is cut, or has
/// no
///         such section
std::vector<std::uint8_t> sectionOf(const std::filesystem::path& file, std::string_view name);

} // namespace orvela
