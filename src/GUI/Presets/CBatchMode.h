#pragma once

/// The two values that let the next start replay the last operation without any dialog. They live in the
/// settings store only: every query reads it, every change writes it. When it cannot be written a warning
/// names it, once, and the old value stays.
class CBatchMode {
public:
    /// The object, made on the first call and kept until the module is unloaded.
    static CBatchMode& instance();

    CBatchMode(const CBatchMode&) = delete;
    CBatchMode& operator=(const CBatchMode&) = delete;

    /// Whether the next start replays the last operation.
    bool isBatchModeEnabled() const;
    void setBatchModeEnabled(bool enabled);

    /// Whether it does: there is nothing to replay before a mode was run.
    bool replays() const;

    /// The number of the last recorded mode (EGUIMode); -1 when there is none.
    int batchMode() const;
    void setBatchMode(int mode);

protected:
    /// Switches batch mode off, with a message, when the SHIFT key is held.
    CBatchMode();
    ~CBatchMode() = default;
};
