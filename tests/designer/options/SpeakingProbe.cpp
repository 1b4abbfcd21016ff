#include "designer/document/Document.h"
#include "designer/options/ControlOptions.h"
#include "designer/options/Languages.h"
#include "designer/options/OptionsDialog.h"
#include "designer/statement/StatementPanel.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QSettings>
#include <QTemporaryDir>

#include <cstdio>

using namespace zandor;

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    designer::speak();
    const QTemporaryDir folder;
    QSettings settings(folder.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    designer::Document document;
    const designer::StatementPanel panel(document);
    const designer::OptionsDialog dialog(settings);
    const auto* const buttons = dialog.findChild<QDialogButtonBox*>();
    const QStringList said{
        panel.findChild<QPlainTextEdit*>()->placeholderText(),
        dialog.windowTitle(),
        buttons->button(QDialogButtonBox::Cancel)->text().remove(u'&'),
        designer::ControlOptions()
            .properties()
            .value(QStringLiteral("LNGJoinLeftTable"))
            .toString(),
    };
    std::fputs(said.join(u'\n').toUtf8().constData(), stdout);
    return 0;
}
