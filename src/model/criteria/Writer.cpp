#include "model/criteria/Writer.h"

#include "model/criteria/Signatures.h"
#include "model/criteria/Tokens.h"

#include <Zandor/model/Functions.h>

#include <array>

namespace zandor::model::criteria {

using sql::Node;

namespace {

/// What the language has no words for.
struct Wordless {};

/// How tightly a text holds together, the loosest first.
enum class Hold { disjunction, conjunction, negation, condition, joined, sum, product, factor };

String inQuotes(StringView text, char16_t quote) {
    String out(1, quote);
    for (const char16_t c : text) {
        out += c;
        if (c == quote) out += c;
    }
    return out + quote;
}

StringView symbolOf(sql::Comparison comparison) {
    constexpr std::array<StringView, 6> symbols = {u"=", u"<>", u"<", u">", u"<=", u">="};
    return symbols[static_cast<std::size_t>(comparison)];
}

String nameOf(const sql::ColumnRef& column) {
    return writtenName(column.table) + u'.' + writtenName(column.column);
}

String nameOf(const sql::Parameter& parameter) {
    return isBareName(parameter.name) ? u':' + parameter.name : inBrackets(parameter.name);
}

String constant(const sql::Value& value) {
    switch (value.type) {
    case ColumnType::Integer:
    case ColumnType::Decimal: return value.text;
    case ColumnType::Boolean: return value.text == u"true" ? u"True" : u"False";
    case ColumnType::Date:
    case ColumnType::Time:
    case ColumnType::Timestamp: return u'#' + value.text + u'#';
    case ColumnType::Blob: return u"x'" + value.text + u'\'';
    case ColumnType::Text:
    case ColumnType::Unknown: break;
    }
    return inQuotes(value.text, u'\'');
}

class Writer {
public:
    String text(const Node& node, Hold around) {
        return std::visit([&](const auto& part) { return write(part, around); }, node->node);
    }

    String pattern(const Node& node) {
        if (const auto* value = std::get_if<sql::Value>(&node->node))
            return inQuotes(typedPattern(value->text), u'\'');
        return text(node, Hold::factor);
    }

    String list(const std::vector<Node>& nodes, Hold around) {
        String out;
        for (const Node& node : nodes) {
            if (!out.empty()) out += u", ";
            out += text(node, around);
        }
        return out;
    }

private:
    static String within(String text, Hold own, Hold around) {
        return around > own ? u'(' + std::move(text) + u')' : text;
    }

    String write(const sql::ColumnRef& column, Hold) { return nameOf(column); }
    String write(const sql::Value& value, Hold) { return constant(value); }
    String write(const sql::Parameter& parameter, Hold) { return nameOf(parameter); }

    String write(const sql::Compare& x, Hold around) {
        return within(text(x.left, Hold::joined) + u' ' + String(symbolOf(x.comparison)) + u' ' +
                          text(x.right, Hold::joined),
                      Hold::condition, around);
    }
    String write(const sql::Like& x, Hold around) {
        return within(text(x.operand, Hold::joined) + (x.negated ? u" Not Like " : u" Like ") +
                          pattern(x.pattern),
                      Hold::condition, around);
    }
    String write(const sql::Between& x, Hold around) {
        return within(text(x.operand, Hold::joined) +
                          (x.negated ? u" Not Between " : u" Between ") +
                          text(x.low, Hold::joined) + u" And " + text(x.high, Hold::joined),
                      Hold::condition, around);
    }
    String write(const sql::In& x, Hold around) {
        return within(text(x.operand, Hold::joined) + (x.negated ? u" Not In (" : u" In (") +
                          list(x.list, Hold::joined) + u')',
                      Hold::condition, around);
    }
    String write(const sql::IsNull& x, Hold around) {
        return within(text(x.operand, Hold::joined) + (x.negated ? u" Is Not Null" : u" Is Null"),
                      Hold::condition, around);
    }
    String write(const sql::Not& x, Hold around) {
        return within(u"Not " + text(x.operand, Hold::factor), Hold::negation, around);
    }
    String write(const sql::And& x, Hold around) {
        return within(terms(x.terms, u" And ", Hold::negation), Hold::conjunction, around);
    }
    String write(const sql::Or& x, Hold around) {
        return within(terms(x.terms, u" Or ", Hold::negation), Hold::disjunction, around);
    }
    String terms(const std::vector<Node>& nodes, StringView word, Hold each) {
        String out;
        for (const Node& node : nodes) {
            if (!out.empty()) out += word;
            out += text(node, each);
        }
        return out;
    }

    String write(const sql::Operation& x, Hold around) {
        switch (x.symbol) {
        case sql::Operator::add: return operation(x, u" + ", Hold::sum, Hold::product, around);
        case sql::Operator::subtract: return operation(x, u" - ", Hold::sum, Hold::product, around);
        case sql::Operator::multiply:
            return operation(x, u" * ", Hold::product, Hold::factor, around);
        case sql::Operator::divide:
            return operation(x, u" / ", Hold::product, Hold::factor, around);
        case sql::Operator::concatenate: break;
        }
        return operation(x, u" & ", Hold::joined, Hold::sum, around);
    }
    String operation(const sql::Operation& x, StringView symbol, Hold own, Hold right,
                     Hold around) {
        return within(text(x.left, own) + String(symbol) + text(x.right, right), own, around);
    }
    String write(const sql::Negative& x, Hold) { return u"-" + text(x.operand, Hold::factor); }

    String write(const sql::Call& x, Hold around) {
        switch (x.function) {
        // A date beside a moment is made one without a word.
        case sql::Function::moment: return text(x.arguments[0], around);
        case sql::Function::addDays:
        case sql::Function::addDaysLater:
            return within(text(x.arguments[0], Hold::sum) + u" + " +
                              text(x.arguments[1], Hold::product),
                          Hold::sum, around);
        default: break;
        }
        const Signature* signature = signatureOf(x.function);
        if (!signature) throw Wordless();
        return String(signature->words.name) + u'(' + list(x.arguments, Hold::disjunction) + u')';
    }
    String write(const sql::Choice& x, Hold) {
        return u"If(" + text(x.condition, Hold::disjunction) + u", " +
               text(x.then, Hold::disjunction) +
               (x.otherwise ? u", " + text(x.otherwise, Hold::disjunction) : String()) + u')';
    }
    String write(const sql::Aggregate&, Hold) { throw Wordless(); }
};

/// Writes what a cell says of its subject.
class Cell {
public:
    Cell(const Subject& subject, const Resolver& resolver)
        : mSubject(subject), mResolver(resolver) {}

    String text(const Node& node, Hold around) {
        if (const auto* all = std::get_if<sql::And>(&node->node))
            return terms(all->terms, u" And ", Hold::conjunction, around, Hold::negation);
        if (const auto* any = std::get_if<sql::Or>(&node->node))
            // An And within an Or needs no parentheses; people who read it do.
            return terms(any->terms, u" Or ", Hold::disjunction, around, Hold::negation);
        if (const auto* inverse = std::get_if<sql::Not>(&node->node))
            return u"Not (" + text(inverse->operand, Hold::disjunction) + u')';
        for (const String& candidate : candidates(node))
            if (means(candidate, node)) return candidate;
        throw Wordless();
    }

    /// Whether a text sets a condition, and has no other look.
    bool means(const String& candidate, const Node& node) const {
        const Reading reading = read(candidate, mSubject, mResolver);
        return reading.condition && !reading.warning && same(reading.condition, node);
    }

private:
    String terms(const std::vector<Node>& nodes, StringView word, Hold own, Hold around,
                 Hold each) {
        String out;
        for (const Node& node : nodes) {
            if (!out.empty()) out += word;
            out += text(node, each);
        }
        return around > own ? u'(' + out + u')' : out;
    }

    bool isSubject(const Node& node) const { return same(node, mSubject.node); }

    /// The shorter ones first.
    std::vector<String> candidates(const Node& node) {
        std::vector<String> all;
        if (const auto* x = std::get_if<sql::Compare>(&node->node)) {
            if (isSubject(x->left)) compared(all, x->comparison, x->right);
            if (isSubject(x->right)) compared(all, sql::mirrored(x->comparison), x->left);
            if (std::holds_alternative<sql::Value>(x->left->node))
                add(all, sql::make(sql::Compare{sql::mirrored(x->comparison), x->right, x->left}));
        } else if (const auto* x = std::get_if<sql::Like>(&node->node)) {
            if (isSubject(x->operand)) like(all, *x);
        } else if (const auto* x = std::get_if<sql::Between>(&node->node)) {
            if (isSubject(x->operand))
                for (const String& low : operands(x->low))
                    for (const String& high : operands(x->high))
                        all.push_back((x->negated ? u"Not Between " : u"Between ") + low +
                                      u" And " + high);
        } else if (const auto* x = std::get_if<sql::In>(&node->node)) {
            if (isSubject(x->operand)) in(all, *x);
        } else if (const auto* x = std::get_if<sql::IsNull>(&node->node)) {
            if (isSubject(x->operand)) all.emplace_back(x->negated ? u"Is Not Null" : u"Is Null");
        }
        add(all, node);
        return all;
    }

    void add(std::vector<String>& all, const Node& node) {
        try {
            all.push_back(mWriter.text(node, Hold::condition));
        } catch (const Wordless&) {
            // The others may do.
        }
    }

    void compared(std::vector<String>& all, sql::Comparison comparison, const Node& operand) {
        const bool equal = comparison == sql::Comparison::equal;
        const String symbol = String(symbolOf(comparison)) + u' ';
        for (const String& value : operands(operand)) {
            if (equal) all.push_back(value);
            all.push_back(symbol + value);
        }
    }

    void like(std::vector<String>& all, const sql::Like& like) {
        const String word = like.negated ? u"Not Like " : u"Like ";
        if (const auto* value = std::get_if<sql::Value>(&like.pattern->node))
            all.push_back(word + typedPattern(value->text));
        all.push_back(word + mWriter.pattern(like.pattern));
    }

    void in(std::vector<String>& all, const sql::In& in) {
        const String word = in.negated ? u"Not In (" : u"In (";
        for (const bool bare : {true, false}) {
            String list;
            for (const Node& item : in.list) {
                if (!list.empty()) list += u", ";
                const auto forms = operands(item);
                if (!forms.empty()) list += bare ? forms.front() : forms.back();
            }
            all.push_back(word + list + u')');
        }
    }

    /// A value as it stands, then as it can be mistaken for nothing else.
    std::vector<String> operands(const Node& node) {
        std::vector<String> forms;
        if (const auto* value = std::get_if<sql::Value>(&node->node)) {
            // A column of an unknown type takes a bare number for a number.
            if (!value->text.empty()) forms.push_back(value->text);
            if (value->type == ColumnType::Boolean) forms.front() = constant(*value);
            if (value->type == ColumnType::Blob) forms.clear();
        }
        try {
            const String text = mWriter.text(node, Hold::joined);
            forms.push_back(text);
            // A sign begins a number in a cell.
            if (text.starts_with(u'-')) forms.push_back(u'(' + text + u')');
        } catch (const Wordless&) {
            // A total cannot be named at all.
        }
        return forms;
    }

    const Subject& mSubject;
    const Resolver& mResolver;
    Writer mWriter;
};

} // namespace

String typedPattern(StringView pattern) {
    String out;
    for (std::size_t i = 0; i < pattern.size(); ++i) {
        char16_t c = pattern[i];
        const bool itself = c == u'\\' && i + 1 < pattern.size();
        if (itself) c = pattern[++i];
        if (!itself && (c == u'%' || c == u'_'))
            out += c == u'%' ? u'*' : u'?';
        else if (StringView(u"*?%_[").find(c) != StringView::npos)
            out += String(u"[") + c + u']';
        else
            out += c;
    }
    return out;
}

std::optional<String> written(const Node& node) {
    try {
        return Writer().text(node, Hold::disjunction);
    } catch (const Wordless&) {
        return {};
    }
}

std::optional<String> written(const Node& condition, const Subject& subject,
                              const Resolver& resolver) {
    if (!subject.node) return {};
    try {
        Cell cell(subject, resolver);
        return cell.text(condition, Hold::disjunction);
    } catch (const Wordless&) {
        return {};
    }
}

} // namespace zandor::model::criteria
