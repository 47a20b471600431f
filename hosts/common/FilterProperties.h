#pragma once

#include <cstdint>
#include <filesystem>
#include <span>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// A filter module that cannot be used: the text names the file, the cause and what to do.
class ModuleError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// What a filter module's property list says.
struct FilterProperties {
    std::string category;         ///< of the menu
    std::string name;             ///< in the menu
    std::string entryPoint;       ///< name of the exported function
    std::string enableExpression; ///< for which images it is offered; empty: for all

    /// Reads the bytes of a property list.
    /// @throws ModuleError, without the file's name, for a list that is cut, of another version, of no filter
    /// or
    ///         without an entry point for this system
    static FilterProperties parse(std::span<const std::uint8_t> list);

    /// Reads the list in a module's file, without loading the module.
    /// @throws ModuleError
    static FilterProperties ofModule(const std::filesystem::path& file);
};

} // namespace orvela
