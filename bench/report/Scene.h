#pragma once

#include "Painted.h"
#include "Setting.h"

#include <QGraphicsItem>
#include <QGraphicsView>

namespace report {

class SceneJoin;

/// A table as users of QGraphicsScene write it: a rectangle that paints its title and those of its
/// texts that fit, can be moved by the mouse, and takes its lines along.
class SceneTable final : public QGraphicsRectItem {
public:
    SceneTable(QString name, QStringList columns, const QRect& place);

    void add(SceneJoin* join) { mJoins.push_back(join); }
    /// The middle of a column's row at the left or right edge, in the scene; at the upper or lower
    /// edge of the box when the row is not in view.
    QPointF edge(int column, bool right) const;

private:
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget*) override;
    QVariant itemChange(GraphicsItemChange change, const QVariant& value) override;

    const QString mName;
    const QStringList mColumns;
    std::vector<SceneJoin*> mJoins;
};

/// A line with a mark at each end.
class SceneJoin final : public QGraphicsLineItem {
public:
    SceneJoin(SceneTable& left, int leftColumn, SceneTable& right, int rightColumn);
    void follow();

private:
    SceneTable& mLeft;
    const int mLeftColumn;
    SceneTable& mRight;
    const int mRightColumn;
    QGraphicsRectItem mWest, mEast;
};

/// The setting as a scene in a view that is a window.
class Scene {
public:
    Scene(const Setting& setting, bool cached);

    QGraphicsView& view() { return *mView; }
    Painted& painted() { return mPainted; }
    SceneTable& table(int number) { return *mTables[static_cast<std::size_t>(number)]; }

private:
    QGraphicsScene mScene;
    std::unique_ptr<QGraphicsView> mView;
    std::vector<SceneTable*> mTables;
    Painted mPainted;
};

} // namespace report
