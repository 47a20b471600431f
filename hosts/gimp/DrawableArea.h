#pragma once

#include "files/DeclaredPicture.h"

#include <stdexcept>
#include <string>

namespace orvela {

/// A drawable that cannot be worked on: the text names it, the cause and what to do.
class DrawableError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// What the selection leaves of a drawable: a layer, a layer mask or a channel.
class DrawableArea {
public:
    /// @param drawable  its number in GIMP
    /// @throws DrawableError when it has indexed colours, is a group or locked, or the selection leaves
    ///         nothing of it
    explicit DrawableArea(std::int32_t drawable);

    /// Refuses it where the filter record or the memory does not suffice. @throws PhotographError
    void check(const ReadLimits& needs) const;

    /// Its pixels as a photograph's file has them: not linear, in the colours of the image. With 8 bits where
    /// the drawable has these, else with 16.
    Photograph read() const;

    /// Puts the pixels back: one step of undo. GIMP blends them where the selection is soft.
    /// @throws DrawableError
    void write(const Photograph& picture) const;

private:
    std::int32_t mDrawable;
    int mLeft = 0;
    int mTop = 0;
    Photograph mPicture; ///< without samples
    std::string mName;   ///< for messages
    std::string mFormat; ///< how babl calls its samples
};

} // namespace orvela
