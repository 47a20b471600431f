#pragma once

#include <memory>
#include <string>

namespace orvela {

/// A window system on which windows can be opened.
struct WindowSystem {
    std::string name;                 ///< as the toolkit calls it; empty where there is none
    std::shared_ptr<void> connection; ///< keeps it there: a server may begin anew when its last client leaves
};

/// The window system that is reachable here. Where there is none the toolkit would end the process. Each
/// system has its own source.
WindowSystem reachWindowSystem();

} // namespace orvela
