#include "files/TiffWriter.h"

#include "files/TiffEncoder.h"

#include <tiff.h>

#include <algorithm>

namespace orvela {

namespace {

constexpr std::size_t kShort = 8; // a value that may stand in an entry, depending on the form of the file
constexpr std::size_t kLargeHeader = 16;

bool isWide(std::uint16_t type) {
    return narrowTagType(type) != type;
}

} // namespace

TiffWriter::TiffWriter(TargetFile& file, ByteOrder order, Bytes front, const std::atomic<bool>* stop,
                       std::uint64_t classicLimit)
    : mFile(file), mOrder(order), mFront(std::move(front)), mStop(stop), mClassicLimit(classicLimit) {
    mFront.resize(std::max(mFront.size() + mFront.size() % 2, kLargeHeader));
    mFile.write(mFront, mStop);
}

void TiffWriter::addPicture(const Photograph& photograph, const TiffStorage& storage,
                            const std::vector<TiffField>& fields) {
    std::vector<TiffField> all = encodeTiffBlocks(mFile, photograph, storage, mOrder, mStop);
    for (const TiffField& field : fields)
        if (std::none_of(all.begin(), all.end(), [&](const TiffField& own) { return own.tag == field.tag; }))
            all.push_back(field);
    mPages.push_back(place(all));
}

void TiffWriter::addCopy(const std::vector<Bytes>& blocks, std::vector<TiffField> fields) {
    std::vector<std::uint64_t> offsets;
    for (const Bytes& block : blocks) {
        append(block);
        offsets.push_back(mFile.size() - block.size());
    }
    for (TiffField& field : fields)
        if (field.tag == TIFFTAG_STRIPOFFSETS || field.tag == TIFFTAG_TILEOFFSETS)
            field = tiffField(field.tag, TIFF_LONG8, offsets, mOrder);
    mPages.push_back(place(fields));
}

void TiffWriter::finish() {
    const bool large = needsLarge();
    Bytes header;
    orvela::append(header, mOrder == ByteOrder::Little ? "II" : "MM");
    orvela::append(header, large ? 43 : 42, 2, mOrder);
    if (large)
        orvela::append(header, 8, 2, mOrder);
    header.resize(offsetSize(large));
    std::uint64_t link = header.size(); // where the offset of the next directory belongs
    mFile.overwrite(0, header);
    for (const Directory& page : mPages) {
        Bytes offset;
        const std::uint64_t at = write(page, large);
        orvela::append(offset, at, offsetSize(large), mOrder);
        mFile.overwrite(link, offset);
        link = at + (large ? 8 + 20 * page.size() : 2 + 12 * page.size());
    }
}

// Appends from an even offset on.
void TiffWriter::append(ByteView bytes) {
    if (mFile.size() % 2 != 0)
        mFile.write(Bytes(1), mStop);
    mFile.write(bytes, mStop);
}

TiffWriter::Directory TiffWriter::place(const std::vector<TiffField>& fields) {
    Directory directory;
    for (const TiffField& field : fields)
        directory.push_back(place(field));
    std::sort(directory.begin(), directory.end(),
              [](const Entry& a, const Entry& b) { return a.tag < b.tag; });
    return directory;
}

// The offsets of blocks and the directories below depend on the form of the file.
TiffWriter::Entry TiffWriter::place(const TiffField& field) {
    Entry entry{field.tag, field.type, field.value.size() / tagTypeSize(field.type),
                {},        0,          place(field.below)};
    if (!field.below.empty())
        return entry;
    if (isInFront(field)) {
        entry.offset = field.offset;
    } else if (field.value.size() <= kShort || isWide(field.type)) {
        entry.value = field.value;
    } else {
        append(field.value);
        entry.offset = mFile.size() - field.value.size();
    }
    return entry;
}

bool TiffWriter::isInFront(const TiffField& field) const {
    return field.value.size() > kShort && !isWide(field.type) && field.offset >= kLargeHeader &&
           field.offset < mFront.size() && field.value.size() <= mFront.size() - field.offset &&
           std::equal(field.value.begin(), field.value.end(),
                      mFront.begin() + static_cast<std::ptrdiff_t>(field.offset));
}

bool TiffWriter::needsLarge() const {
    std::uint64_t end = mFile.size();
    const auto add = [&](const auto& self, const Directory& directory) -> bool {
        end += 16;
        for (const Entry& entry : directory) {
            end += 20 + entry.value.size() + 1;
            if (self(self, entry.below))
                return true;
            for (std::size_t at = 0; isWide(entry.type) && at < entry.value.size(); at += 8)
                if (number(entry.value, at, 8, mOrder) > 0xFFFFFFFF)
                    return true;
        }
        return end > mClassicLimit;
    };
    return std::any_of(mPages.begin(), mPages.end(), [&](const Directory& page) { return add(add, page); });
}

std::uint64_t TiffWriter::write(const Directory& directory, bool large) {
    Bytes bytes;
    orvela::append(bytes, directory.size(), large ? 8 : 2, mOrder);
    for (const Entry& entry : directory) {
        const Bytes one = packed(entry, large);
        orvela::append(bytes, one);
    }
    orvela::append(bytes, 0, offsetSize(large), mOrder);
    append(bytes);
    return mFile.size() - bytes.size();
}

// An entry as it stands in a directory; what does not fit into it is appended to the file.
Bytes TiffWriter::packed(const Entry& entry, bool large) {
    const bool narrow = isWide(entry.type) && !large;
    Bytes value = entry.value;
    if (narrow) {
        value.clear();
        for (std::size_t at = 0; at < entry.value.size(); at += 8)
            orvela::append(value, number(entry.value, at, 8, mOrder), 4, mOrder);
    }
    std::uint16_t type = narrow ? narrowTagType(entry.type) : entry.type;
    std::uint64_t count = entry.count;
    std::uint64_t offset = entry.offset;
    if (!entry.below.empty()) {
        offset = write(entry.below, large);
        type = large ? TIFF_IFD8 : TIFF_LONG;
        count = 1;
    } else if (value.size() > offsetSize(large)) {
        append(value);
        offset = mFile.size() - value.size();
        value.clear();
    }
    Bytes bytes;
    orvela::append(bytes, entry.tag, 2, mOrder);
    orvela::append(bytes, type, 2, mOrder);
    orvela::append(bytes, count, offsetSize(large), mOrder);
    if (offset != 0)
        orvela::append(bytes, offset, offsetSize(large), mOrder);
    bytes.insert(bytes.end(), value.begin(), value.end());
    bytes.resize(large ? 20 : 12);
    return bytes;
}

} // namespace orvela
