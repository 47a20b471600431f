#include "PluginEntry/Exchange/PictureSession.h"

#include "Core/CThreadedCore_Orvela.h"
#include "Utility/CGenericEx.h"
#include "support/HostedPicture.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

using Bytes = std::vector<std::uint8_t>;

// The samples of a plane pixel after pixel.
Bytes interleaved(const CARGBPlane& plane) {
    Bytes samples;
    for (int i = 0; i < plane.pixelCount(); ++i)
        for (const std::uint8_t sample : testplanes::at(plane, i % plane.width(), i / plane.width()))
            samples.push_back(sample);
    return samples;
}

Photograph photograph() {
    const auto plane = testplanes::noise(31, 17);
    Photograph made;
    made.width = plane->width();
    made.height = plane->height();
    made.samples = interleaved(*plane);
    return made;
}

TEST(PictureSession, ReadsRunsAndWritesBack) {
    HostedPicture host(photograph());
    const Bytes original = host.result.samples;
    std::int16_t result = 9;
    Bytes enhanced;
    {
        PictureSession session(&host.record(), &result);
        EXPECT_EQ(result, 0);
        EXPECT_EQ(interleaved(session.input()), original);
        EXPECT_NE(CARGBPlaneProxy::current(), nullptr);
        CThreadedCore_Orvela core(&session.input(), &session.output());
        QObject::connect(&core, &CThreadedCore::stepDone, &core, [&core] { core.stepHandled(); });
        session.prepare(core, CUserParamsPhotoshop(Mode_LandscapePro));
        core.run();
        EXPECT_TRUE(core.lastProcessingDone());
        enhanced = interleaved(session.output());
        EXPECT_NE(enhanced, original);
        EXPECT_EQ(host.result.samples, original) << "not before it is told to";
        session.writeBack();
    }
    EXPECT_EQ(host.result.samples, enhanced);
    EXPECT_EQ(CARGBPlaneProxy::current(), nullptr);
}

// Request 1 primes, 2 to 4 read the channels, 5 to 7 write them and 8 hands back.
TEST(PictureSession, ARefusedRequestGivesTheStepItsCauseAndTheHostsCode) {
    const std::string fill = "Unable to fill the CARGBPlanePhotoshop from Photoshop data.";
    const std::string output = "An error occurred while outputting the result.";
    const std::string causes[] = {"Error.", "Error advancing state in FillFrom_Photoshop_Data.",
                                  "Error advancing state in copyPlaneToPS."};
    for (int request = 1; request <= 8; ++request) {
        SCOPED_TRACE(request);
        HostedPicture host(photograph());
        host.failAt(request, -7);
        std::int16_t result = 0;
        try {
            PictureSession session(&host.record(), &result);
            session.writeBack();
            ADD_FAILURE();
        } catch (const CGenericEx& failure) {
            EXPECT_EQ(failure.message().toStdString(), request <= 4 ? fill : output);
            EXPECT_EQ(innermostMessage(failure).toStdString(),
                      causes[request % 8 < 2 ? 0 : (request <= 4 ? 1 : 2)]);
        }
        EXPECT_EQ(result, -7);
        EXPECT_EQ(CARGBPlaneProxy::current(), nullptr);
    }
}

} // namespace
