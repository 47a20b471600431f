// What is painted of a picture: reduced copies, parts over it, the original behind a line.

#include "GUI/Preview/PreviewPicture.h"

#include "GUI/Preview/CSignaledGraphicsView.h"
#include "support/TestPlanes.h"

#include <QPainter>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

QImage painted(PreviewPicture& picture, double scale) {
    const QSize size = (picture.scene().sceneRect().size() * scale).toSize();
    QImage image(size, QImage::Format_RGB32);
    image.fill(Qt::magenta);
    QPainter painter(&image);
    picture.scene().render(&painter);
    return image;
}

QRgb grey(int level) {
    return qRgb(level, level, level);
}

// Columns of black and white are of one grey seen from further away, not a pattern.
TEST(PreviewPicture, IsPaintedFromExactMeansWhenItIsReduced) {
    PreviewPicture picture;
    picture.show(*testplanes::make(8, 4, [](int x, int y) {
        const std::uint8_t level = x < 4 ? (x % 2 ? 255 : 0) : std::uint8_t(16 * y + x);
        return testplanes::Pixel{level, level, level};
    }));
    const QImage half = painted(picture, 0.5);
    ASSERT_EQ(half.size(), QSize(4, 2));
    EXPECT_EQ(half.pixel(0, 0), grey(128)); // (0 + 255 + 0 + 255 + 2) / 4
    EXPECT_EQ(half.pixel(1, 1), grey(128));
    EXPECT_EQ(half.pixel(2, 0), grey(13)); // (4 + 5 + 20 + 21 + 2) / 4
    EXPECT_EQ(half.pixel(3, 1), grey(47)); // (38 + 39 + 54 + 55 + 2) / 4
    const QImage quarter = painted(picture, 0.25);
    ASSERT_EQ(quarter.size(), QSize(2, 1));
    EXPECT_EQ(quarter.pixel(0, 0), grey(128));
    EXPECT_EQ(quarter.pixel(1, 0), grey(30)); // (4 + 5 + 6 + 7 + 16 * 6 / 4 * 4) / 4 = 29.5, rounded
    EXPECT_EQ(painted(picture, 1).pixel(1, 0), grey(255));
}

TEST(PreviewPicture, KeepsACopyOfItsOwn) {
    const auto plane = testplanes::uniform(4, 4, {50, 60, 70});
    PreviewPicture picture;
    picture.show(*plane);
    plane->row(0)[0][0] = 200; // as a run that goes on does
    EXPECT_EQ(painted(picture, 1).pixel(0, 0), qRgb(50, 60, 70));
}

TEST(PreviewPicture, ShowsAPartOverItUntilTheNextPicture) {
    PreviewPicture picture;
    picture.show(*testplanes::uniform(8, 8, {10, 10, 10}));
    picture.showPart(testplanes::uniform(2, 2, {90, 90, 90}), QRect(2, 4, 4, 4)); // reduced by two
    QImage image = painted(picture, 1);
    EXPECT_EQ(image.pixel(2, 4), grey(90));
    EXPECT_EQ(image.pixel(5, 7), grey(90));
    EXPECT_EQ(image.pixel(1, 4), grey(10));
    EXPECT_EQ(image.pixel(6, 7), grey(10));
    picture.showPart(testplanes::uniform(1, 1, {70, 70, 70}), QRect(0, 0, 1, 1));
    image = painted(picture, 1);
    EXPECT_EQ(image.pixel(2, 4), grey(10)) << "one part at a time";
    EXPECT_EQ(image.pixel(0, 0), grey(70));
    picture.show(*testplanes::uniform(8, 8, {20, 20, 20}));
    EXPECT_EQ(painted(picture, 1).pixel(0, 0), grey(20));
}

class Comparing : public testing::Test {
protected:
    Comparing() {
        mPicture.show(*testplanes::uniform(100, 60, {200, 200, 200}));
        mPicture.setBefore(testplanes::uniform(100, 60, {30, 30, 30}));
    }

    // Where the original ends on the first row, which the handle of the line does not reach.
    int line() {
        const QImage image = painted(mPicture, 1);
        int x = 0;
        while (x < 100 && image.pixel(x, 0) == grey(30))
            ++x;
        return x;
    }

    PreviewPicture mPicture;
};

TEST_F(Comparing, TheOriginalIsLeftOfTheLineThatTheMouseDrags) {
    EXPECT_EQ(line(), 0);
    mPicture.setComparing(true);
    EXPECT_NEAR(line(), 50, 2);
    EXPECT_EQ(painted(mPicture, 1).pixel(70, 0), grey(200));
    CSignaledGraphicsView view(&mPicture.scene());
    view.setFrameStyle(0);
    view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setDragMode(QGraphicsView::ScrollHandDrag);
    view.resize(100, 60);
    view.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&view));
    view.grab(); // the line knows its scale once it was painted
    QTest::mousePress(view.viewport(), Qt::LeftButton, {}, QPoint(51, 20));
    QMouseEvent move(QEvent::MouseMove, QPointF(21, 25), view.viewport()->mapToGlobal(QPointF(21, 25)),
                     Qt::NoButton, Qt::LeftButton, {});
    QCoreApplication::sendEvent(view.viewport(), &move);
    QTest::mouseRelease(view.viewport(), Qt::LeftButton, {}, QPoint(21, 25));
    EXPECT_NEAR(line(), 21, 2);
    mPicture.show(*testplanes::uniform(100, 60, {210, 210, 210}));
    EXPECT_NEAR(line(), 21, 2) << "the line stays where it was put";
    mPicture.setComparing(false);
    EXPECT_EQ(line(), 0);
}

TEST_F(Comparing, TheWholeOriginalIsSeenWhileHeld) {
    for (const bool withLine : {false, true}) {
        mPicture.setComparing(withLine);
        mPicture.setHeld(true);
        EXPECT_EQ(line(), 100);
        mPicture.showPart(testplanes::uniform(10, 10, {90, 90, 90}), QRect(0, 0, 10, 10));
        EXPECT_EQ(line(), 100) << "a step of a run does not come before it";
        mPicture.setHeld(false);
        mPicture.show(*testplanes::uniform(100, 60, {200, 200, 200}));
        EXPECT_NEAR(line(), withLine ? 50 : 0, 2);
    }
}

} // namespace
