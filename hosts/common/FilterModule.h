#pragma once

#include "common/FilterProperties.h"
#include "common/ImageHost.h"

namespace orvela {

/// A filter module in this process, from loading to unloading.
class FilterModule {
public:
    /// Reads the property list and loads the module.
    /// @throws ModuleError
    explicit FilterModule(std::filesystem::path file);
    ~FilterModule();
    FilterModule(const FilterModule&) = delete;
    FilterModule& operator=(const FilterModule&) = delete;

    const FilterProperties& properties() const { return mProperties; }

    /// Shows what the module tells about itself.
    /// @return the result code, as run()
    std::int16_t about();

    /// Runs the filter over the host's image as the interface's documentation has it: parameters, prepare,
    /// start, then continue for as long as the module asks for a rectangle, and finish. The first result code
    /// other than 0 ends the run; after a start that failed there is neither continue nor finish.
    /// @return the result code, a host::ResultCode or one of the host's own
    /// @throws ModuleError when the module is not made for images of this mode
    std::int16_t run(ImageHost& host);

private:
    using Entry = void (*)(std::int16_t selector, void* record, std::intptr_t* data, std::int16_t* result);

    std::int16_t call(host::Selector selector, void* record);
    std::int16_t continueAndFinish(host::FilterRecord& record);

    std::filesystem::path mFile;
    FilterProperties mProperties;
    void* mModule = nullptr;
    Entry mEntry = nullptr;
    std::intptr_t mData = 0;
};

} // namespace orvela
