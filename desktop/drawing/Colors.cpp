#include "desktop/drawing/Colors.h"
#include <algorithm>
#include <cmath>

namespace {

constexpr float kWhole = 65535.0f;
constexpr int kWhitePercent = 100;

double Share(unsigned short component) { return static_cast<float>(component) / kWhole; }

unsigned short Component(double share) {
    double within = share > 0.0 ? std::min(share, 1.0) : 0.0;
    return static_cast<unsigned short>(std::lround(within * kWhole));
}

} // namespace

OS::RGBAColor ToRGBA(RGBColor const &color) {
    return {Share(color.red), Share(color.green), Share(color.blue), 1.0};
}

RGBColor ToRGB(OS::RGBAColor const &color) {
    return {Component(color.r), Component(color.g), Component(color.b)};
}

RGBColor GrayOf(int percent) {
    int within = std::clamp(percent, 0, kWhitePercent);
    unsigned short component = Component(static_cast<double>(within) / kWhitePercent);
    return {component, component, component};
}
