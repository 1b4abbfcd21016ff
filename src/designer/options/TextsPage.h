#pragma once

#include <QWidget>

class QTableWidget;

namespace zandor::designer {

class ControlOptions;

/// The options dialog's page of the texts that the control shows.
class TextsPage final : public QWidget {
    Q_OBJECT

public:
    explicit TextsPage(QWidget* parent = nullptr);

    void setOptions(const ControlOptions& options);
    void collect(ControlOptions& options) const;

signals:
    void edited();

private:
    void fill(const char* language);

    QTableWidget* mTable;
};

} // namespace zandor::designer
