#include "gimp/DrawableArea.h"

#include <libgimp/gimp.h>

#include <memory>

namespace orvela {

namespace {

struct Unref {
    void operator()(gpointer object) const { g_object_unref(object); }
};
using Buffer = std::unique_ptr<GeglBuffer, Unref>;

std::string nameOf(gint32 drawable) {
    const std::unique_ptr<gchar, decltype(&g_free)> name(gimp_item_get_name(drawable), g_free);
    return std::string("\"") + (name ? name.get() : "") + '"';
}

ColorModel modelOf(gint32 drawable) {
    const bool alpha = gimp_drawable_has_alpha(drawable);
    if (gimp_drawable_is_gray(drawable))
        return alpha ? ColorModel::GreyAlpha : ColorModel::Grey;
    return alpha ? ColorModel::RgbAlpha : ColorModel::Rgb;
}

// In an image with a linear profile the samples that are called non-linear would be linear, too.
bool hasLinearProfile(gint32 drawable) {
    const gint32 image = gimp_item_get_image(drawable);
    const std::unique_ptr<GimpColorProfile, Unref> profile(gimp_image_get_color_profile(image));
    return profile && gimp_color_profile_is_linear(profile.get());
}

std::string samplesOf(ColorModel model, bool perceptual) {
    const std::string mark = perceptual ? "~" : "'";
    const bool grey = model == ColorModel::Grey || model == ColorModel::GreyAlpha;
    return (grey ? "Y" + mark : "R" + mark + "G" + mark + "B" + mark) + (hasAlpha(model) ? "A" : "");
}

void requireFilterable(gint32 drawable, const std::string& name) {
    const auto refuseFor = [&name](const char* reason) { throw DrawableError(name + ' ' + reason); };
    if (gimp_drawable_is_indexed(drawable))
        refuseFor("has indexed colours; choose Image > Mode > RGB first");
    if (gimp_item_is_group(drawable))
        refuseFor("is a group of layers; choose one of its layers");
    if (gimp_item_get_lock_content(drawable))
        refuseFor("is locked; unlock its pixels in the dialog of layers");
}

const Babl* formatOf(gint32 drawable, const std::string& name) {
    return babl_format_with_space(name.c_str(), gimp_drawable_get_format(drawable));
}

} // namespace

DrawableArea::DrawableArea(std::int32_t drawable) : mDrawable(drawable), mName(nameOf(drawable)) {
    requireFilterable(drawable, mName);
    if (!gimp_drawable_mask_intersect(drawable, &mLeft, &mTop, &mPicture.width, &mPicture.height))
        throw DrawableError("nothing to do: the selection leaves nothing of " + mName +
                            "; select a part of it, or nothing for the whole");
    mPicture.model = modelOf(drawable);
    const std::string samples = samplesOf(mPicture.model, hasLinearProfile(drawable));
    const bool isEight = babl_format_get_encoding(gimp_drawable_get_format(drawable)) == samples + " u8";
    mPicture.depth = isEight ? 8 : 16;
    mFormat = samples + (isEight ? " u8" : " u16");
}

void DrawableArea::check(const ReadLimits& needs) const {
    DeclaredPicture picture;
    picture.width = mPicture.width;
    picture.height = mPicture.height;
    picture.sampleBytes = sampleBytes(mPicture);
    checkPicture(picture, mName, needs);
}

Photograph DrawableArea::read() const {
    Photograph picture = mPicture;
    picture.samples.resize(static_cast<std::size_t>(picture.width) *
                           static_cast<std::size_t>(picture.height) * sampleBytes(picture));
    const GeglRectangle area{mLeft, mTop, picture.width, picture.height};
    const Buffer buffer(gimp_drawable_get_buffer(mDrawable));
    gegl_buffer_get(buffer.get(), &area, 1.0, formatOf(mDrawable, mFormat), picture.samples.data(),
                    GEGL_AUTO_ROWSTRIDE, GEGL_ABYSS_NONE);
    return picture;
}

void DrawableArea::write(const Photograph& picture) const {
    const GeglRectangle area{mLeft, mTop, picture.width, picture.height};
    {
        const Buffer shadow(gimp_drawable_get_shadow_buffer(mDrawable));
        gegl_buffer_set(shadow.get(), &area, 0, formatOf(mDrawable, mFormat), picture.samples.data(),
                        GEGL_AUTO_ROWSTRIDE);
    }
    if (!gimp_drawable_merge_shadow(mDrawable, TRUE))
        throw DrawableError(mName + " cannot be written to: " + gimp_get_pdb_error());
    gimp_drawable_update(mDrawable, area.x, area.y, area.width, area.height);
}

} // namespace orvela
