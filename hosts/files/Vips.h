#pragma once

#include "files/Photograph.h"

#include <vips/vips.h>

#include <memory>
#include <string>

namespace orvela {

struct VipsRelease {
    void operator()(VipsImage* image) const { g_object_unref(image); }
};

/// A libvips image that releases its reference.
using VipsHandle = std::unique_ptr<VipsImage, VipsRelease>;

/// Starts libvips once, with one thread, without its operation cache and with its warnings silenced: failures
/// are exceptions.
/// @throws PhotographError when it cannot start
void startVips();

/// The photograph's samples with its ICC profile; refers to the photograph.
/// @throws PhotographError when there is not enough memory
VipsHandle vipsImage(const Photograph& photograph);

/// The pending error text as one line; clears it.
std::string takeVipsError();

} // namespace orvela
