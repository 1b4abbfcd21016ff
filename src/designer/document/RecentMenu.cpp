#include "designer/document/RecentMenu.h"

#include "designer/document/RecentFiles.h"
#include "frontends/qt/ShownText.h"

#include <QDir>
#include <QFontMetrics>

namespace zandor::designer {

namespace {

/// As much as says which one it is.
QString shown(const QString& fileOrAddress, const QFontMetrics& metrics) {
    constexpr int widest = 400;
    QString text = fileOrAddress;
    const QString home = QDir::homePath() + QLatin1Char('/');
    if (text.startsWith(home)) text.replace(0, home.size(), QStringLiteral("~/"));
    return metrics.elidedText(platform::qt::asSigns(text), Qt::ElideMiddle, widest)
        .replace(QLatin1Char('&'), QLatin1String("&&"));
}

} // namespace

RecentMenu::RecentMenu(RecentFiles& recent, QWidget* parent)
    : QMenu(tr("Open &recent"), parent), mRecent(recent) {
    setToolTipsVisible(true);
    // Files come and go while nobody looks.
    connect(this, &QMenu::aboutToShow, this, &RecentMenu::fill);
    const auto enable = [this] { menuAction()->setEnabled(!mRecent.list().isEmpty()); };
    connect(&recent, &RecentFiles::changed, this, enable);
    enable();
}

void RecentMenu::fill() {
    clear();
    int number = 0;
    for (const QString& entry : mRecent.list()) {
        const QString text = shown(entry, fontMetrics());
        // A digit as the letter to press; the tenth has none left but 0.
        QAction* action = addAction(QStringLiteral("&%1  %2").arg(++number % 10).arg(text));
        action->setToolTip(platform::qt::asToolTip(entry));
        action->setEnabled(RecentFiles::isThere(entry));
        connect(action, &QAction::triggered, this, [this, entry] { emit chosen(entry); });
    }
    addSeparator();
    connect(addAction(tr("&Clear list")), &QAction::triggered, &mRecent, &RecentFiles::clear);
}

} // namespace zandor::designer
