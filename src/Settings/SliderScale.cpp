#include "Settings/SliderScale.h"

namespace orvela {

QString SliderScale::text(double position) const {
    return SliderScales::textOf(toShown(position));
}

double SliderScale::told(double position) const {
    return toPosition(text(position).toDouble());
}

namespace SliderScales {

QString textOf(double shown) {
    return QString::number(shown, 'f', kDecimals);
}

double gammaAt(double position) {
    return position < 500 ? 0.1 + position * 0.0018 : 1 + (position - 500) * 0.018;
}

const SliderScale Tenth = {[](double p) { return p * 0.1; }, [](double v) { return v * 10; }};
const SliderScale Hundredth = {[](double p) { return p * 0.01; }, [](double v) { return v * 100; }};
const SliderScale Thousandth = {[](double p) { return p / 1000; }, [](double v) { return v * 1000; }};
const SliderScale Temperature = {[](double p) { return p * 8 + 2000; },
                                 [](double v) { return (v - 2000) * 0.125; }};
const SliderScale Sharpness = {[](double p) { return p * 0.041 + 30; },
                               [](double v) { return (v - 30) * 24.390243902439025; }};
const SliderScale Noise = {[](double p) { return p * 0.0045 + 0.5; },
                           [](double v) { return (v - 0.5) * 222.22222222222223; }};
const SliderScale Spots = {[](double p) { return p * 0.0995 + 0.5; },
                           [](double v) { return (v - 0.5) * 10.050251256281408; }};
const SliderScale Moire = {[](double p) { return p * 0.0099 + 0.1; },
                           [](double v) { return (v - 0.1) * 101.01010101010101; }};
const SliderScale Contrast = {[](double p) { return p * 0.2 - 100; }, [](double v) { return v * 5 + 500; }};
const SliderScale Brightness = {[](double p) { return p * 0.51 - 255; },
                                [](double v) { return v * 1.9607843137254901 + 500; }};
const SliderScale Gamma = {gammaAt, [](double v) {
                               return v < 1 ? (v - 0.1) * 555.5555555555555
                                            : (v - 1) * 55.55555555555556 + 500;
                           }};
const SliderScale Shadows = {[](double p) { return p * 0.255; },
                             [](double v) { return v * 3.9215686274509802; }};
const SliderScale Highlights = {[](double p) { return 255 - p * 0.255; },
                                [](double v) { return (255 - v) * 3.9215686274509802; }};

} // namespace SliderScales

} // namespace orvela
