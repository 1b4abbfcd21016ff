#include "model/reader/columnType.h"

#include <algorithm>
#include <array>
#include <string>
#include <utility>

namespace zandor::reader {

using model::ColumnType;

namespace {

// By the first word. INTERVAL and POINT stand here because they have INT in them.
constexpr std::array<std::pair<std::string_view, ColumnType>, 32> byFirstWord = {{
    {"BINARY", ColumnType::Blob},
    {"BOOL", ColumnType::Boolean},
    {"BOOLEAN", ColumnType::Boolean},
    {"BYTEA", ColumnType::Blob},
    {"DATE", ColumnType::Date},
    {"DATETIME", ColumnType::Timestamp},
    {"DATETIME2", ColumnType::Timestamp},
    {"DEC", ColumnType::Decimal},
    {"DECIMAL", ColumnType::Decimal},
    {"IMAGE", ColumnType::Blob},
    {"INTERVAL", ColumnType::Unknown},
    {"JSON", ColumnType::Text},
    {"JSONB", ColumnType::Text},
    {"MONEY", ColumnType::Decimal},
    {"NAME", ColumnType::Text},
    {"NUMBER", ColumnType::Decimal},
    {"NUMERIC", ColumnType::Decimal},
    {"POINT", ColumnType::Unknown},
    {"RAW", ColumnType::Blob},
    {"SERIAL", ColumnType::Integer},
    {"BIGSERIAL", ColumnType::Integer},
    {"SMALLSERIAL", ColumnType::Integer},
    {"STRING", ColumnType::Text},
    {"TIME", ColumnType::Time},
    {"TIMESTAMP", ColumnType::Timestamp},
    {"TIMESTAMPTZ", ColumnType::Timestamp},
    {"TIMETZ", ColumnType::Time},
    {"UUID", ColumnType::Text},
    {"VARBINARY", ColumnType::Blob},
    {"XML", ColumnType::Text},
    {"YEAR", ColumnType::Integer},
    {"FIXED", ColumnType::Decimal},
}};

// Anywhere in the type, in this order.
constexpr std::array<std::pair<std::string_view, ColumnType>, 8> byPart = {{
    {"INT", ColumnType::Integer},
    {"CHAR", ColumnType::Text},
    {"CLOB", ColumnType::Text},
    {"TEXT", ColumnType::Text},
    {"BLOB", ColumnType::Blob},
    {"REAL", ColumnType::Decimal},
    {"FLOA", ColumnType::Decimal},
    {"DOUB", ColumnType::Decimal},
}};

std::string asciiUpper(platform::StringView text) {
    std::string upper;
    for (const char16_t c : text) {
        if (c >= u'a' && c <= u'z')
            upper += static_cast<char>(c - u'a' + 'A');
        else
            upper += c < 0x80 ? static_cast<char>(c) : '?';
    }
    return upper;
}

} // namespace

ColumnType columnType(platform::StringView declared) {
    const std::string type = asciiUpper(declared);
    const auto begin = std::min(type.find_first_not_of(' '), type.size());
    const std::string_view first =
        std::string_view(type).substr(begin, type.find_first_of(" (", begin) - begin);
    for (const auto& [word, meaning] : byFirstWord)
        if (word == first) return meaning;
    for (const auto& [part, meaning] : byPart)
        if (type.find(part) != std::string::npos) return meaning;
    return ColumnType::Unknown;
}

} // namespace zandor::reader
