#pragma once

#include "platform/Intrinsic.h"
#include "platform/qt/Canvas.h"

#include <QPointer>
#include <QRegion>
#include <QString>

namespace platform::qt {

/// Something that the canvas paints. Every change repaints only the pixels of the old and of the
/// new appearance.
class CanvasItem {
public:
    CanvasItem(Canvas& canvas, QString name) : mCanvas(&canvas), mName(std::move(name)) {}
    CanvasItem(const CanvasItem&) = delete;
    CanvasItem& operator=(const CanvasItem&) = delete;
    virtual ~CanvasItem() = default;

    const QString& name() const { return mName; }
    bool visible() const { return mVisible; }
    const QRegion& extent() const { return mExtent; }
    /// Items of a lower layer are painted first.
    virtual int layer() const = 0;
    virtual void paint(QPainter& painter, const QPalette& palette) const = 0;

    /// The canvas is going.
    void detach() { mCanvas = nullptr; }

protected:
    /// Takes the item off the canvas; for the destructor of the finished item.
    void leave();
    void setVisible(bool value);
    /// To be called after every change of what `paint` draws.
    void changed(const QRegion& extent);

private:
    Canvas* mCanvas;
    QString mName;
    QRegion mExtent;
    bool mVisible = false;
};

class CanvasLine final : public platform::Line, public CanvasItem {
public:
    CanvasLine(Canvas& canvas, QString name);
    ~CanvasLine() override;

    float X1() const override { return mX1; }
    float Y1() const override { return mY1; }
    float X2() const override { return mX2; }
    float Y2() const override { return mY2; }
    void setEnds(float X1, float Y1, float X2, float Y2) override;
    void BorderWidth(std::int16_t value) override;
    std::int16_t borderWidth() const { return mBorderWidth; }
    void Visible(bool value) override { setVisible(value); }

    int layer() const override { return 0; }
    void paint(QPainter& painter, const QPalette& palette) const override;

private:
    QRegion area() const;

    float mX1 = 0, mY1 = 0, mX2 = 0, mY2 = 0;
    std::int16_t mBorderWidth = 1;
};

class CanvasShape final : public platform::Shape, public CanvasItem {
public:
    CanvasShape(Canvas& canvas, QString name);
    ~CanvasShape() override;

    Bounds bounds() const override { return mBounds; }
    void setBounds(const Bounds& bounds) override;
    void ShapeStyle(std::int16_t value) override;
    std::int16_t shapeStyle() const { return mStyle; }
    void Visible(bool value) override { setVisible(value); }

    int layer() const override { return 1; }
    void paint(QPainter& painter, const QPalette& palette) const override;

private:
    QRegion area() const;

    Bounds mBounds;
    std::int16_t mStyle = shapeSquare;
};

} // namespace platform::qt
