#pragma once

#include "designer/chart/ChartData.h"
#include "designer/show/Picture.h"

#include <QFont>

namespace zandor::designer {

/// A chart for a page: on white, whatever colours the window has.
class ChartPicture final : public Picture {
public:
    /// The data has at least a point and a series.
    ChartPicture(ChartData data, const QFont& font, const QSize& size)
        : mData(std::move(data)), mFont(font), mSize(size) {}

    QSize size() const override { return mSize; }

protected:
    void render(QPainter& painter) const override;

private:
    const ChartData mData;
    const QFont mFont;
    const QSize mSize;
};

} // namespace zandor::designer
