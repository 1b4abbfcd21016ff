#pragma once

#include <QLabel>

namespace zandor::designer {

class Document;
class DrawingArea;

/// Says over the grid of a drawing without output columns how there come to be some. Takes no mouse
/// and no drops: they go to what is below.
class GridHint final : public QLabel {
    Q_OBJECT

public:
    /// Both outlive it.
    GridHint(Document& document, DrawingArea& area);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void follow();
    void place();

    Document& mDocument;
    DrawingArea& mArea;
};

} // namespace zandor::designer
