#include "frontends/qt/Desk.h"

#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/QtToolkit.h"

#include <QMimeData>
#include <QUrl>

#include <functional>

using namespace zandor;

// What is dragged in from elsewhere. Only columns of the same control mean anything to it; all else
// is refused, so that the mouse shows it, and changes nothing if it is dropped all the same.

namespace {

using Parts = std::vector<std::pair<QWidget*, QPointF>>;

/// Two widgets in two windows, each with a query of its own.
class AForeignDrop : public Desk {
protected:
    AForeignDrop() {
        makeOne();
        other = std::move(widget);
        otherModel = std::move(model);
        open();
        makeOne();
    }

    void makeOne() {
        show();
        bind();
        for (const auto signal : {&ZandorWidget::Activate, &ZandorWidget::TableMoved})
            QObject::connect(widget.get(), signal, widget.get(), [this] { ++events; });
        QObject::connect(widget.get(), &ZandorWidget::JoinCreated, widget.get(),
                         [this] { ++events; });
        QObject::connect(widget.get(), &ZandorWidget::ColumnCreated, widget.get(),
                         [this] { ++events; });
    }

    /// The places of the widget that take columns of its own: entries, empty places, cells, labels.
    Parts targets() {
        auto& list = table(3).list();
        auto& view = grid().view();
        return {{list.viewport(), QRectF(list.visualRect(list.model()->index(1, 0))).center()},
                {list.viewport(), QPointF(20, list.viewport()->height() - 2)},
                {&table(2), QRectF(table(2).titleBar()).center()},
                {view.viewport(), QPointF(30, 30)},
                {&grid(), QRectF(grid().cellRect(2, 0)).center()},
                {&grid(), QRectF(grid().cellRect(0, 1)).center()},
                {&child<QWidget>("fraTable"), QPointF(550, 20)}};
    }

    /// What a drop could have changed, in both widgets.
    QStringList state() {
        QStringList all{QString::number(events)};
        for (const auto& query : {model, otherModel})
            all += QStringLiteral("%1 joins, %2 columns")
                       .arg(query->joinCount())
                       .arg(query->definitionCount());
        for (const int index : {1, 2, 3})
            for (const auto& at : table(index).list().selectionModel()->selectedRows())
                all += at.data().toString();
        for (int col = 1; col < 6; ++col) all += grid().model().text(0, col);
        return all;
    }

    void refuses(const QMimeData& data, Qt::DropActions actions = Qt::CopyAction) {
        for (const auto& [part, at] : targets()) {
            const QStringList before = state();
            QWindow& window = *widget->windowHandle();
            const QPoint place = part->mapTo(widget.get(), at.toPoint());
            QDragEnterEvent enter(place, actions, &data, Qt::LeftButton, Qt::NoModifier);
            QCoreApplication::sendEvent(&window, &enter);
            QDragMoveEvent move(place, actions, &data, Qt::LeftButton, Qt::NoModifier);
            QCoreApplication::sendEvent(&window, &move);
            EXPECT_FALSE(move.isAccepted()) << place.x() << ' ' << place.y();
            QDropEvent drop(place, actions, &data, Qt::NoButton, Qt::NoModifier);
            QCoreApplication::sendEvent(&window, &drop);
            // And to the part itself, past the window's own judgement.
            for (QWidget* w = part; w && w != widget.get(); w = w->parentWidget())
                if (w->acceptDrops()) {
                    QDragEnterEvent entering(w->mapFrom(widget.get(), place), actions, &data,
                                             Qt::LeftButton, Qt::NoModifier);
                    QCoreApplication::sendEvent(w, &entering);
                    EXPECT_FALSE(entering.isAccepted()) << w->objectName().toStdString();
                    QDropEvent straight(w->mapFrom(widget.get(), place), actions, &data,
                                        Qt::NoButton, Qt::NoModifier);
                    QCoreApplication::sendEvent(w, &straight);
                    EXPECT_FALSE(straight.isAccepted()) << w->objectName().toStdString();
                }
            settle();
            EXPECT_EQ(state(), before) << place.x() << ' ' << place.y();
        }
    }

    /// Drags the selected columns of a widget's first table, and does something meanwhile.
    void whileDragging(ZandorWidget& from, const std::function<void(QDrag&)>& meanwhile) {
        int carried = 0;
        from.toolkit().drags().setCarrier([&](QDrag& drag) {
            ++carried;
            meanwhile(drag);
        });
        auto& list =
            static_cast<platform::qt::TabuletWidget*>(from.findChild<QWidget*>("lstTable(1)"))
                ->list();
        const QPointF at = QRectF(list.visualRect(list.model()->index(2, 0))).center();
        hands::mouse(*list.viewport(), QEvent::MouseButtonPress, at, Qt::LeftButton,
                     Qt::LeftButton);
        hands::mouse(*list.viewport(), QEvent::MouseMove, at, Qt::NoButton, Qt::LeftButton);
        settle();
        EXPECT_EQ(carried, 1);
    }

    /// A drag of the widget's own, to an entry of another table.
    void dragWithin() {
        auto& list = table(3).list();
        whileDragging(*widget, [&](QDrag& drag) {
            hands::carry(drag, *list.viewport(),
                         QRectF(list.visualRect(list.model()->index(1, 0))).center());
        });
    }

    std::unique_ptr<ZandorWidget> other;
    Ref<fake::Model> otherModel;
    int events = 0;
};

} // namespace

TEST_F(AForeignDrop, OfColumnsOfAnotherControlIsRefusedByListsAndGrid) {
    whileDragging(*other, [this](QDrag& drag) { refuses(*drag.mimeData()); });
    EXPECT_EQ(state().first(), "0");
}

TEST_F(AForeignDrop, OfColumnsOfAnotherControlLeavesTheOwnDragsWorking) {
    const int before = model->joinCount();
    whileDragging(*other, [this](QDrag& drag) { refuses(*drag.mimeData()); });
    dragWithin();
    EXPECT_EQ(model->joinCount(), before + 1);
    EXPECT_EQ(otherModel->joinCount(), before);
}

TEST_F(AForeignDrop, OfTheControlsOwnColumnsIsForeignOnceTheirDragIsOver) {
    QMimeData kept;
    whileDragging(*widget, [&kept](QDrag& drag) {
        for (const QString& format : drag.mimeData()->formats())
            kept.setData(format, drag.mimeData()->data(format));
    });
    ASSERT_FALSE(kept.formats().isEmpty());
    refuses(kept);
}

TEST_F(AForeignDrop, OfOtherDataUnderTheNameOfColumnsIsRefused) {
    QMimeData data;
    whileDragging(*widget, [&](QDrag& drag) {
        for (const QString& format : drag.mimeData()->formats()) data.setData(format, "columns");
        refuses(data);
    });
}

TEST_F(AForeignDrop, OfTextIsRefused) {
    QMimeData data;
    data.setText("CUSTOMER_ID");
    refuses(data);
    data.setHtml("<b>CUSTOMER_ID</b>");
    refuses(data, Qt::CopyAction | Qt::MoveAction);
}

TEST_F(AForeignDrop, OfFilesIsRefused) {
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile("/tmp/orders.csv"), QUrl("http://localhost/orders")});
    refuses(data);
}

TEST_F(AForeignDrop, OfTextIsRefusedWhileColumnsAreDragged) {
    QMimeData data;
    data.setText("CUSTOMER_ID");
    whileDragging(*widget, [&](QDrag&) { refuses(data); });
}

TEST_F(AForeignDrop, OfAListsOwnRowsIsRefused) {
    // What a list view of Qt drags.
    auto& list = table(1).list();
    const std::unique_ptr<QMimeData> rows(list.model()->mimeData({list.model()->index(1, 0)}));
    ASSERT_TRUE(rows);
    refuses(*rows);
}
