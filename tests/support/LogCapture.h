#pragma once

#include "Utility/Logger.h"

#include <algorithm>
#include <string>
#include <vector>

namespace orvela {

/// Collects the log lines written while it lives; threshold debug, no prefixes.
class LogCapture {
public:
    LogCapture() {
        auto sink = std::make_unique<Sink>();
        mLines = sink->lines;
        Log::install(std::move(sink));
        Log::setThreshold(LogLevel::Debug);
        Log::setPrefixes(false);
    }
    ~LogCapture() { Log::install(nullptr); }
    LogCapture(const LogCapture&) = delete;
    LogCapture& operator=(const LogCapture&) = delete;

    const std::vector<std::string>& lines() const { return *mLines; }

    /// True when a line, its indentation aside, equals `text`.
    bool has(const std::string& text) const {
        return std::any_of(mLines->begin(), mLines->end(), [&text](const std::string& line) {
            return line.substr(std::min(line.find_first_not_of('\t'), line.size())) == text;
        });
    }

private:
    struct Sink final : ILogger {
        std::shared_ptr<std::vector<std::string>> lines = std::make_shared<std::vector<std::string>>();
        void write(const QByteArray& line) override { lines->push_back(line.toStdString()); }
    };
    std::shared_ptr<std::vector<std::string>> mLines;
};

} // namespace orvela
