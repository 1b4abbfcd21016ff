#pragma once

#include "designer/OpenedQuery.h"
#include "model/Library.h"
#include "platform/qt/ZandorWidget.h"

#include <QMainWindow>

namespace designer {

/// The designer's window: the control over one query.
class DesignerWindow final : public QMainWindow {
    Q_OBJECT

public:
    /// The inner width of a new window in twips, for the arranging of tables.
    static std::int32_t canvasWidth();

    explicit DesignerWindow(const OpenedQuery& opened);
    ~DesignerWindow() override;

    ZandorWidget& designer() { return *mDesigner; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void fitCanvas(const QSize& visible);

    model::Library mLibrary;
    const platform::Ref<model::Query> mQuery;
    ZandorWidget* mDesigner; ///< a child of the window
};

} // namespace designer
