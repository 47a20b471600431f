#pragma once

#include <string>

namespace orvela {

/// The system's own viewer of compiled help files.
namespace HelpViewer {

/// Where the compiled manual lies, below the folder of the program that the filter runs in.
inline constexpr char kCompiledManual[] = "\\Plug-Ins\\Kestrand\\Help\\OrvelaManual.chm";

/// Shows a topic, FILE::/PAGE in the system's own encoding, in a viewer that belongs to the native window
/// `owner`. False where the system has none or it cannot be loaded.
bool show(void* owner, const std::string& topic);

} // namespace HelpViewer

} // namespace orvela
