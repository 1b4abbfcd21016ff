#pragma once

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/model/Finding.h>

#include <QPointer>
#include <QVariantMap>

namespace zandor::designer {

class Document;

/// The control over the document's query. Whenever the query has changed, by the control or by
/// others, the control shows it anew; for another query, and with other options, a new control is
/// made.
class DrawingArea final : public QWidget {
    Q_OBJECT

public:
    explicit DrawingArea(Document& document, QWidget* parent = nullptr);
    ~DrawingArea() override;

    /// The control of the moment. It goes when another query or other options come: keep it no
    /// longer than a statement, and connect to every one from controlMade().
    ZandorWidget& control() { return *mControl; }
    /// The control's properties by name, set on this control and all later ones before they get
    /// their model.
    void setOptions(const QVariantMap& options);
    const QVariantMap& options() const { return mOptions; }

    /// Marks the cells of the grid that the findings are about.
    void showFindings(const model::Findings& findings);
    /// The share of the height that the canvas has above the grid, of this control and later ones.
    void setPaneShare(double share);

    /// The place on the canvas, in twips, that is seen at a place of this widget.
    QPoint canvasPlace(QPoint at) const;

signals:
    /// A control was made, and has its options and not yet its model.
    void controlMade(ZandorWidget* control);
    /// The user has moved the divider.
    void paneShareChanged(double share);
    /// The user wants another name for the table of a key.
    void renameRequested(const QString& key);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void showAnew();
    void makeControl();
    void fitCanvas();
    void growCanvas();

    Document& mDocument;
    model::Library mLibrary; ///< outlives every control
    QVariantMap mOptions;
    std::vector<comforts::Finding> mFindings;
    double mPaneShare = 0.6;
    ZandorWidget* mControl = nullptr;
};

} // namespace zandor::designer
