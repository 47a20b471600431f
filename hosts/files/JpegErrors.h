#pragma once

#include <csetjmp>
#include <string>

// The library's header needs what it does not include.
// clang-format off
#include <cstdio>
#include <jpeglib.h>
// clang-format on

namespace orvela {

/// Why the JPEG library gave up, or was made to.
class JpegErrors {
public:
    JpegErrors();
    JpegErrors(const JpegErrors&) = delete;
    JpegErrors& operator=(const JpegErrors&) = delete;

    jpeg_error_mgr* manager() { return &mErrors.base; }

    /// Runs calls of the library; false when it gave up. The library leaves by a jump, so that `work` must
    /// hold nothing that has a destructor.
    template <typename Work>
    bool attempt(const Work& work) {
        if (setjmp(mErrors.back) != 0)
            return false;
        work();
        return true;
    }

    /// Number of the library's message (jerror.h) that ended the last attempt.
    int code() const { return mErrors.base.msg_code; }

    /// That message in words.
    std::string text() const { return mErrors.text; }

    /// Throws std::bad_alloc when memory was what the last attempt lacked.
    void throwIfOutOfMemory() const;

private:
    struct Errors {
        jpeg_error_mgr base; // the first, since the library knows only this part
        std::jmp_buf back;
        char text[JMSG_LENGTH_MAX];
    };

    [[noreturn]] static void giveUp(j_common_ptr library);
    static void judge(j_common_ptr library, int level);

    Errors mErrors{};
};

} // namespace orvela
