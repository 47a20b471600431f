#include "GUI/Preview/DraftRunner.h"

#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/TestPlanes.h"

#include <QSignalSpy>
#include <QTest>

#include <gtest/gtest.h>

#include <random>
#include <thread>

using namespace orvela;

namespace {

// A dark left half and a bright right one, neither of which is like the whole.
std::shared_ptr<const CARGBPlane> halves(int width, int height) {
    std::mt19937 grain(3);
    return testplanes::make(width, height, [&](int x, int y) {
        const int level = 2 * x < width ? 20 + 40 * y / height : 150 + 70 * y / height;
        const auto noise = static_cast<int>(grain() % 8);
        return testplanes::Pixel{std::uint8_t(level + noise), std::uint8_t(level), std::uint8_t(level - 10)};
    });
}

class DraftRunnerTest : public testing::Test {
protected:
    DraftRunner::Request request(EGUIMode mode) const {
        DraftRunner::Request request;
        request.picture = request.host = picture;
        request.area = QRect(0, 0, 100, 90);
        request.params = CUserParamsPhotoshop(mode);
        return request;
    }

    // The whole run with its tape.
    std::unique_ptr<CARGBPlane> whole(const CUserParamsPhotoshop& params, MeasurementTape& tape) const {
        CARGBPlane in(*picture, QString());
        auto out = std::make_unique<CARGBPlane>(*picture, QString());
        const CARGBPlaneProxyDirect proxy(*picture, CARGBPlaneProxyDirect::Private);
        CThreadedCore_Orvela core(&in, out.get());
        QObject::connect(&core, &CThreadedCore::stepDone, [&core] { core.stepHandled(); });
        core.setProxy(&proxy);
        core.setParams(params);
        core.recordTape(&tape);
        core.run();
        return out;
    }

    std::shared_ptr<CARGBPlane> draft(const DraftRunner::Request& request) {
        std::shared_ptr<CARGBPlane> found;
        QObject::connect(&runner, &DraftRunner::done, &runner,
                         [&found](const std::shared_ptr<CARGBPlane>& made) { found = made; });
        runner.request(request);
        EXPECT_TRUE(QTest::qWaitFor([&found] { return found != nullptr; }));
        QObject::disconnect(&runner, &DraftRunner::done, nullptr, nullptr);
        return found;
    }

    // Mean and largest difference to the same part of the whole, its edges left out.
    static std::pair<double, int> difference(const CARGBPlane& part, const CARGBPlane& whole) {
        long sum = 0;
        int largest = 0;
        int count = 0;
        for (int y = 8; y < part.height() - 8; ++y)
            for (int x = 8; x < part.width() - 8; ++x, ++count) {
                const int d = std::abs(testplanes::at(part, x, y)[1] - testplanes::at(whole, x, y)[1]);
                sum += d;
                largest = std::max(largest, d);
            }
        return {static_cast<double>(sum) / count, largest};
    }

    std::shared_ptr<const CARGBPlane> picture = halves(600, 400);
    DraftRunner runner;
};

TEST_F(DraftRunnerTest, OfAPartHasTheStatisticsOfTheWholePicture) {
    for (const EGUIMode mode : {Mode_Automatic, Mode_AutoLevels, Mode_AutoContrast, Mode_Macro}) {
        SCOPED_TRACE(mode);
        DraftRunner::Request asked = request(mode);
        auto tape = std::make_shared<MeasurementTape>();
        const auto exact = whole(asked.params, *tape);
        asked.tape = tape;
        EXPECT_EQ(difference(*draft(asked), *exact).second, 0);
        // Without a run before, or with one that measured other things, a small copy tells of the whole.
        asked.tape.reset();
        EXPECT_LT(difference(*draft(asked), *exact).first, 2);
        auto other = std::make_shared<MeasurementTape>();
        whole(CUserParamsPhotoshop(Mode_Adjustments), *other);
        asked.tape = other;
        EXPECT_LT(difference(*draft(asked), *exact).first, 2);
    }
}

TEST_F(DraftRunnerTest, IsNeverHeardOfOnceItWasCancelled) {
    std::mt19937 random(11);
    QSignalSpy heard(&runner, &DraftRunner::done);
    for (int i = 0; i < 150; ++i) {
        runner.request(request(Mode_Automatic));
        std::this_thread::sleep_for(std::chrono::microseconds(random() % 20'000));
        runner.cancel();
        QTest::qWait(0);
        ASSERT_EQ(heard.count(), 0) << i;
    }
    runner.request(request(Mode_Automatic)); // a cancelled one does not spoil the next
    EXPECT_TRUE(heard.wait());
    MeasurementTape tape;
    const auto exact = whole(CUserParamsPhotoshop(Mode_Automatic), tape);
    EXPECT_LT(difference(*heard[0][0].value<std::shared_ptr<CARGBPlane>>(), *exact).first, 2);
}

TEST_F(DraftRunnerTest, TakesAsManyPixelsNextTimeAsItIsFast) {
    using std::chrono::milliseconds;
    const auto next = [](int took) {
        return DraftRunner::pixelsAtOnce(500'000, 500'000, milliseconds(took));
    };
    EXPECT_EQ(next(160), 250'000) << "of what 80 milliseconds allow";
    EXPECT_EQ(next(20), 2'000'000);
    EXPECT_EQ(next(1), 2'000'000) << "no more is seen on a screen";
    EXPECT_EQ(next(8000), 200'000) << "fewer tell nothing";
    EXPECT_EQ(next(100), 500'000) << "nearly right";
    EXPECT_EQ(next(65), 500'000);

    DraftRunner::Request few = request(Mode_Advanced);
    few.area = QRect(0, 0, 3, 3);
    draft(few);
    EXPECT_EQ(runner.pixelsAtOnce(), 200'000) << "what nine pixels took tells so";
}

TEST_F(DraftRunnerTest, OnlyTheNewestOfThoseThatWaitIsMade) {
    QSignalSpy heard(&runner, &DraftRunner::done);
    for (int left = 0; left < 400; ++left) {
        DraftRunner::Request asked = request(Mode_Automatic);
        asked.area.moveLeft(left);
        runner.request(asked);
    }
    EXPECT_TRUE(QTest::qWaitFor([&] { return heard.count() > 0 && heard.last()[1].toRect().left() == 399; }));
    EXPECT_LT(heard.count(), 5);
}

} // namespace
