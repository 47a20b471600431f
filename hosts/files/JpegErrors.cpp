#include "files/JpegErrors.h"

#include <jerror.h>

#include <algorithm>
#include <array>
#include <new>

namespace orvela {

JpegErrors::JpegErrors() {
    jpeg_std_error(&mErrors.base);
    mErrors.base.error_exit = giveUp;
    mErrors.base.emit_message = judge;
}

void JpegErrors::throwIfOutOfMemory() const {
    if (code() == JERR_OUT_OF_MEMORY)
        throw std::bad_alloc();
}

void JpegErrors::giveUp(j_common_ptr library) {
    auto* errors = reinterpret_cast<Errors*>(library->err);
    errors->base.format_message(library, errors->text);
    std::longjmp(errors->back, 1); // NOLINT: the library is C
}

// Of what the library only warns of, these mean that pixels are missing or wrong.
void JpegErrors::judge(j_common_ptr library, int level) {
    constexpr std::array damage = {JWRN_JPEG_EOF, JWRN_HIT_MARKER, JWRN_HUFF_BAD_CODE, JWRN_MUST_RESYNC,
                                   JWRN_ARITH_BAD_CODE};
    if (level < 0 && std::find(damage.begin(), damage.end(), library->err->msg_code) != damage.end())
        giveUp(library);
}

} // namespace orvela
