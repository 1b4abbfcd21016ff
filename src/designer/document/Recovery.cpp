#include "designer/document/Recovery.h"

#include "designer/PlainBox.h"
#include "designer/document/Autosave.h"
#include "designer/document/QueryFile.h"
#include "designer/statement/ModelWords.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QLocale>
#include <QPushButton>

namespace zandor::designer {

namespace {

class Recovery {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::Recovery)

public:
    enum class Answer { recover, discard, later };

    static Answer ask(const QString& path, const QDateTime& saved, QWidget* window) {
        const QString text =
            path.isEmpty()
                ? tr("A query was drawn and never saved.")
                : tr("\"%1\" has changes that were not saved.").arg(QFileInfo(path).fileName());
        PlainBox box(QMessageBox::Question, tr("Recover query"), text, QMessageBox::NoButton,
                     window);
        box.setInformativeText(
            tr("The designer ended unexpectedly. The changes up to %1 can be recovered.")
                .arg(QLocale().toString(saved, QLocale::ShortFormat)));
        const auto* recover = box.addButton(tr("&Recover"), QMessageBox::AcceptRole);
        const auto* discard = box.addButton(QMessageBox::Discard);
        box.addButton(tr("&Ask later"), QMessageBox::RejectRole);
        box.exec();
        if (box.clickedButton() == recover) return Answer::recover;
        return box.clickedButton() == discard ? Answer::discard : Answer::later;
    }

    static void tell(const QString& error, const QString& path, QWidget* window) {
        PlainBox box(QMessageBox::Warning, tr("Recover query"),
                     tr("The designer ended unexpectedly, and the changes that were kept safe "
                        "cannot be read. They stay in the file \"%1\".")
                         .arg(path),
                     QMessageBox::Ok, window);
        box.setInformativeText(error);
        box.exec();
    }
};

} // namespace

bool offerRecovery(QueryFile& file, Autosave& autosave, const QString& folder, QWidget* window) {
    for (auto& slot : AutosaveSlot::abandoned(folder)) {
        const auto saved = slot->read();
        if (!saved) {
            // It may be of a later version of the designer, which can.
            Recovery::tell(inWords(saved.failure()), slot->setAside(), window);
            continue;
        }
        switch (Recovery::ask(saved->path, slot->saved(), window)) {
        case Recovery::Answer::recover:
            file.recover(saved->path, saved->content, saved->origin);
            autosave.adopt(std::move(slot));
            return true;
        case Recovery::Answer::discard: slot->remove(); break;
        case Recovery::Answer::later: break;
        }
    }
    return false;
}

} // namespace zandor::designer
