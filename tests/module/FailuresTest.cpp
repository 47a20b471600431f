#include "module/ForeignHost.h"

using namespace orvela;

using FailuresTest = ForeignHostTest;

namespace {

constexpr int kCodes[] = {-108, 1, -50, 32767, -32768, -30100};

// One of the requests that a picture with so many colour channels takes fails: what the host is told, each
// time with another of its codes.
void addFailures(int channels, QStringList& commands, QStringList& answers) {
    const int requests = 2 * channels + 2;
    for (int n = 1; n <= requests; ++n) {
        const char* cause = n == 1 || n == requests ? "Error."
                            : n <= channels + 1     ? "Error advancing state in FillFrom_Photoshop_Data."
                                                    : "Error advancing state in copyPlaneToPS.";
        commands += QString("fail %1 %2").arg(n).arg(kCodes[n % 6]);
        if (n > channels + 1)
            commands += "click press btnAutomatic";
        commands += {"click box OK", "run"};
        answers += criticalBox("The plug-in was unable to run it's main processing method.", cause);
        answers +=
            QString("run 1:0 2:0 3:-128, stored %1, advanced %2").arg(std::max(0, n - channels - 3)).arg(n);
    }
}

} // namespace

TEST_F(FailuresTest, EveryRequestThatTheHostRefusesIsToldAndEndsTheRun) {
    QStringList commands;
    QStringList answers;
    for (const auto& [channels, image] :
         {std::pair(3, "image 61 47 3 8 3 1"), {3, "image 61 47 4 16 13 1"}, {1, "image 61 47 1 16 10 1"}}) {
        commands += {image, "write before.out"};
        addFailures(channels, commands, answers);
        commands += {"write after.out", "shell cmp before.out after.out", "click press btnAutomatic", "run"};
        answers += QString("run 1:0 2:0 3:0 5:0, stored %1, advanced %2").arg(channels).arg(2 * channels + 3);
    }
    EXPECT_EQ(host(commands), answers);
    // Each level of the failure is on record, and not twice.
    const QStringList lines = log();
    EXPECT_EQ(lines.filter("CGenericEx Unable to fill the CARGBPlanePhotoshop from Photoshop data.").size(),
              4 + 4 + 2);
    EXPECT_EQ(lines.filter("CGenericEx An error occurred while outputting the result.").size(), 4 + 4 + 2);
    EXPECT_EQ(lines.filter("CGenericEx The plug-in was unable to run it's main processing method.").size(),
              8 + 8 + 4);
}

TEST_F(FailuresTest, APictureWithoutChannelsOrWithTooManyIsRefusedAtTheEnd) {
    EXPECT_EQ(host({"image 20 20 5 8 7 1", "click press btnAutomatic", "click box OK", "run"}),
              QStringList({criticalBox("The plug-in was unable to run it's main processing method.",
                                       "Unknown no of planes."),
                           "run 1:0 2:0 3:-128, stored 0, advanced 4"}));
}

TEST_F(FailuresTest, ARequestWithoutBuffersIsToldAsARefusedOne) {
    const QString box =
        criticalBox("The plug-in was unable to run it's main processing method.", "The host gave no buffer.");
    EXPECT_EQ(host({"fail 2 0", "click box OK", "run", "fail 6 0", "click press btnAutomatic", "click box OK",
                    "run"}),
              QStringList({box, "run 1:0 2:0 3:-128, stored 0, advanced 2", box,
                           "run 1:0 2:0 3:-128, stored 0, advanced 6"}));
}

TEST_F(FailuresTest, OddRectanglesEndNothing) {
    const QStringList run = {"click press btnAutomatic", "run"};
    const QStringList refused = {"click box OK", "run"};
    const QStringList said =
        host(QStringList("rect 0 0 0 0") + run + QStringList("rect 0 0 1 1") + run +
             QStringList("rect 47 0 48 64") + run + QStringList("rect 10 10 5 5") + refused);
    EXPECT_EQ(said.mid(0, 3), QStringList({"run 1:0 2:0 3:0 5:0, stored 0, advanced 9",
                                           "run 1:0 2:0 3:0 5:0, stored 3, advanced 9",
                                           "run 1:0 2:0 3:0 5:0, stored 3, advanced 9"}));
    EXPECT_TRUE(said.value(3).startsWith("box: Kestrand Orvela|The plug-in was unable to run"))
        << said.value(3).toStdString();
    EXPECT_EQ(said.value(4), "run 1:0 2:0 3:-128, stored 0, advanced 1");
}

TEST_F(FailuresTest, AStartWithoutThoseBeforeItOrAfterAContinueWorks) {
    const QString again = "An invalid selector was passed by Photoshop (filterSelectorContinue).";
    EXPECT_EQ(host({"click press btnAutomatic", "call 3", "click box OK", "call 4",
                    "click press btnAutomatic", "call 3", "call 5", "call 5", "click close", "call 3"}),
              QStringList({"call 3: 0", criticalBox(again, again), "call 4: 0", "call 3: 0", "call 5: 0",
                           "call 5: 0", "call 3: -128"}));
}

TEST_F(FailuresTest, AnExceptionOfAnEventHandlerGoesNoFurther) {
    EXPECT_EQ(host({"click throw", "click press btnAutomatic", "run"}),
              QStringList({"thrown, 0", "run 1:0 2:0 3:0 5:0, stored 3, advanced 9"}));
    EXPECT_EQ(log().filter(QRegularExpression("^\t*Caught C\\+\\+ Exception$")).size(), 1);
}
