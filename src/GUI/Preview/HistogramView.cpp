#include "GUI/Preview/HistogramView.h"

#include <QPainter>

#include <algorithm>
#include <numeric>

namespace orvela {

namespace {

constexpr int kHeight = 72;
constexpr std::int64_t kPixelsCounted = 1'000'000;
const QColor kGround(38, 38, 40);
const QColor kBefore(240, 240, 240);
const std::array<QColor, 3> kChannelColors = {QColor(210, 60, 60), QColor(60, 180, 70), QColor(80, 110, 240)};

std::uint8_t lumaOf(int red, int green, int blue) {
    return static_cast<std::uint8_t>((299 * red + 587 * green + 114 * blue + 500) / 1000);
}

// Full black and white stand apart: a clipped sky must not flatten everything else.
double mostOf(const LevelCounts::Counts& counts) {
    return *std::max_element(counts.begin() + 1, counts.end() - 1);
}

} // namespace

LevelCounts LevelCounts::of(const CARGBPlane& picture) {
    LevelCounts counts;
    const std::int64_t pixels = picture.pixelCount();
    std::int64_t step = std::max<std::int64_t>(1, pixels / kPixelsCounted);
    while (std::gcd(step, std::int64_t{picture.width()}) > 1)
        ++step;                                                     // or some columns would never be counted
    const bool grey = picture.colorMode() == CARGBPlane::Grayscale; // the preview shows the first channel
    std::array<const std::uint8_t*, 3> samples = {};
    for (std::size_t c = 0; c < 3; ++c)
        samples[c] = picture.samples(grey ? Channel::Red : kChannels[c]);
    for (std::int64_t i = 0; i < pixels; i += step) {
        for (std::size_t c = 0; c < 3; ++c)
            ++counts.channels[c][samples[c][i]];
        ++counts.luma[lumaOf(samples[0][i], samples[1][i], samples[2][i])];
    }
    return counts;
}

HistogramView::HistogramView(QWidget* parent) : QWidget(parent) {
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    setAccessibleName(tr("Histogram"));
    setToolTip(tr("How often each brightness and colour occurs, from black to white. The line is the "
                  "original picture."));
}

void HistogramView::setCounts(const LevelCounts& counts) {
    mCounts = counts;
    update();
}

void HistogramView::setBefore(const LevelCounts& counts) {
    mBefore = counts;
    update();
}

QSize HistogramView::sizeHint() const {
    return {256, kHeight};
}

QPolygonF HistogramView::curve(const LevelCounts::Counts& counts, double most) const {
    QPolygonF points;
    for (std::size_t level = 0; level < counts.size(); ++level) {
        const double share = std::min(1.0, counts[level] / most);
        points.append({static_cast<double>(level) * (width() - 1) / 255, (height() - 1) * (1 - share)});
    }
    return points;
}

void HistogramView::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.fillRect(rect(), kGround);
    painter.setRenderHint(QPainter::Antialiasing);
    double most = mostOf(mBefore.luma);
    for (const LevelCounts::Counts& counts : mCounts.channels)
        most = std::max(most, mostOf(counts));
    if (most == 0)
        return;
    painter.setPen(Qt::NoPen);
    painter.setCompositionMode(QPainter::CompositionMode_Plus); // where all colours meet it is grey
    for (std::size_t c = 0; c < kChannelColors.size(); ++c) {
        QPolygonF area = curve(mCounts.channels[c], most);
        area << QPointF(width() - 1, height()) << QPointF(0, height());
        painter.setBrush(kChannelColors[c].darker(130));
        painter.drawPolygon(area);
    }
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    painter.setPen(QPen(kBefore, 1));
    painter.drawPolyline(curve(mBefore.luma, most));
}

} // namespace orvela
