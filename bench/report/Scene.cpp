#include "Scene.h"

#include <QPainter>

namespace report {

namespace {

constexpr qreal titleHeight = 27;
constexpr qreal rowHeight = 19;
constexpr qreal markSize = 9;

} // namespace

SceneTable::SceneTable(QString name, QStringList columns, const QRect& place)
    : QGraphicsRectItem(QRectF(QPointF(), QSizeF(place.size()))), mName(std::move(name)),
      mColumns(std::move(columns)) {
    setPos(place.topLeft());
    setFlag(ItemIsMovable);
    setFlag(ItemSendsGeometryChanges);
    setZValue(1);
}

QPointF SceneTable::edge(int column, bool right) const {
    const qreal row = titleHeight + rowHeight * (column + 0.5);
    const qreal y = std::clamp(row, markSize / 2, rect().height() - markSize / 2);
    return mapToScene(right ? rect().right() : rect().left(), y);
}

void SceneTable::paint(QPainter* painter, const QStyleOptionGraphicsItem*, QWidget* widget) {
    const QPalette palette = widget ? widget->palette() : QPalette();
    painter->setPen(palette.color(QPalette::Mid));
    painter->setBrush(palette.base());
    painter->drawRect(rect());
    const QRectF title(0, 0, rect().width(), titleHeight);
    painter->fillRect(title.adjusted(1, 1, 0, 0), palette.alternateBase());
    painter->setPen(palette.color(QPalette::Text));
    painter->drawText(title.adjusted(8, 0, -8, 0), Qt::AlignVCenter, mName);
    qreal y = titleHeight;
    for (const QString& column : mColumns) {
        if (y + rowHeight > rect().height()) break;
        painter->drawText(QRectF(8, y, rect().width() - 16, rowHeight), Qt::AlignVCenter, column);
        y += rowHeight;
    }
}

QVariant SceneTable::itemChange(GraphicsItemChange change, const QVariant& value) {
    if (change == ItemPositionHasChanged)
        for (SceneJoin* join : mJoins) join->follow();
    return QGraphicsRectItem::itemChange(change, value);
}

SceneJoin::SceneJoin(SceneTable& left, int leftColumn, SceneTable& right, int rightColumn)
    : mLeft(left), mLeftColumn(leftColumn), mRight(right), mRightColumn(rightColumn), mWest(this),
      mEast(this) {
    left.add(this);
    right.add(this);
    setPen(QPen(Qt::darkGray, 1.2));
    for (QGraphicsRectItem* mark : {&mWest, &mEast}) {
        mark->setRect(0, 0, markSize, markSize);
        mark->setPen(pen());
        mark->setBrush(Qt::white);
    }
    follow();
}

void SceneJoin::follow() {
    const bool leftIsWest = mRight.x() > mLeft.x();
    const QPointF west =
        leftIsWest ? mLeft.edge(mLeftColumn, true) : mRight.edge(mRightColumn, true);
    const QPointF east =
        leftIsWest ? mRight.edge(mRightColumn, false) : mLeft.edge(mLeftColumn, false);
    mWest.setPos(west - QPointF(0, markSize / 2));
    mEast.setPos(east - QPointF(markSize, markSize / 2));
    setLine(QLineF(west + QPointF(markSize, 0), east - QPointF(markSize, 0)));
}

Scene::Scene(const Setting& setting, bool cached)
    : mView(std::make_unique<QGraphicsView>()), mPainted(*mView) {
    QStringList columns;
    for (int c = 0; c < setting.columns; ++c) columns += Setting::columnName(c);
    for (int t = 0; t < setting.tables; ++t) {
        auto* table = new SceneTable(Setting::tableName(t), columns, Setting::place(t));
        if (cached) table->setCacheMode(QGraphicsItem::DeviceCoordinateCache);
        mScene.addItem(table);
        mTables.push_back(table);
    }
    for (const auto& join : setting.allJoins())
        mScene.addItem(
            new SceneJoin(table(join.left), join.leftColumn, table(join.right), join.rightColumn));
    mScene.setSceneRect(QRectF(QPointF(), QSizeF(Setting::canvas)));
    mView->setScene(&mScene);
    mView->setRenderHint(QPainter::Antialiasing);
    mView->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    mView->resize(Setting::window);
    mView->show();
    mPainted.wait();
}

} // namespace report
