#pragma once

#include <Zandor/model/QueryOptions.h>

#include <QWidget>

class QCheckBox;
class QPlainTextEdit;
class QSpinBox;

namespace zandor::designer {

class Document;

/// What is said of the query as a whole, to be read and changed.
class QueryPanel final : public QWidget {
    Q_OBJECT

public:
    /// The document outlives the panel.
    explicit QueryPanel(Document& document, QWidget* parent = nullptr);

private:
    void follow();
    void takeOver();

    Document& mDocument;
    QCheckBox* mDistinct;
    QSpinBox* mFirst;
    QPlainTextEdit* mDescription;
};

} // namespace zandor::designer
