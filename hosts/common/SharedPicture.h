#pragma once

#include "common/PictureShape.h"

#include <array>
#include <span>

namespace orvela {

/// A picture, and what a filter makes of it, in memory that two processes share: the one with the photograph,
/// and the one with the filter's windows.
class SharedPicture {
public:
    /// How a run of the filter ended.
    enum class Outcome : std::int32_t {
        Unfinished, ///< not at all: the process is running or ended before its time
        Ran,        ///< with the result code
        Failed,     ///< not begun, for the reason in `text`
    };

    /// Beside the samples.
    struct Head {
        PictureShape shape;
        std::uintptr_t hostWindow = 0; ///< the window to stand above, in the system's own terms; 0: none
        Outcome outcome = Outcome::Unfinished;
        std::int16_t resultCode = 0;
        std::array<char, 512> text{};
        std::array<char, 512> logFile{}; ///< where the filter writes what it does
    };

    /// Makes memory for a picture of this shape; all samples are 0.
    /// @throws std::bad_alloc, std::system_error when the limits of the process do not grant it
    explicit SharedPicture(const PictureShape& shape);

    /// The picture that another process made.
    /// @param handle  the file descriptor of its memory, taken over
    /// @throws std::system_error when it is none
    explicit SharedPicture(int handle);
    ~SharedPicture();
    SharedPicture(const SharedPicture&) = delete;
    SharedPicture& operator=(const SharedPicture&) = delete;

    Head& head() { return *mHead; }
    std::span<std::uint8_t> source();
    std::span<std::uint8_t> result();

    /// File descriptor of the memory, closed in processes that are started.
    int handle() const { return mHandle; }

private:
    void map(std::size_t size);

    int mHandle;
    PictureShape mShape; ///< what the other process does to the head does not move the samples
    std::size_t mSize = 0;
    Head* mHead = nullptr;
};

/// Puts a text into a field of Head, cut where that ends.
void setText(std::span<char> field, std::string_view text);

} // namespace orvela
