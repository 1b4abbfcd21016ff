#include "designer/run/typedCommand.h"

#include "designer/run/TypedTokens.h"
#include "designer/statement/readStatement.h"
#include "designer/tr.h"
#include "model/criteria/Literals.h"

#include <Zandor/qt/Text.h>
#include <Zandor/sql/Dialect.h>

#include <algorithm>

namespace zandor::designer {

using model::ColumnType;
using model::sql::Dialect;
using model::sql::Value;
using platform::qt::fromQt;
using platform::qt::toQt;

namespace {

bool isQuery(QStringView word) {
    constexpr const char* begins[] = {"select", "with", "values", "table"};
    return std::ranges::any_of(begins, [&](const char* begin) {
        return word.compare(QLatin1String(begin), Qt::CaseInsensitive) == 0;
    });
}

QString at(QStringView text, qsizetype place, const QString& message) {
    const QStringView before = text.first(place);
    const auto line = before.count(u'\n') + 1;
    const auto column = place - (before.lastIndexOf(u'\n') + 1) + 1;
    return Undrawn{message, static_cast<int>(place), static_cast<int>(line),
                   static_cast<int>(column)}
        .withPlace();
}

/// Keeps to what reads, as far as its words tell; what they do not the engine refuses, whose
/// session cannot write.
class OneQuery {
public:
    OneQuery(const QString& text, Dialect dialect) : mText(text), mRun{text, dialect, {}} {}

    model::Result<TypedRun, QString> read() {
        TypedTokens tokens(mText, mRun.dialect);
        while (const auto token = tokens.next())
            if (!take(*token)) return mRefusal;
        if (!mBegun) return tr("There is no statement: write one, or go back to the drawing.");
        return mRun;
    }

private:
    using Kind = TypedToken::Kind;

    bool take(const TypedToken& token) {
        const QStringView word = QStringView(mText).sliced(token.begin, token.end - token.begin);
        if (token.kind == Kind::notClosed)
            return refuse(token, tr("what begins here has no end: close it."));
        if (token.kind == Kind::zero) return refuse(token, tr("a NUL stands here: delete it."));
        if (mEnded && token.kind != Kind::end)
            return refuse(token, tr("a second statement begins here: one is run at a time."));
        if (token.kind == Kind::end) {
            if (mBegun && !mEnded) mRun.statement.truncate(token.begin);
            mEnded = mBegun; // before the first one it ends nothing
        } else if (!mBegun && word != u"(") {
            mBegun = token.kind == Kind::word && isQuery(word);
            if (!mBegun)
                return refuse(token, tr("only a query is run: it begins with SELECT, WITH, VALUES "
                                        "or TABLE."));
        } else if (token.kind == Kind::word && word.compare(u"into", Qt::CaseInsensitive) == 0 &&
                   !mIsName) {
            return refuse(token, tr("INTO writes, and the database is only read: leave it out."));
        } else if (token.kind == Kind::parameter) {
            mRun.parameters.push_back({token.begin, token.end, nameOf(word)});
        }
        mIsName = word == u"." || word.compare(u"as", Qt::CaseInsensitive) == 0;
        return true;
    }

    bool refuse(const TypedToken& token, const QString& message) {
        mRefusal = at(mText, token.begin, message);
        return false;
    }

    /// As a drawing of the statement would ask for it; one without a name by its number.
    QString nameOf(QStringView written) {
        const QString name = written.sliced(1).toString();
        const bool quoted = name.startsWith(u'\'') || name.startsWith(u'"');
        if (quoted) return name.sliced(1, name.size() - 2);
        return name.isEmpty() ? QString::number(++mUnnamed) : name;
    }

    const QString mText;
    TypedRun mRun;
    QString mRefusal;
    bool mBegun = false;
    bool mEnded = false;
    bool mIsName = false; ///< what comes next
    int mUnnamed = 0;
};

QString writtenOut(const QString& answer, Dialect dialect) {
    const platform::String text = fromQt(answer.trimmed());
    // In quotes it is there whatever it stands for.
    const auto value = dialect == Dialect::PostgreSQL
                           ? std::nullopt
                           : model::criteria::literal(text, ColumnType::Unknown);
    // With blanks, so that nothing grows together: "- -1".
    return u' ' +
           toQt(model::sql::literal(value.value_or(Value{ColumnType::Text, text}), dialect)) + u' ';
}

} // namespace

model::Result<TypedRun, QString> typedRun(const files::TypedStatement& typed, Dialect engine) {
    if (engine == Dialect::SqlServer || engine == Dialect::Standard)
        return tr("A text that is not drawn is not run on this database, which nothing would keep "
                  "from writing: go back to the drawing.");
    if (typed.dialect != engine)
        return tr("The text is in %1, and the database speaks %2: choose that above the text.")
            .arg(toQt(nameOf(typed.dialect)), toQt(nameOf(engine)));
    return OneQuery(toQt(typed.text), engine).read();
}

std::vector<Question> questions(const TypedRun& typed) {
    std::vector<Question> result;
    for (const TypedRun::Place& place : typed.parameters) {
        const auto isIt = [&](const Question& each) { return each.name == place.parameter; };
        if (std::ranges::none_of(result, isIt))
            result.push_back({place.parameter, {{fromQt(place.parameter)}}});
    }
    return result;
}

Command makeCommand(const TypedRun& typed, const Answers& answers, std::optional<qint64> limit) {
    QString statement;
    qsizetype copied = 0;
    for (const auto& [begin, end, parameter] : typed.parameters) {
        statement += QStringView(typed.statement).sliced(copied, begin - copied);
        statement += writtenOut(answers.value(parameter), typed.dialect);
        copied = end;
    }
    statement += QStringView(typed.statement).sliced(copied);
    return {statement, {}, limit, true};
}

} // namespace zandor::designer
