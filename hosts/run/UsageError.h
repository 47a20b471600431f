#pragma once

#include <stdexcept>

namespace orvela {

/// Arguments that make no sense: refused before any work starts.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

} // namespace orvela
