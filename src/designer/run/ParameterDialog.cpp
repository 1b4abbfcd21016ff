#include "designer/run/ParameterDialog.h"

#include "frontends/qt/ShownText.h"

#include <QDialogButtonBox>
#include <QEvent>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QScrollArea>
#include <QScrollBar>

namespace zandor::designer {

namespace {

constexpr int fieldCharacters = 32; // more than most values need
constexpr int besideTitle = 160;    // logical pixels: the window's own icon and buttons
constexpr int highestForm = 400;    // what a small screen leaves beside the rest
constexpr int widestForm = 640;

/// The form itself, which scrolls where it is higher than a small screen.
class FormArea final : public QScrollArea {
public:
    explicit FormArea(QWidget* form) {
        setFrameShape(NoFrame);
        setWidgetResizable(true);
        setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        setFocusPolicy(Qt::NoFocus);
        setWidget(form);
        for (QWidget* field : form->findChildren<QWidget*>()) field->installEventFilter(this);
    }
    /// By itself an area follows the focus only when it comes from within.
    bool eventFilter(QObject* watched, QEvent* event) override {
        if (event->type() == QEvent::FocusIn) ensureWidgetVisible(static_cast<QWidget*>(watched));
        return QScrollArea::eventFilter(watched, event);
    }
    QSize sizeHint() const override {
        const int width = std::min(widget()->sizeHint().width(), widestForm);
        const int height = widget()->hasHeightForWidth() ? widget()->heightForWidth(width)
                                                         : widget()->sizeHint().height();
        if (height <= highestForm) return {width, height};
        return {width + verticalScrollBar()->sizeHint().width(), highestForm};
    }
    QSize minimumSizeHint() const override {
        return {widget()->minimumSizeHint().width(), std::min(sizeHint().height(), 100)};
    }
};

} // namespace

ParameterDialog::ParameterDialog(std::vector<Question> questions, const Answers& answers,
                                 QWidget* parent)
    : QDialog(parent), mQuestions(std::move(questions)), mComplaint(new QLabel(this)),
      mButtons(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this)) {
    setWindowTitle(tr("Values for the query"));
    auto* const form = new QWidget;
    auto* const rows = new QFormLayout(form);
    rows->setContentsMargins({});
    rows->setFieldGrowthPolicy(QFormLayout::ExpandingFieldsGrow);
    rows->setRowWrapPolicy(QFormLayout::WrapLongRows);
    for (const Question& question : mQuestions) {
        auto* const field = new QLineEdit(answers.value(question.name));
        field->setObjectName(question.name);
        field->setPlaceholderText(wanted(question));
        field->setToolTip(platform::qt::asToolTip(wanted(question)));
        field->setMinimumWidth(std::max(field->fontMetrics().horizontalAdvance(wanted(question)),
                                        field->fontMetrics().averageCharWidth() * fieldCharacters) +
                               24);
        field->selectAll();
        connect(field, &QLineEdit::textChanged, this, &ParameterDialog::check);
        auto* const label = new QLabel;
        label->setTextFormat(Qt::PlainText);
        label->setText(platform::qt::asSigns(question.name).replace(u'&', QStringLiteral("&&")));
        label->setWordWrap(label->sizeHint().width() > widestForm / 2);
        label->setBuddy(field);
        rows->addRow(label, field);
        mFields.push_back(field);
    }
    mComplaint->setTextFormat(Qt::PlainText);
    mComplaint->setWordWrap(true);
    mComplaint->setForegroundRole(QPalette::PlaceholderText);
    auto* const layout = new QVBoxLayout(this);
    layout->addWidget(new FormArea(form), 1);
    layout->addWidget(mComplaint);
    layout->addWidget(mButtons);
    // Window managers cut a title that does not fit beside their buttons.
    QFont titleFont = font();
    titleFont.setBold(true);
    setMinimumWidth(QFontMetrics(titleFont).horizontalAdvance(windowTitle()) + besideTitle);
    mButtons->button(QDialogButtonBox::Ok)->setText(tr("&Run"));
    connect(mButtons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(mButtons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    // The buttons were there before the fields.
    QWidget* before = this;
    for (QWidget* field : mFields) {
        if (before != this) setTabOrder(before, field);
        before = field;
    }
    if (!mFields.empty()) {
        setTabOrder(before, mButtons);
        mFields.front()->setFocus();
    }
    check();
}

Answers ParameterDialog::answers() const {
    Answers result;
    for (std::size_t i = 0; i < mFields.size(); ++i)
        result.insert(mQuestions[i].name, mFields[i]->text());
    return result;
}

void ParameterDialog::check() {
    QString complaint;
    for (std::size_t i = 0; complaint.isEmpty() && i < mFields.size(); ++i)
        if (!fits(mQuestions[i], mFields[i]->text()))
            complaint = tr("%1 has to be %2.")
                            .arg(platform::qt::asSigns(mQuestions[i].name), wanted(mQuestions[i]));
    mComplaint->setText(complaint);
    mButtons->button(QDialogButtonBox::Ok)->setEnabled(complaint.isEmpty());
}

} // namespace zandor::designer
