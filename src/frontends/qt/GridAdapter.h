#pragma once

#include "frontends/qt/Adapter.h"
#include "frontends/qt/CellComposer.h"
#include "frontends/qt/GridWidget.h"

#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/MSFlexGrid.h>

namespace zandor::platform::qt {

class DragSession;
class KeyboardMenu;

class GridAdapter final : public Adapter<MSFlexGridLib::MSFlexGrid, GridWidget>,
                          private GridListener {
public:
    GridAdapter(GridWidget* widget, FocusTracker& focus, DragSession& drags, KeyboardMenu& menu,
                comforts::Comforts& comforts, MSFlexGridLib::GridEvents events);
    ~GridAdapter() override;

    void Visible(bool value) override { show(value); }
    void Font(const platform::Font& value) override;
    void SetFocus() override;

    std::int32_t Rows() const override;
    std::int32_t Cols() const override;
    std::int32_t TopRow() const override { return grid().firstRow(); }
    std::int32_t LeftCol() const override { return grid().firstCol(); }
    std::int32_t Row() const override { return grid().currentRow(); }
    void Row(std::int32_t value) override;
    std::int32_t Col() const override { return grid().currentCol(); }
    void Col(std::int32_t value) override;
    String Text() const override;
    void Text(const String& value) override;
    void CellAlignment(std::int16_t value) override;
    float CellLeft() const override;
    float CellTop() const override;
    float CellWidth() const override;
    float CellHeight() const override;
    void EnsureVisible() override { grid().showCurrentCell(); }

    String TextMatrix(std::int32_t row, std::int32_t col) const override;
    void TextMatrix(std::int32_t row, std::int32_t col, const String& value) override;
    void CellNote(std::int32_t row, std::int32_t col, const String& value) override;
    float ColPos(std::int32_t col) const override;
    float RowPos(std::int32_t row) const override;
    float ColWidth(std::int32_t col) const override;
    void ColWidth(std::int32_t col, float value) override;
    void ColPosition(std::int32_t col, std::int32_t position) override;
    std::int32_t ColData(std::int32_t col) const override;
    void ColData(std::int32_t col, std::int32_t value) override;

private:
    void pressed(Qt::MouseButton button, Qt::KeyboardModifiers modifiers, QPointF at) override;
    void released(Qt::MouseButton button, Qt::KeyboardModifiers modifiers, QPointF at) override;
    void scrolled() override;
    void menuKey(QPointF at, QPoint screen) override;
    void deleteKey(QPointF at) override;
    bool typed(QKeyEvent& event) override;
    bool composed(QInputMethodEvent& event) override;
    void asked(QInputMethodQueryEvent& query) override;
    QWidget* composer() const override { return mComposer.box(); }
    void left() override { mComposer.breakOff(); }
    bool editKey() override { return mComforts.cellOpened(); }
    bool offersFields() const override { return mComforts.hasFieldsToOffer(); }
    void fieldClicked(int col) override { mComforts.fieldClicked(col); }
    bool columnMovable(int col) override { return mComforts.columnMovable(col); }
    void columnMoved(int col, int position) override { mComforts.columnMoved(col, position); }
    bool moveKey(int step) override { return mComforts.currentColumnMoved(step); }
    void borderDragged(int col) override;
    void borderDoubleClicked(int col) override { mComforts.borderDoubleClicked(col); }
    void clickWithRightButton(QPointF at);
    bool dragAccepted(const QMimeData* data) override;
    bool dropped(const QMimeData* data, QPointF at) override;

    /// Error 91 once the widget has gone.
    GridWidget& grid() const;
    void mustBeRow(std::int32_t row) const;
    void mustBeCol(std::int32_t col) const;
    void mustBeCell(std::int32_t row, std::int32_t col) const;

    DragSession& mDrags;
    KeyboardMenu& mMenu;
    comforts::Comforts& mComforts;
    CellComposer mComposer{mFocus};
    const MSFlexGridLib::GridEvents mEvents;
};

} // namespace zandor::platform::qt
