#pragma once

#include <QDialog>

class QLineEdit;
class QTabWidget;
class QTextBrowser;

namespace zandor::designer {

/// The pages that one needs at hand while one draws, to be read beside the window.
class HelpWindow final : public QDialog {
    Q_OBJECT

public:
    enum class Page { criteria, keys };

    explicit HelpWindow(QWidget* parent = nullptr);

    /// Brings a page to the front, with the window.
    void showPage(Page page);

protected:
    void changeEvent(QEvent* event) override;

private:
    void addPage(const QString& file, const QString& title);
    void load(QTextBrowser& browser);
    void find();

    QTabWidget* mPages;
    QLineEdit* mFind;
};

} // namespace zandor::designer
