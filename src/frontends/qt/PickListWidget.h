#pragma once

#include "frontends/qt/Adapter.h"

#include <Zandor/platform/PickList.h>
#include <Zandor/platform/Words.h>

#include <QFrame>

class QKeyEvent;
class QLineEdit;
class QListView;
class QSortFilterProxyModel;
class QStringListModel;

namespace zandor::platform::qt {

/// A box and, below it, the list of what is left of the items.
class PickListWidget : public QFrame {
public:
    using Picked = std::function<void(int position)>;

    PickListWidget(QWidget* parent, Picked picked);

    void setWords(const Words& words);
    void open(const QRect& over, const QStringList& items, const QString& typed, int position);
    /// Called when the user has done with it, before an item is told.
    void setClose(std::function<void()> close) { mClose = std::move(close); }

    QLineEdit& box() const { return *mBox; }
    QListView& list() const { return *mList; }

    bool eventFilter(QObject* watched, QEvent* event) override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void stand(const QRect& over);
    void chooseFirst();
    bool keyPressed(const QKeyEvent& event);
    void pick(const QModelIndex& index);

    Picked mPicked;
    std::function<void()> mClose;
    QStringListModel* mItems;
    QSortFilterProxyModel* mLeft;
    QLineEdit* mBox;
    QListView* mList;
};

class PickListAdapter final : public Adapter<platform::PickList, PickListWidget> {
public:
    PickListAdapter(PickListWidget* widget, FocusTracker& focus);

    void Open(const Bounds& over, const std::vector<String>& items, const String& typed,
              std::int32_t position) override;
    void Close() override { show(false); }
    bool IsOpen() const override { return mWidget && !mWidget->isHidden(); }
};

} // namespace zandor::platform::qt
