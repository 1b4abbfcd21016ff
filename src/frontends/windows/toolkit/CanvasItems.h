#pragma once

#include "frontends/windows/toolkit/Canvas.h"

#include <Zandor/platform/Intrinsic.h>
#include <Zandor/platform/Tabulet.h>

#include <vector>

namespace zandor::platform::windows {

/// Something that the canvas paints: it has no window.
class CanvasItem {
public:
    CanvasItem(const std::shared_ptr<Canvas>& canvas, StringView name, std::int16_t index);
    CanvasItem(const CanvasItem&) = delete;
    CanvasItem& operator=(const CanvasItem&) = delete;
    virtual ~CanvasItem() = default;

    /// "linJoin(3)"
    const String& name() const { return mName; }
    std::int16_t index() const { return mIndex; }
    bool visible() const { return mVisible; }
    /// Whether the keyboard's focus is on it.
    bool focused() const;

    /// Lines are below marks.
    virtual int layer() const = 0;
    /// The pixels of the canvas that it may touch.
    virtual std::vector<RECT> places() const = 0;
    virtual void paint(HDC dc) const = 0;
    /// What stands above all lines and marks.
    virtual void paintAbove(HDC) const {}
    /// Has the canvas painted where it is, before and after a change.
    void invalidate() const;

protected:
    void setVisible(bool value);
    /// For the destructor of the finished item.
    void leave();
    Canvas* canvas() const { return mCanvas->isAlive() ? mCanvas.get() : nullptr; }
    POINT pixelPoint(float x, float y) const;
    Surroundings& around() const;
    const Scale& scale() const;

private:
    const std::shared_ptr<Canvas> mCanvas;
    const String mName;
    const std::int16_t mIndex;
    bool mVisible = false;
};

class CanvasLine final : public platform::Line, public CanvasItem {
public:
    CanvasLine(const std::shared_ptr<Canvas>& canvas, StringView name, std::int16_t index);
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

    /// In twips: the place at a share of the way from the first end.
    TalvikTabulet::Point at(float share) const;
    /// In twips, from the nearest place of the line.
    float distanceTo(TalvikTabulet::Point place) const;
    /// The place that it takes, in pixels.
    RECT place() const;

    int layer() const override { return 0; }
    std::vector<RECT> places() const override;
    void paint(HDC dc) const override;
    void paintAbove(HDC dc) const override;

private:
    /// A note and the plate that it stands on, in pixels.
    struct Plate {
        String text;
        RECT place;
    };

    HFONT plateFont() const;
    std::vector<Plate> plates() const;

    LineNotes mNotes;
    float mX1 = 0, mY1 = 0, mX2 = 0, mY2 = 0;
    std::int16_t mBorderWidth = 1;
};

class CanvasShape final : public platform::Shape, public CanvasItem {
public:
    CanvasShape(const std::shared_ptr<Canvas>& canvas, StringView name, std::int16_t index);
    ~CanvasShape() override;

    Bounds bounds() const override { return mBounds; }
    void setBounds(const Bounds& bounds) override;
    void ShapeStyle(std::int16_t value) override;
    std::int16_t shapeStyle() const { return mStyle; }
    void Visible(bool value) override { setVisible(value); }

    int layer() const override { return 1; }
    std::vector<RECT> places() const override;
    void paint(HDC dc) const override;

private:
    /// Whether it is one of the marks at the ends of the line with the focus.
    bool touchesFocus() const;

    Bounds mBounds;
    std::int16_t mStyle = shapeSquare;
};

} // namespace zandor::platform::windows
