#include "Evaluator.h"

#include <QDate>
#include <QSet>
#include <QSqlField>
#include <QSqlQuery>
#include <QSqlRecord>

#include <algorithm>
#include <cmath>
#include <optional>
#include <stdexcept>

using namespace zandor::model::sql;

using zandor::model::Total;

namespace {

using Datum = Evaluator::Datum;
using Row = Evaluator::Row;
using Truth = std::optional<bool>; // nothing: unknown

bool isNull(const Datum& datum) { return std::holds_alternative<std::monostate>(datum); }
double number(const Datum& datum) {
    if (const auto* truth = std::get_if<bool>(&datum)) return *truth ? 1 : 0;
    return std::get<double>(datum);
}
const std::string& text(const Datum& datum) { return std::get<std::string>(datum); }
QDate date(const Datum& datum) {
    return QDate::fromString(QString::fromStdString(text(datum)).left(10), Qt::ISODate);
}
Datum datumOf(const QDate& day) { return day.toString(Qt::ISODate).toStdString(); }
Datum datumOf(Truth truth) { return truth ? Datum(*truth) : Datum(); }

std::string written(const Datum& datum) {
    if (isNull(datum)) return "null";
    if (const auto* words = std::get_if<std::string>(&datum)) {
        const bool day = QDate::fromString(QString::fromStdString(*words), Qt::ISODate).isValid();
        return day ? *words : '\'' + *words + '\'';
    }
    return QString::number(number(datum), 'g', 12).toStdString();
}

/// A row, or rows that were put together; of the latter only what they have in common is asked.
class Scope {
public:
    explicit Scope(std::vector<const Row*> rows) : mRows(std::move(rows)) {}

    Datum value(const Node& node) const {
        return std::visit([&](const auto& part) { return of(part); }, node->node);
    }
    Truth truth(const Node& node) const {
        const Datum datum = value(node);
        if (isNull(datum)) return {};
        return number(datum) != 0;
    }

private:
    Datum of(const ColumnRef& column) const {
        // The side of an outer join that found no rows at all has no columns here.
        if (mRows.empty()) return {};
        const auto at = mRows.front()->find({column.table, column.column});
        return at == mRows.front()->end() ? Datum() : at->second;
    }
    Datum of(const Value& value) const {
        switch (value.type) {
        case zandor::model::ColumnType::Integer:
        case zandor::model::ColumnType::Decimal:
            return QString::fromStdU16String(value.text).toDouble();
        case zandor::model::ColumnType::Boolean: return value.text == u"true";
        default: return QString::fromStdU16String(value.text).toStdString();
        }
    }
    Datum of(const Parameter&) const { throw std::logic_error("nobody answers here"); }

    Datum of(const Compare& x) const {
        return datumOf(compared(value(x.left), x.comparison, value(x.right)));
    }
    static Truth compared(const Datum& left, Comparison comparison, const Datum& right) {
        if (isNull(left) || isNull(right)) return {};
        const int order = ordered(left, right);
        switch (comparison) {
        case Comparison::equal: return order == 0;
        case Comparison::notEqual: return order != 0;
        case Comparison::less: return order < 0;
        case Comparison::greater: return order > 0;
        case Comparison::lessEqual: return order <= 0;
        case Comparison::greaterEqual: break;
        }
        return order >= 0;
    }
    static int ordered(const Datum& left, const Datum& right) {
        if (const auto* words = std::get_if<std::string>(&left)) return words->compare(text(right));
        return number(left) < number(right) ? -1 : number(left) > number(right) ? 1 : 0;
    }
    Datum of(const Like& x) const {
        const Datum words = value(x.operand);
        if (isNull(words)) return {};
        const auto lower = [](std::string_view given) {
            std::string small(given);
            for (char& c : small)
                if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
            return small;
        };
        return matches(lower(text(words)), lower(text(value(x.pattern)))) != x.negated;
    }
    static bool matches(std::string_view words, std::string_view pattern) {
        if (pattern.empty()) return words.empty();
        if (pattern[0] == '%')
            return matches(words, pattern.substr(1)) ||
                   (!words.empty() && matches(words.substr(1), pattern));
        if (words.empty()) return false;
        return (pattern[0] == '_' || pattern[0] == words[0]) &&
               matches(words.substr(1), pattern.substr(1));
    }
    Datum of(const Between& x) const {
        const Datum datum = value(x.operand);
        const Truth inside = both(compared(datum, Comparison::greaterEqual, value(x.low)),
                                  compared(datum, Comparison::lessEqual, value(x.high)));
        return datumOf(x.negated ? inverse(inside) : inside);
    }
    Datum of(const In& x) const {
        Truth among = false;
        for (const Node& item : x.list)
            among = either(among, compared(value(x.operand), Comparison::equal, value(item)));
        return datumOf(x.negated ? inverse(among) : among);
    }
    Datum of(const IsNull& x) const { return isNull(value(x.operand)) != x.negated; }
    Datum of(const Not& x) const { return datumOf(inverse(truth(x.operand))); }
    Datum of(const And& x) const {
        Truth all = true;
        for (const Node& term : x.terms) all = both(all, truth(term));
        return datumOf(all);
    }
    Datum of(const Or& x) const {
        Truth any = false;
        for (const Node& term : x.terms) any = either(any, truth(term));
        return datumOf(any);
    }
    static Truth inverse(Truth truth) { return truth ? Truth(!*truth) : truth; }
    static Truth both(Truth left, Truth right) {
        if ((left && !*left) || (right && !*right)) return false;
        return left && right ? Truth(true) : Truth();
    }
    static Truth either(Truth left, Truth right) {
        return inverse(both(inverse(left), inverse(right)));
    }

    Datum of(const Operation& x) const {
        const Datum left = value(x.left);
        const Datum right = value(x.right);
        if (isNull(left) || isNull(right)) return {};
        switch (x.symbol) {
        case Operator::add: return number(left) + number(right);
        case Operator::subtract: return number(left) - number(right);
        case Operator::multiply: return number(left) * number(right);
        case Operator::divide:
            if (number(right) == 0) return {};
            return number(left) / number(right);
        case Operator::concatenate: break;
        }
        return text(left) + text(right);
    }
    Datum of(const Negative& x) const {
        const Datum datum = value(x.operand);
        return isNull(datum) ? datum : Datum(-number(datum));
    }
    Datum of(const Choice& x) const {
        const Truth holds = truth(x.condition);
        if (holds && *holds) return value(x.then);
        return x.otherwise ? value(x.otherwise) : Datum();
    }
    Datum of(const Call& x) const {
        std::vector<Datum> given;
        for (const Node& argument : x.arguments) given.push_back(value(argument));
        if (x.function == Function::coalesce) {
            const auto there = std::find_if_not(given.begin(), given.end(), isNull);
            return there == given.end() ? Datum() : *there;
        }
        if (std::any_of(given.begin(), given.end(), isNull)) return {};
        const auto characters = [&](std::size_t n) {
            return static_cast<std::size_t>(std::max(0.0, number(given[n])));
        };
        switch (x.function) {
        case Function::abs: return std::abs(number(given[0]));
        case Function::length: return static_cast<double>(text(given[0]).size());
        case Function::upper: return QString::fromStdString(text(given[0])).toUpper().toStdString();
        case Function::left: return text(given[0]).substr(0, characters(1));
        case Function::right: {
            const std::string& words = text(given[0]);
            return words.substr(words.size() - std::min(words.size(), characters(1)));
        }
        case Function::mid: {
            const std::string& words = text(given[0]);
            const std::size_t from = std::max<std::size_t>(characters(1), 1) - 1;
            return from >= words.size() ? std::string() : words.substr(from, characters(2));
        }
        case Function::year: return static_cast<double>(date(given[0]).year());
        case Function::month: return static_cast<double>(date(given[0]).month());
        case Function::dateDiff: return static_cast<double>(date(given[0]).daysTo(date(given[1])));
        case Function::addDays:
            return datumOf(date(given[0]).addDays(static_cast<qint64>(number(given[1]))));
        case Function::text: return QString::number(number(given[0]), 'g', 15).toStdString();
        default: throw std::logic_error("a function that is not known here");
        }
    }
    Datum of(const Aggregate& x) const {
        std::vector<Datum> values;
        for (const Row* row : mRows) {
            const Datum datum = x.operand ? Scope({row}).value(x.operand) : Datum(1.0);
            if (!isNull(datum)) values.push_back(datum);
        }
        if (x.total == Total::Count) return static_cast<double>(values.size());
        if (x.total == Total::CountDifferent) {
            QSet<QString> different;
            for (const Datum& datum : values)
                different.insert(QString::fromStdString(written(datum)));
            return static_cast<double>(different.size());
        }
        if (values.empty()) return {};
        const auto less = [](const Datum& left, const Datum& right) {
            return ordered(left, right) < 0;
        };
        if (x.total == Total::Smallest)
            return *std::min_element(values.begin(), values.end(), less);
        if (x.total == Total::Largest) return *std::max_element(values.begin(), values.end(), less);
        double sum = 0;
        for (const Datum& datum : values) sum += number(datum);
        return x.total == Total::Average ? sum / static_cast<double>(values.size()) : sum;
    }

    std::vector<const Row*> mRows;
};

Datum datumOf(const QVariant& value, const QString& declared) {
    if (value.isNull()) return {};
    if (declared == QStringLiteral("BOOLEAN")) return value.toInt() != 0;
    if (value.typeId() == QMetaType::QString) return value.toString().toStdString();
    return value.toDouble();
}

Row together(const Row& left, const Row& right) {
    Row row = left;
    row.insert(right.begin(), right.end());
    return row;
}

Row nulls(const std::vector<Row>& rows) {
    Row row = rows.empty() ? Row() : rows.front();
    for (auto& [name, datum] : row) datum = {};
    return row;
}

QString lineOf(const std::vector<Datum>& row) {
    QStringList texts;
    for (const Datum& datum : row) texts.push_back(QString::fromStdString(written(datum)));
    return texts.join(QStringLiteral(" | "));
}

} // namespace

const Evaluator::Rows& Evaluator::table(const std::u16string& name, const std::u16string& alias) {
    Rows& rows = mTables[{name, alias}];
    if (!rows.empty()) return rows;
    std::map<QString, QString> types;
    const QString source = QString::fromStdU16String(name);
    QSqlQuery columns(QStringLiteral("PRAGMA table_info(\"%1\")").arg(source), mDatabase);
    while (columns.next()) types[columns.value(1).toString()] = columns.value(2).toString();
    QSqlQuery query(QStringLiteral("SELECT * FROM \"%1\"").arg(source), mDatabase);
    while (query.next()) {
        Row& row = rows.emplace_back();
        for (int n = 0; n < query.record().count(); ++n) {
            const QString column = query.record().fieldName(n);
            row[{alias, column.toStdU16String()}] = datumOf(query.value(n), types[column]);
        }
    }
    if (rows.empty()) throw std::logic_error("a table without rows has no columns here");
    return rows;
}

Evaluator::Rows Evaluator::source(const Source& from) {
    if (const auto* one = std::get_if<TableRef>(&from.node)) return table(one->name, one->alias);
    if (const auto* query = std::get_if<SubSelect>(&from.node)) return rowsOf(*query);
    const auto& join = std::get<JoinSource>(from.node);
    const Rows left = source(*join.left);
    const Rows right = source(*join.right);
    Rows rows;
    std::vector<bool> partnered(right.size());
    const bool keepsLeft = join.kind == JoinKind::leftOuter || join.kind == JoinKind::fullOuter;
    const bool keepsRight = join.kind == JoinKind::rightOuter || join.kind == JoinKind::fullOuter;
    for (const Row& one : left) {
        bool found = false;
        for (std::size_t n = 0; n < right.size(); ++n) {
            const Row both = together(one, right[n]);
            if (!Scope({&both}).truth(join.on).value_or(false)) continue;
            rows.push_back(both);
            found = true;
            partnered[n] = true;
        }
        if (!found && keepsLeft) rows.push_back(together(one, nulls(right)));
    }
    for (std::size_t n = 0; keepsRight && n < right.size(); ++n)
        if (!partnered[n]) rows.push_back(together(nulls(left), right[n]));
    return rows;
}

std::vector<std::vector<Datum>> Evaluator::values(const Statement& statement) {
    Rows all{Row()};
    for (const SourceNode& from : statement.from) {
        Rows combined;
        const Rows more = source(*from);
        for (const Row& left : all)
            for (const Row& right : more) combined.push_back(together(left, right));
        all = std::move(combined);
    }
    if (statement.where)
        std::erase_if(all, [&](const Row& row) {
            return !Scope({&row}).truth(statement.where).value_or(false);
        });

    std::vector<Scope> scopes;
    const bool totals =
        std::any_of(statement.items.begin(), statement.items.end(), [](const SelectItem& item) {
            const auto* value = std::get_if<Node>(&item.what);
            return value && holds<Aggregate>(**value);
        });
    if (totals || !statement.group.empty() || statement.having) {
        std::map<std::vector<std::string>, std::vector<const Row*>> groups;
        if (statement.group.empty()) groups[{}];
        for (const Row& row : all) {
            std::vector<std::string> key;
            for (const Node& node : statement.group)
                key.push_back(written(Scope({&row}).value(node)));
            groups[key].push_back(&row);
        }
        for (auto& [key, rows] : groups) scopes.emplace_back(std::move(rows));
    } else {
        for (const Row& row : all) scopes.emplace_back(std::vector{&row});
    }

    std::vector<std::vector<Datum>> out;
    QSet<QString> seen;
    for (const Scope& scope : scopes) {
        if (statement.having && !scope.truth(statement.having).value_or(false)) continue;
        std::vector<Datum> row;
        for (const SelectItem& item : statement.items)
            row.push_back(scope.value(std::get<Node>(item.what)));
        const QString line = lineOf(row);
        if (statement.distinct && seen.contains(line)) continue;
        seen.insert(line);
        out.push_back(std::move(row));
    }
    return out;
}

QStringList Evaluator::rows(const Statement& statement) {
    QStringList lines;
    for (const auto& row : values(statement)) lines.push_back(lineOf(row));
    return lines;
}

/// What comes out of a query, by the names that it has there.
Evaluator::Rows Evaluator::rowsOf(const SubSelect& query) {
    Rows rows;
    for (auto& from : values(*query.statement)) {
        Row& row = rows.emplace_back();
        for (std::size_t n = 0; n < from.size(); ++n) {
            const SelectItem& item = query.statement->items[n];
            const auto* column = std::get_if<ColumnRef>(&std::get<Node>(item.what)->node);
            row[{query.alias, item.name.empty() ? column->column : item.name}] = std::move(from[n]);
        }
    }
    return rows;
}
