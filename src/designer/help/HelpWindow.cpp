#include "designer/help/HelpWindow.h"

#include <QBoxLayout>
#include <QEvent>
#include <QFile>
#include <QLineEdit>
#include <QShortcut>
#include <QTabWidget>
#include <QTextBrowser>
#include <QTextTable>

namespace zandor::designer {

namespace {

constexpr QSize newSize(720, 560); // logical pixels
constexpr int pageMargin = 14;
constexpr int cellPadding = 4;

/// Lines between the cells, which Markdown's own tables have none of.
void ruleTables(QTextDocument& document, const QColor& line) {
    for (QTextFrame* frame : document.rootFrame()->childFrames()) {
        auto* const table = qobject_cast<QTextTable*>(frame);
        if (!table) continue;
        QTextTableFormat format = table->format();
        format.setBorderCollapse(true);
        format.setBorder(1);
        format.setBorderStyle(QTextFrameFormat::BorderStyle_Solid);
        format.setBorderBrush(line);
        format.setCellPadding(cellPadding);
        format.setCellSpacing(0);
        format.setWidth(QTextLength(QTextLength::PercentageLength, 100));
        table->setFormat(format);
    }
}

} // namespace

HelpWindow::HelpWindow(QWidget* parent)
    : QDialog(parent), mPages(new QTabWidget), mFind(new QLineEdit) {
    setWindowTitle(tr("Help"));
    setObjectName(QStringLiteral("help"));
    addPage(QStringLiteral(":/help/criteria.md"), tr("&Criteria"));
    addPage(QStringLiteral(":/help/keyboard.md"), tr("&Keys"));
    mFind->setObjectName(QStringLiteral("helpFind"));
    mFind->setPlaceholderText(tr("Find on this page"));
    mFind->setAccessibleName(tr("Find on this page"));
    mFind->setClearButtonEnabled(true);
    connect(mFind, &QLineEdit::returnPressed, this, &HelpWindow::find);
    auto* const toFind = new QShortcut(QKeySequence::Find, this);
    connect(toFind, &QShortcut::activated, mFind, [this] {
        mFind->setFocus();
        mFind->selectAll();
    });
    auto* const layout = new QVBoxLayout(this);
    layout->addWidget(mFind);
    layout->addWidget(mPages, 1);
    resize(newSize);
}

void HelpWindow::addPage(const QString& file, const QString& title) {
    auto* const browser = new QTextBrowser;
    browser->setObjectName(file);
    browser->setAccessibleName(QString(title).remove(u'&'));
    browser->setFrameShape(QFrame::NoFrame);
    browser->setOpenLinks(false);
    // Keys select and scroll, so that the page can be read and copied without a mouse.
    browser->setTextInteractionFlags(Qt::TextBrowserInteraction | Qt::TextSelectableByKeyboard);
    load(*browser);
    mPages->addTab(browser, title);
}

void HelpWindow::load(QTextBrowser& browser) {
    QFile file(browser.objectName());
    if (!file.open(QIODevice::ReadOnly)) return;
    browser.document()->setDocumentMargin(pageMargin);
    browser.document()->setMarkdown(QString::fromUtf8(file.readAll()));
    ruleTables(*browser.document(), browser.palette().color(QPalette::Mid));
    browser.moveCursor(QTextCursor::Start);
}

void HelpWindow::showPage(Page page) {
    mPages->setCurrentIndex(static_cast<int>(page));
    show();
    raise();
    activateWindow();
    mPages->currentWidget()->setFocus();
}

/// From where the last one was, and from the top again behind the last.
void HelpWindow::find() {
    auto& browser = *qobject_cast<QTextBrowser*>(mPages->currentWidget());
    if (browser.find(mFind->text())) return;
    browser.moveCursor(QTextCursor::Start);
    browser.find(mFind->text());
}

void HelpWindow::changeEvent(QEvent* event) {
    QDialog::changeEvent(event);
    if (event->type() != QEvent::PaletteChange) return;
    for (auto* browser : findChildren<QTextBrowser*>()) load(*browser);
}

} // namespace zandor::designer
