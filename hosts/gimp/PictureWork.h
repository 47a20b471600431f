#pragma once

#include "files/DeclaredPicture.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvela {

/// Is told how far a run is, from 0 to 1, and what it is at.
using Progress = std::function<void(double fraction, const std::string& step)>;

/// What is to be made of a picture. Nothing of it has been done yet.
struct PictureWork {
    ReadLimits needs;               ///< memory that it takes
    std::vector<std::string> notes; ///< for the user

    /// Makes the result; none when the user cancelled. What it throws is told by failureText().
    std::function<std::optional<Photograph>(Photograph picture, const Progress& progress)> run;
};

/// Settings as texts, each empty for none.
struct GivenSettings {
    std::string mode;   ///< its name
    std::string fields; ///< NAME=POSITION[,on|off] or NAME=on|off, blanks between them
    std::string preset; ///< file, or name of a stored preset
};

/// The filter's windows, in a process of their own, in which the user decides.
/// @param hostWindow  the window that they stand above, in the system's own terms; 0: none
PictureWork workByWindows(std::uint64_t hostWindow);

/// A run of the engine by these settings. @throws UsageError when there are no such, or nothing would change
PictureWork workBySettings(const GivenSettings& given);

/// A run of the engine by what was last accepted in the windows. @throws UsageError when nothing was
PictureWork workByLastSettings();

/// What failed and what to do, in one sentence for the user.
std::string failureText(const std::exception& failure);

} // namespace orvela
