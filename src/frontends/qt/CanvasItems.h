#pragma once

#include "frontends/qt/Canvas.h"
#include "frontends/qt/LineEnds.h"

#include <Zandor/platform/Intrinsic.h>

#include <QAccessible>
#include <QRegion>
#include <QString>

namespace zandor::platform::qt {

/// Something that the canvas paints. A change repaints the pixels of the old and of the new
/// appearance, once for all the changes that an event of the user brings.
class CanvasItem {
public:
    CanvasItem(Canvas& canvas, QString name) : mCanvas(&canvas), mName(std::move(name)) {}
    CanvasItem(const CanvasItem&) = delete;
    CanvasItem& operator=(const CanvasItem&) = delete;
    virtual ~CanvasItem() = default;

    const QString& name() const { return mName; }
    bool visible() const { return mVisible; }
    const QRegion& extent() const;
    /// Items of a lower layer are painted first.
    virtual int layer() const = 0;
    /// Whatever the painter is set to.
    virtual void paint(QPainter& painter, const QPalette& palette) const = 0;
    /// Whether something of the item stands above every line and mark.
    virtual bool reachesAbove() const { return false; }
    virtual void paintAbove(QPainter&, const QPalette&) const {}
    /// The canvas has another font.
    void fontChanged() { changed(); }

    /// Whether the item is one of the marks at a line's ends.
    virtual bool touches(const CanvasLine&) const { return false; }
    /// Shows that the keyboard's focus is on the item.
    void setFocused(bool value);

    /// Whether the item is painted below all that are not, and so may belong to the backdrop.
    virtual bool isGround() const { return false; }
    /// Whether it has been painted often enough without a change to be part of the backdrop.
    bool rests() const { return mPaintings > paintingsToRest; }
    /// The canvas is about to be painted. True when the item comes to rest by that.
    bool settle();
    /// The canvas has taken the item's changes in.
    void taken() { mNoted = false; }

    /// The canvas is going.
    void detach() { mCanvas = nullptr; }

protected:
    /// Takes the item off the canvas; for the destructor of the finished item.
    void leave();
    void setVisible(bool value);
    /// To be called after every change of what `paint` draws.
    void changed();
    virtual QRegion area() const = 0;
    Canvas* canvas() const { return mCanvas; }
    bool focused() const { return mFocused; }

private:
    void note();

    /// What a drag moves is changed before each painting.
    static constexpr int paintingsToRest = 2;

    Canvas* mCanvas;
    QString mName;
    mutable QRegion mExtent; ///< as it was last asked for
    mutable bool mMeasured = true;
    bool mNoted = false; ///< by the canvas, as one that changes
    int mPaintings = 0;  ///< since the last change
    bool mVisible = false;
    bool mFocused = false;
};

class CanvasLine final : public platform::Line, public CanvasItem {
public:
    /// `asked` holds, whenever the ends are set, the entries that they belong to.
    CanvasLine(Canvas& canvas, QString name, std::int16_t index, const LineEnds& asked);
    ~CanvasLine() override;

    float X1() const override { return mX1; }
    float Y1() const override { return mY1; }
    float X2() const override { return mX2; }
    float Y2() const override { return mY2; }
    void setEnds(float X1, float Y1, float X2, float Y2) override;
    void BorderWidth(std::int16_t value) override;
    std::int16_t borderWidth() const { return mBorderWidth; }
    void Visible(bool value) override { setVisible(value); }
    void Notes(const LineNotes& value) override;
    const LineNotes& notes() const { return mNotes; }

    std::int16_t index() const { return mIndex; }
    const LineEnds& ends() const { return mEnds; }
    /// In twips: the place at a share of the way from the first end.
    QPointF at(double share) const;
    /// In twips, from the nearest place of the line.
    double distanceTo(QPointF place) const;
    /// What stands for the line in the tree of accessible objects; lives as long as the line.
    QAccessibleInterface* accessible();

    int layer() const override { return 0; }
    /// A highlighted line stands above the others.
    bool isGround() const override { return mBorderWidth <= 1 && !focused(); }
    void paint(QPainter& painter, const QPalette& palette) const override;
    bool reachesAbove() const override { return !(mNotes == LineNotes{}); }
    void paintAbove(QPainter& painter, const QPalette& palette) const override;

private:
    /// A note and the plate that it stands on, in logical pixels.
    struct Plate {
        QString text;
        QRectF place;
    };

    QRegion area() const override;
    QFont plateFont() const;
    std::vector<Plate> plates() const;

    const std::int16_t mIndex;
    const LineEnds& mAsked;
    LineEnds mEnds;
    LineNotes mNotes;
    float mX1 = 0, mY1 = 0, mX2 = 0, mY2 = 0;
    std::int16_t mBorderWidth = 1;
    QAccessible::Id mAccessible = 0;
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
    bool touches(const CanvasLine& line) const override;
    void paint(QPainter& painter, const QPalette& palette) const override;

private:
    QRegion area() const override;

    Bounds mBounds;
    std::int16_t mStyle = shapeSquare;
};

} // namespace zandor::platform::qt
