#include "frontends/qt/KeyDesk.h"
#include "support/Tables.h"

#include <QDialog>
#include <QKeySequence>
#include <QPushButton>

#include <fstream>
#include <sstream>

// The steps of transcript.txt on Qt, and everything that the host is told of them, in its order.
// The file is the truth for hosts in other languages too. With ZANDOR_WRITE_TRANSCRIPT set it is
// written anew, which is to be looked at.

namespace {

constexpr const char* path = SOURCE_ROOT "/tests/python/transcript.txt";

std::vector<std::string> linesOf(const char* path) {
    std::ifstream file(path);
    std::vector<std::string> lines;
    for (std::string line; std::getline(file, line);) lines.push_back(line);
    return lines;
}

/// Takes the definition of a join as it stands when its dialog opens.
class Dialogs : public QObject {
public:
    Dialogs() { qApp->installEventFilter(this); }
    bool eventFilter(QObject* watched, QEvent* event) override {
        auto* dialog = event->type() == QEvent::Show ? qobject_cast<QDialog*>(watched) : nullptr;
        if (dialog)
            QTimer::singleShot(0, dialog,
                               [dialog] { dialog->findChild<QPushButton*>("cmdOk")->click(); });
        return false;
    }
};

class AHostsTranscript : public KeyDesk {
protected:
    AHostsTranscript() {
        model = library.newModel();
        addOrders(*model);
        addCustomers(*model);
        library.calls->onPass = [this](const std::string& call) { told.push_back("  " + call); };
        const auto key = [](const auto& object) { return zandor::platform::toUtf8(object->Key()); };
        const auto tell = [this, key](const char* event) {
            return [this, key, event](const auto& object) {
                told.push_back(std::string("event ") + event + " " + key(object));
            };
        };
        const auto plain = [this](const char* event) {
            return [this, event] { told.push_back(std::string("event ") + event); };
        };
        QObject::connect(widget.get(), &ZandorWidget::TableMoved, plain("TableMoved"));
        QObject::connect(widget.get(), &ZandorWidget::Activate, plain("Activate"));
        QObject::connect(widget.get(), &ZandorWidget::TableDeleted, [this] {
            told.push_back("event TableDeleted " + widget->DeletedTable().toStdString());
        });
        QObject::connect(widget.get(), &ZandorWidget::JoinCreated, tell("JoinCreated"));
        QObject::connect(widget.get(), &ZandorWidget::JoinModified, tell("JoinModified"));
        QObject::connect(widget.get(), &ZandorWidget::JoinRemoved, tell("JoinRemoved"));
        QObject::connect(widget.get(), &ZandorWidget::ColumnCreated, tell("ColumnCreated"));
        QObject::connect(widget.get(), &ZandorWidget::ColumnModified, tell("ColumnModified"));
        QObject::connect(widget.get(), &ZandorWidget::ColumnRemoved, tell("ColumnRemoved"));
    }
    ~AHostsTranscript() override { library.calls->onPass = nullptr; }

    void play(const std::string& step) {
        told.push_back("> " + step);
        const auto [verb, what] = [&step] {
            const auto blank = step.find(' ');
            return std::pair(step.substr(0, blank),
                             blank == std::string::npos ? "" : step.substr(blank + 1));
        }();
        if (verb == "bind")
            widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        else if (verb == "tab")
            tabTo(QString::fromStdString(what.substr(3)));
        else if (verb == "key")
            key(what);
        else if (verb == "type")
            for (const QChar letter : QString::fromStdString(what)) press(0, {}, letter);
        else if (verb == "menu") {
            menus.choice = QString::fromStdString(what);
            menuKey();
        } else if (verb == "current")
            widget->SetCurrentTable(QString::fromStdString(what));
        else if (verb == "terminate")
            widget->Terminate();
        else
            ADD_FAILURE() << "there is no step " << step;
        calm();
    }

    void key(const std::string& name) {
        const QKeySequence keys(QString::fromStdString(name), QKeySequence::PortableText);
        press(keys[0].key(), keys[0].keyboardModifiers());
    }

    Dialogs dialogs;
    std::vector<std::string> told;
};

} // namespace

TEST_F(AHostsTranscript, IsTheOneInTheFile) {
    const auto expected = linesOf(path);
    for (const std::string& line : expected) {
        if (line.starts_with("> ")) play(line.substr(2));
        if (line.starts_with("#")) told.push_back(line);
    }
    library.calls->onPass = nullptr;
    if (qEnvironmentVariableIsSet("ZANDOR_WRITE_TRANSCRIPT")) {
        std::ofstream file(path);
        for (const std::string& line : told) file << line << "\n";
    }
    EXPECT_EQ(told, expected);
}
