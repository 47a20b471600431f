#include "metadata/XmpThumbnails.h"

#include "metadata/TagLibrary.h"

#include <expat.h>

#include <algorithm>
#include <climits>
#include <memory>
#include <new>
#include <optional>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

namespace orvela {

namespace {

constexpr std::string_view kThumbnails = "http://ns.adobe.com/xap/1.0/ Thumbnails"; // a blank parts them

struct Element {
    std::size_t begin;
    std::size_t end;
};

struct ParserRelease {
    void operator()(XML_Parser parser) const { XML_ParserFree(parser); }
};
using Parser = std::unique_ptr<std::remove_pointer_t<XML_Parser>, ParserRelease>;

// Finds the elements that hold thumbnails, and stops at each one's end: nothing may be thrown through the
// parser.
class Search {
public:
    explicit Search(ByteView packet) : mParser(XML_ParserCreateNS(nullptr, ' ')) {
        if (!mParser)
            throw std::bad_alloc();
        XML_SetUserData(mParser.get(), this);
        XML_SetElementHandler(mParser.get(), begin, end);
        const int size = static_cast<int>(std::min<std::size_t>(packet.size(), INT_MAX));
        mStatus = XML_Parse(mParser.get(), reinterpret_cast<const char*>(packet.data()), size, XML_TRUE);
    }

    /// The next one, as far as the packet can be read.
    std::optional<Element> next() {
        if (mStatus == XML_STATUS_ERROR && XML_GetErrorCode(mParser.get()) == XML_ERROR_NO_MEMORY)
            throw std::bad_alloc();
        if (mStatus != XML_STATUS_SUSPENDED)
            return std::nullopt;
        const Element found = mFound;
        mStatus = XML_ResumeParser(mParser.get());
        return found;
    }

private:
    std::size_t place() const { return static_cast<std::size_t>(XML_GetCurrentByteIndex(mParser.get())); }

    static void begin(void* search, const char* name, const char**) {
        auto& self = *static_cast<Search*>(search);
        if (self.mDepth == 0 && name != kThumbnails)
            return;
        if (self.mDepth++ == 0)
            self.mFound.begin = self.place();
        else
            self.mHolds = true;
    }

    static void end(void* search, const char*) {
        auto& self = *static_cast<Search*>(search);
        if (self.mDepth == 0 || --self.mDepth > 0)
            return;
        self.mFound.end =
            self.place() + static_cast<std::size_t>(XML_GetCurrentByteCount(self.mParser.get()));
        if (std::exchange(self.mHolds, false))
            XML_StopParser(self.mParser.get(), XML_TRUE);
    }

    Parser mParser;
    XML_Status mStatus = XML_STATUS_OK;
    Element mFound{};
    int mDepth = 0;
    bool mHolds = false; ///< an element without others within shows nothing
};

std::vector<Element> thumbnailsIn(ByteView packet) {
    std::vector<Element> found;
    Search search(packet);
    while (const std::optional<Element> element = search.next())
        found.push_back(*element);
    return found;
}

} // namespace

ThumbnailsOfXmp takeThumbnails(Bytes& packet) {
    const std::vector<Element> found = thumbnailsIn(packet);
    if (found.empty())
        return ThumbnailsOfXmp::None;
    Bytes after;
    std::size_t from = 0;
    for (const Element& element : found) {
        append(after, slice(packet, from, element.begin - from));
        from = element.end;
    }
    append(after, slice(packet, from, packet.size() - from));
    if (!thumbnailsIn(after).empty() || !isWellFormedXmp(after))
        return ThumbnailsOfXmp::Kept;
    packet = std::move(after);
    return ThumbnailsOfXmp::Taken;
}

} // namespace orvela
