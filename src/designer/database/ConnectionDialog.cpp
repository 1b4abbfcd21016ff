#include "designer/database/ConnectionDialog.h"

#include "designer/database/Database.h"
#include "designer/database/ErrorLine.h"
#include "designer/database/opening.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QFormLayout>
#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>
#include <QSpinBox>
#include <QSqlDatabase>
#include <QStandardItemModel>

#include <algorithm>

namespace zandor::designer {

namespace {

QWidget* row(QHBoxLayout* content) {
    content->setContentsMargins(0, 0, 0, 0);
    auto* const widget = new QWidget;
    widget->setLayout(content);
    return widget;
}

} // namespace

ConnectionDialog::ConnectionDialog(Database& database, QWidget* window)
    : QDialog(window), mDatabase(database), mForm(new QFormLayout), mKind(new QComboBox),
      mFile(new QLineEdit), mHost(new QLineEdit(QStringLiteral("localhost"))), mPort(new QSpinBox),
      mSource(new QLineEdit), mName(new QLineEdit), mUser(new QLineEdit), mPassword(new QLineEdit),
      mAddress(new QLineEdit), mError(new ErrorLine) {
    setWindowTitle(tr("Open database"));
    mPort->setRange(0, 65535);
    mPort->setSpecialValueText(tr("usual"));
    mPort->setAccessibleName(tr("Port"));
    mPassword->setEchoMode(QLineEdit::Password);
    mAddress->setPlaceholderText(QStringLiteral("postgresql://user@host:5432/database"));
    addKinds();
    lay();

    connect(mKind, &QComboBox::currentIndexChanged, this, &ConnectionDialog::takeFields);
    for (const auto* field : {mFile, mHost, mSource, mName, mUser})
        connect(field, &QLineEdit::textChanged, this, &ConnectionDialog::takeFields);
    connect(mPort, &QSpinBox::valueChanged, this, &ConnectionDialog::takeFields);
    connect(mAddress, &QLineEdit::textChanged, this, &ConnectionDialog::takeAddress);
    takeFields();
    mFile->setFocus();
}

/// All kinds, so that nobody has to guess why one is missing.
void ConnectionDialog::addKinds() {
    struct Kind {
        Engine engine;
        QString name;
        const char* driver;
        const char* package;
    };
    const Kind kinds[] = {{Engine::SQLite, tr("SQLite file"), "QSQLITE", "libqt6sql6-sqlite"},
                          {Engine::PostgreSQL, tr("PostgreSQL"), "QPSQL", "libqt6sql6-psql"},
                          {Engine::MySQL, tr("MySQL or MariaDB"), "QMYSQL", "libqt6sql6-mysql"},
                          {Engine::ODBC, tr("ODBC"), "QODBC", "libqt6sql6-odbc"}};
    const QStringList drivers = QSqlDatabase::drivers();
    for (const Kind& kind : kinds) {
        const bool present = drivers.contains(QLatin1String(kind.driver));
        mKind->addItem(
            present ? kind.name
                    : tr("%1 (install the package %2)").arg(kind.name, QLatin1String(kind.package)),
            static_cast<int>(kind.engine));
        auto* const model = qobject_cast<QStandardItemModel*>(mKind->model());
        model->item(mKind->count() - 1)->setEnabled(present);
    }
}

void ConnectionDialog::lay() {
    auto* const choose = new QPushButton(tr("&Browse\u2026"));
    choose->setAutoDefault(false);
    connect(choose, &QPushButton::clicked, this, &ConnectionDialog::browse);
    auto* const file = new QHBoxLayout;
    file->addWidget(mFile, 1);
    file->addWidget(choose);
    mFileRow = row(file);
    auto* const host = new QHBoxLayout;
    auto* const port = new QLabel(tr("P&ort:"));
    port->setBuddy(mPort);
    host->addWidget(mHost, 1);
    host->addWidget(port);
    host->addWidget(mPort);
    mHostRow = row(host);
    auto* const line = new QFrame;
    line->setFrameStyle(QFrame::HLine | QFrame::Sunken);

    const auto add = [this](const QString& label, QWidget* field, QWidget* buddy) {
        auto* const text = new QLabel(label);
        text->setBuddy(buddy);
        mForm->addRow(text, field);
    };
    mForm->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    add(tr("&Kind:"), mKind, mKind);
    add(tr("&File:"), mFileRow, mFile);
    add(tr("&Host:"), mHostRow, mHost);
    add(tr("Data &source:"), mSource, mSource);
    add(tr("&Database:"), mName, mName);
    add(tr("&User:"), mUser, mUser);
    add(tr("&Password:"), mPassword, mPassword);
    mForm->addRow(line);
    add(tr("&Address:"), mAddress, mAddress);

    auto* const buttons = new QDialogButtonBox(QDialogButtonBox::Open | QDialogButtonBox::Cancel);
    mOpen = buttons->button(QDialogButtonBox::Open);
    connect(buttons, &QDialogButtonBox::accepted, this, &ConnectionDialog::connectToIt);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* const layout = new QVBoxLayout(this);
    layout->addLayout(mForm);
    layout->addWidget(mError);
    layout->addStretch();
    layout->addWidget(buttons);
    mOpen->setDefault(true); // only within the dialog does it become so again after others
    setMinimumWidth(460);
}

Engine ConnectionDialog::engine() const {
    return static_cast<Engine>(mKind->currentData().toInt());
}

void ConnectionDialog::showFieldsOf(Engine engine) {
    const bool server = engine == Engine::PostgreSQL || engine == Engine::MySQL;
    mForm->setRowVisible(mFileRow, engine == Engine::SQLite);
    mForm->setRowVisible(mHostRow, server);
    mForm->setRowVisible(mSource, engine == Engine::ODBC);
    mForm->setRowVisible(mName, server);
    mForm->setRowVisible(mUser, engine != Engine::SQLite);
    mForm->setRowVisible(mPassword, engine != Engine::SQLite);
    growToContent();
}

/// A layout with wrapped lines leaves that to the window, and would squeeze the fields.
void ConnectionDialog::growToContent() {
    if (!isVisible()) return; // it gets its size when it is shown
    layout()->activate();
    const int needed = std::max(layout()->totalHeightForWidth(width()), sizeHint().height());
    if (needed > height()) resize(width(), needed);
}

void ConnectionDialog::setAddress(const QString& address) { mAddress->setText(address); }

QString ConnectionDialog::address() const {
    return partPassword(mAddress->text().trimmed()).address;
}

/// What was written into the address, into the fields.
void ConnectionDialog::takeAddress() {
    mError->say({});
    const PartedAddress parted = partPassword(mAddress->text());
    if (parted.address != mAddress->text()) {
        const QSignalBlocker quiet(mAddress);
        mAddress->setText(parted.address);
    }
    if (!parted.password.isEmpty()) mPassword->setText(parted.password);
    mOpen->setEnabled(!address().isEmpty());
    const auto parts = parseAddress(parted.address);
    if (!parts) return; // not yet: it is being written
    mOptions = parts->options;
    const auto put = [](QLineEdit* field, const QString& text) {
        const QSignalBlocker quiet(field);
        if (field->text() != text) field->setText(text);
    };
    put(mFile, parts->file);
    put(parts->engine == Engine::ODBC ? mSource : mHost, parts->host);
    put(mName, parts->database);
    put(mUser, parts->user);
    const QSignalBlocker quietPort(mPort);
    mPort->setValue(parts->port);
    const QSignalBlocker quietKind(mKind);
    mKind->setCurrentIndex(mKind->findData(static_cast<int>(parts->engine)));
    showFieldsOf(parts->engine);
}

/// What is in the fields, into the address.
void ConnectionDialog::takeFields() {
    mError->say({});
    Address parts;
    parts.engine = engine();
    parts.file = mFile->text();
    parts.host = parts.engine == Engine::ODBC ? mSource->text() : mHost->text();
    parts.port = mPort->value();
    parts.user = mUser->text();
    if (parts.engine != Engine::ODBC) parts.database = mName->text();
    if (parts.engine == Engine::PostgreSQL) parts.options = mOptions;
    const QSignalBlocker quiet(mAddress);
    mAddress->setText(textOf(parts));
    mOpen->setEnabled(!address().isEmpty());
    showFieldsOf(parts.engine);
}

void ConnectionDialog::browse() {
    const QString file = QFileDialog::getOpenFileName(
        this, tr("Open database"), mFile->text(),
        tr("SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)"));
    if (!file.isEmpty()) mFile->setText(file);
}

void ConnectionDialog::connectToIt() {
    mError->say({});
    const QString password = engine() == Engine::SQLite ? QString() : mPassword->text();
    const Opening opening = openPatiently(mDatabase, address(), password, this);
    if (opening.opened) return accept();
    mError->say(opening.error);
    growToContent();
}

} // namespace zandor::designer
