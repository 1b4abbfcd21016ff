#include "designer/chart/ChartLook.h"

namespace zandor::designer {

namespace {

QColor mixed(const QColor& one, const QColor& other, double share) {
    const auto mix = [share](int a, int b) { return static_cast<int>(a + (b - a) * share); };
    return {mix(one.red(), other.red()), mix(one.green(), other.green()),
            mix(one.blue(), other.blue())};
}

ChartLook look(const QColor& background, const QColor& text, const QFont& font) {
    constexpr int middle = 128;
    ChartLook result{
        font, background, text, mixed(background, text, 0.68), mixed(background, text, 0.14), {}};
    if (background.lightness() < middle)
        result.series = {0x57bcf3, 0xf0a030, 0x2bbf8f, 0xe790c4, 0xece15a, 0x8d75ff};
    else
        result.series = {0x0064ac, 0xd06800, 0x00926c, 0xb0719d, 0x794e13, 0x3a2a80};
    return result;
}

} // namespace

ChartLook ChartLook::of(const QPalette& palette, const QFont& font) {
    return look(palette.color(QPalette::Base), palette.color(QPalette::Text), font);
}

ChartLook ChartLook::ofPage(const QFont& font) { return look(Qt::white, Qt::black, font); }

} // namespace zandor::designer
