#pragma once

namespace orvela {

/// The application object that the windows need: the module's own, which lives from the module's loading to
/// its unloading, or that of a host which had one before.
namespace ModuleApplication {

/// Whether windows can be opened by the calling thread.
bool canShowWindows();

/// The time in which the module shows windows, in the user's language. A call may come while another one's
/// window is open; the outermost counts. When it ends no event loop of the module may ever run again: what
/// was to be deleted in one, or is cached for a while, goes then. The module's own application object will
/// end before all that the toolkit has made for itself until then, and still uses.
class Use {
public:
    Use();
    ~Use();
    Use(const Use&) = delete;
    Use& operator=(const Use&) = delete;

private:
    static inline int sUses = 0;
};

} // namespace ModuleApplication

} // namespace orvela
