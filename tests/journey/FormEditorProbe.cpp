#include <QApplication>
#include <QDockWidget>
#include <QMainWindow>
#include <QMdiSubWindow>
#include <QScreen>
#include <QSocketNotifier>
#include <QTreeWidget>
#include <QtDesigner/QtDesigner>
#include <QtDesigner/abstractformeditorplugin.h>

#include <cstdio>
#include <iostream>
#include <string>

// A plug-in for Qt Designer that says what stands in it, and is asked by lines on its input. The
// answer to each is one line.
//
//   form            the query designer of the form: class, name, "plug-in" or "promoted", how many
//                   tables it shows, its place on the screen and its size; or nothing
//   selected        the names of what is selected on the form
//   headings        of the property editor, with a bar between two
//   show HEADING    brings it to the top there
//   room            the window takes the whole screen, without the panels below
//   picture PATH    saves what the screen shows

namespace {

QString nameOf(const QObject* object) { return object->objectName(); }

} // namespace

class Probe final : public QObject, public QDesignerFormEditorPluginInterface {
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "org.qt-project.Qt.Designer.QDesignerFormEditorPluginInterface")
    Q_INTERFACES(QDesignerFormEditorPluginInterface)

public:
    bool isInitialized() const override { return mCore != nullptr; }
    QDesignerFormEditorInterface* core() const override { return mCore; }
    QAction* action() const override { return nullptr; }

    void initialize(QDesignerFormEditorInterface* core) override {
        mCore = core;
        connect(&mInput, &QSocketNotifier::activated, this, &Probe::answer);
    }

private:
    void answer() {
        std::string line;
        if (!std::getline(std::cin, line)) {
            mInput.setEnabled(false);
            return;
        }
        const QString question = QString::fromStdString(line);
        QString reply;
        if (question == u"form") reply = form();
        if (question == u"selected") reply = selected();
        if (question == u"headings") reply = headings();
        if (question.startsWith(u"show ")) reply = show(question.mid(5));
        if (question == u"room") reply = room();
        if (question.startsWith(u"picture ")) reply = picture(question.mid(8));
        std::printf("%s\n", qPrintable(reply));
        std::fflush(stdout);
    }

    QString form() const {
        const auto* const window = mCore->formWindowManager()->activeFormWindow();
        if (!window || !window->isVisible()) return {};
        for (QWidget* const widget : window->findChildren<QWidget*>()) {
            if (QLatin1String(widget->metaObject()->className()) != u"ZandorWidget") continue;
            const auto* const known = mCore->widgetDataBase();
            const auto* const item = known->item(known->indexOfObject(widget));
            const bool ours = item->isCustom() && !item->isPromoted();
            int tables = 0;
            for (const QWidget* const part : widget->findChildren<QWidget*>())
                tables += part->isVisible() && nameOf(part).startsWith(u"lstTable(");
            const QPoint at = widget->mapToGlobal(QPoint());
            return QStringLiteral("ZandorWidget %1 %2 %3 %4 %5 %6 %7")
                .arg(nameOf(widget), ours ? QStringLiteral("plug-in") : QStringLiteral("promoted"))
                .arg(tables)
                .arg(at.x())
                .arg(at.y())
                .arg(widget->width())
                .arg(widget->height());
        }
        return {};
    }

    QString selected() const {
        auto* const window = mCore->formWindowManager()->activeFormWindow();
        QStringList names;
        if (window)
            for (int i = 0; i < window->cursor()->selectedWidgetCount(); ++i)
                names += nameOf(window->cursor()->selectedWidget(i));
        return names.join(u' ');
    }

    /// Each with what stands below it.
    QList<QTreeWidgetItem*> groups() const {
        QList<QTreeWidgetItem*> items;
        for (const auto* const tree : mCore->propertyEditor()->findChildren<QTreeWidget*>())
            for (int i = 0; i < tree->topLevelItemCount(); ++i) items += tree->topLevelItem(i);
        return items;
    }

    QString headings() const {
        QStringList texts;
        for (const QTreeWidgetItem* const item : groups()) texts += item->text(0);
        return texts.join(u'|');
    }

    QString show(const QString& heading) const {
        for (QTreeWidgetItem* const item : groups()) {
            if (item->text(0) != heading) continue;
            item->treeWidget()->scrollToItem(item, QAbstractItemView::PositionAtTop);
            return QStringLiteral("shown");
        }
        return {};
    }

    QString room() const {
        auto* const window = qobject_cast<QMainWindow*>(mCore->topLevel()->window());
        if (!window) return {};
        window->setGeometry(window->screen()->geometry());
        QList<QDockWidget*> beside;
        for (auto* const panel : window->findChildren<QDockWidget*>())
            if (isBelow(*panel))
                panel->hide();
            else if (panel->isAncestorOf(mCore->propertyEditor()))
                beside += panel;
        window->resizeDocks(beside, {400}, Qt::Horizontal);
        QCoreApplication::processEvents();
        for (auto* const form : window->findChildren<QMdiSubWindow*>()) form->move(16, 16);
        return QStringLiteral("there is");
    }

    static bool isBelow(const QDockWidget& panel) {
        const QString title = panel.windowTitle();
        return title.startsWith(u"Signal") || title.startsWith(u"Action") ||
               title.startsWith(u"Resource");
    }

    static QString picture(const QString& path) {
        const QPixmap shown = QGuiApplication::primaryScreen()->grabWindow(0);
        return shown.save(path) ? QStringLiteral("saved") : QString();
    }

    QDesignerFormEditorInterface* mCore = nullptr;
    QSocketNotifier mInput{0, QSocketNotifier::Read};
};

#include "FormEditorProbe.moc"
