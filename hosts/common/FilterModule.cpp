#include "common/FilterModule.h"

#include "common/EnableExpression.h"

#include <dlfcn.h>

namespace orvela {

namespace {

bool isEmpty(const host::Rect& area) {
    return area.right <= area.left || area.bottom <= area.top;
}

bool asksForMore(const host::FilterRecord& record) {
    return !isEmpty(record.inRect) || !isEmpty(record.outRect) || !isEmpty(record.maskRect);
}

} // namespace

FilterModule::FilterModule(std::filesystem::path file)
    : mFile(std::move(file)), mProperties(FilterProperties::ofModule(mFile)) {
    mModule = ::dlopen(mFile.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (mModule == nullptr)
        throw ModuleError(mFile.string() + ": cannot be loaded: " + ::dlerror());
    mEntry = reinterpret_cast<Entry>(::dlsym(mModule, mProperties.entryPoint.c_str()));
    if (mEntry != nullptr)
        return;
    ::dlclose(mModule);
    throw ModuleError(mFile.string() + ": has no " + mProperties.entryPoint + "; install Orvela again");
}

FilterModule::~FilterModule() {
    ::dlclose(mModule);
}

std::int16_t FilterModule::call(host::Selector selector, void* record) {
    std::int16_t result = host::NoErr;
    mEntry(selector, record, &mData, &result);
    return result;
}

std::int16_t FilterModule::about() {
    host::PlatformData platform{};
    host::AboutRecord record{};
    record.platformData = &platform;
    return call(host::SelectorAbout, &record);
}

std::int16_t FilterModule::run(ImageHost& host) {
    host::FilterRecord& record = host.record();
    try {
        if (!isEnabledFor(mProperties.enableExpression, static_cast<host::ImageMode>(record.imageMode)))
            throw ModuleError("is not made for pictures of this colour model");
    } catch (const ModuleError& error) {
        throw ModuleError(mFile.string() + ": " + error.what());
    }
    for (const auto selector : {host::SelectorParameters, host::SelectorPrepare, host::SelectorStart})
        if (const std::int16_t result = call(selector, &record))
            return result;
    return continueAndFinish(record);
}

// After a continue that failed the module may still clean up; the first code counts.
std::int16_t FilterModule::continueAndFinish(host::FilterRecord& record) {
    std::int16_t result = host::NoErr;
    while (result == host::NoErr && asksForMore(record)) {
        result = record.advanceState();
        if (result == host::NoErr)
            result = call(host::SelectorContinue, &record);
    }
    if (result == host::NoErr)
        result = record.advanceState();
    const std::int16_t finished = call(host::SelectorFinish, &record);
    return result != host::NoErr ? result : finished;
}

} // namespace orvela
