#pragma once

#include <filesystem>

namespace orvela {

/// The full name of the file, a module or a program, that this code was loaded from; empty when the system
/// does not tell it. Each system has its own source.
std::filesystem::path moduleFile();

/// The file that the log goes to: the one that the environment variable "ORVELA_TMP_FILE" names, else
/// "orvela.log" in the folder that "TMP" names, and without it where the system has a place for such files of
/// the user alone. Empty where there is none.
std::filesystem::path logFile();

/// Keeps the module loaded for as long as the process lives.
void pinModule();

} // namespace orvela
