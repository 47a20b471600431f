#include "GUI/Controls/Artwork.h"

#include <QDirIterator>
#include <QImage>

#include <gtest/gtest.h>

#include <map>

using namespace orvela;

TEST(Artwork, EveryPictureLoadsAtBothScales) {
    initArtwork();
    std::map<int, int> picturesOfHeight;
    QDirIterator files(QStringLiteral(":/"), {QStringLiteral("*.png")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString file = files.next();
        if (file.startsWith(QLatin1String(":/qt-project.org")) || file.endsWith(QLatin1String("@2x.png")))
            continue;
        const QImage image(file);
        ++picturesOfHeight[image.height()];
        EXPECT_EQ(QImage(file.chopped(4) + "@2x.png").size(), image.size() * 2) << qPrintable(file);
        EXPECT_GT(image.convertToFormat(QImage::Format_Indexed8).colorCount(), 15)
            << qPrintable(file) << " is nearly empty";
    }
    EXPECT_EQ(picturesOfHeight, (std::map<int, int>{{16, 23}, {24, 39}, {120, 1}, {128, 1}, {140, 1}}));
}
