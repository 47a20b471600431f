#pragma once

#include "Filters/IFilter.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <mutex>
#include <new>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// A filter whose phases do as told and that writes 200 to every sample of its rows.
class ScriptedFilter final : public IFilter {
public:
    ScriptedFilter(CUserParams* params, CARGBPlane* in, CARGBPlane* out, const RunContext& context = {})
        : IFilter(context, params, in, out) {}

    using IFilter::GetRGBFromHost;
    using IFilter::useHostPicture;

    bool pre = true;
    bool post = true;
    int throwAtRow = -1;
    bool restores = true; ///< otherwise it runs out of memory when it ends early
    std::uint32_t start = 0;
    std::uint32_t end = 0;
    std::uint32_t step = 1;
    std::set<std::uint32_t> rows;
    std::vector<std::string> phases;

protected:
    const TaskDescription& description() const override {
        static constexpr TaskDescription kDescription = {
            .source = "Filters/Scripted", .line = 7, .dumpName = "Scripted", .writes = Writes::SomePixels};
        return kDescription;
    }
    bool applies() override {
        phases.emplace_back("pre");
        return pre;
    }
    void setUp() override {
        if (end != 0) {
            mVertStart = start;
            mVertEnd = end;
            mVertStep = step;
        }
    }
    void ApplyRow(std::uint32_t row) override {
        for (std::uint8_t* channel : mOutPlane->row(static_cast<int>(row)))
            std::fill_n(channel, mOutPlane->width(), std::uint8_t{200});
        {
            const std::lock_guard lock(mMutex);
            rows.insert(row);
        }
        if (static_cast<int>(row) == throwAtRow)
            throw std::runtime_error("row 3 is broken");
    }
    bool PostApply() override {
        phases.emplace_back("post");
        return post;
    }
    void onSuccess() override {
        phases.emplace_back("success");
        IFilter::onSuccess();
    }

    void onStopped() override {
        if (!restores)
            throw std::bad_alloc();
        IFilter::onStopped();
    }

private:
    std::mutex mMutex;
};

/// A scripted filter over a picture of seven equal rows, with something else in its output plane.
struct ScriptedFilterTest : testing::Test {
    static constexpr testplanes::Pixel kColour = {10, 20, 30};

    /// Both planes hold the picture as it came.
    void expectUntouched() const {
        const auto original = testplanes::bytes(*testplanes::uniform(4, 7, kColour));
        EXPECT_EQ(testplanes::bytes(*in), original);
        EXPECT_EQ(testplanes::bytes(*out), original);
    }

    CUserParams params;
    std::unique_ptr<CARGBPlane> in = testplanes::uniform(4, 7, kColour);
    std::unique_ptr<CARGBPlane> out = testplanes::noise(4, 7);
    ScriptedFilter filter{&params, in.get(), out.get()};
};

} // namespace orvela
