#include "designer/run/CsvWriter.h"
#include "designer/run/JsonWriter.h"

#include <gtest/gtest.h>

using namespace zandor;

using designer::Cell;
using designer::Row;
using Kind = designer::Cell::Kind;

namespace {

class Memory final : public files::Output {
public:
    std::optional<files::Error> write(std::string_view bytes) override {
        content += bytes;
        return {};
    }
    std::optional<files::Error> flush() override { return {}; }

    std::string content;
};

template <class Writer>
std::string written(const QStringList& columns, const std::vector<Row>& rows) {
    Memory memory;
    Writer writer(memory);
    EXPECT_FALSE(writer.begin(columns));
    for (const Row& row : rows) EXPECT_FALSE(writer.add(row));
    EXPECT_FALSE(writer.finish());
    return memory.content;
}

std::string csv(const QStringList& columns, const std::vector<Row>& rows) {
    return written<designer::CsvWriter>(columns, rows);
}

std::string json(const QStringList& columns, const std::vector<Row>& rows) {
    return written<designer::JsonWriter>(columns, rows);
}

const Row oneOfEach = {{Kind::text, "caf\u00e9"}, {Kind::number, "-1.50"},
                       {Kind::boolean, "true"},   {},
                       {Kind::text, ""},          {Kind::blob, {}, "\1\2"}};
const QStringList names = {"a", "b", "c", "d", "e", "f"};

} // namespace

TEST(CommaSeparatedValues, HaveAHeaderLineAndEndEachLineAsTheStandardSays) {
    EXPECT_EQ(csv({"id", "name"}, {{{Kind::number, "1"}, {Kind::text, "x"}}}),
              "id,name\r\n1,x\r\n");
}

TEST(CommaSeparatedValues, TellNothingFromAnEmptyText) {
    EXPECT_EQ(csv(names, {oneOfEach}), "a,b,c,d,e,f\r\ncaf\xc3\xa9,-1.50,true,,\"\",AQI=\r\n");
}

TEST(CommaSeparatedValues, PutInQuotesWhatWouldBreakALine) {
    EXPECT_EQ(csv({"a,b", "say \"x\""}, {{{Kind::text, "1,2"}, {Kind::text, "two\nlines"}},
                                         {{Kind::text, "a \"b\""}, {Kind::text, "cr\r"}},
                                         {{Kind::text, " blanks "}, {Kind::text, "tab\t;"}}}),
              "\"a,b\",\"say \"\"x\"\"\"\r\n\"1,2\",\"two\nlines\"\r\n"
              "\"a \"\"b\"\"\",\"cr\r\"\r\n blanks ,tab\t;\r\n");
}

TEST(CommaSeparatedValues, OfNoRowsAreTheHeaderLine) { EXPECT_EQ(csv({"a"}, {}), "a\r\n"); }

TEST(RowsAsJson, AreAnArrayOfObjects) {
    EXPECT_EQ(json(names, {oneOfEach}), "[\n{\"a\": \"caf\xc3\xa9\", \"b\": -1.50, \"c\": true, "
                                        "\"d\": null, \"e\": \"\", \"f\": \"AQI=\"}\n]\n");
}

TEST(RowsAsJson, HaveCommasBetweenThem) {
    EXPECT_EQ(json({"a"}, {{{Kind::number, "1"}}, {{Kind::number, "2"}}}),
              "[\n{\"a\": 1},\n{\"a\": 2}\n]\n");
}

TEST(RowsAsJson, OfNoRowsAreAnEmptyArray) { EXPECT_EQ(json({"a"}, {}), "[]\n"); }

TEST(RowsAsJson, EscapeWhatATextMayNotHold) {
    EXPECT_EQ(json({"a\"b"}, {{{Kind::text, "\\ \n \x01"}}}),
              "[\n{\"a\\\"b\": \"\\\\ \\n \\u0001\"}\n]\n");
}

TEST(RowsAsJson, WriteAsTextWhatJsonHasNoNumberFor) {
    EXPECT_EQ(json({"a", "b"}, {{{Kind::number, "NaN"}, {Kind::number, "-Infinity"}}}),
              "[\n{\"a\": \"NaN\", \"b\": \"-Infinity\"}\n]\n");
}

TEST(RowsAsJson, KeepColumnsOfOneNameApart) {
    EXPECT_EQ(json({"id", "id_2", "id"},
                   {{{Kind::number, "1"}, {Kind::number, "2"}, {Kind::number, "3"}}}),
              "[\n{\"id\": 1, \"id_2\": 2, \"id_3\": 3}\n]\n");
}

TEST(RowsAsJson, SayWhenTheyCannotBeWritten) {
    files::Stream closed(-1, model::say<files::MessageCode::outputNotWritten>(),
                         files::Stream::nothingWaits);
    designer::JsonWriter writer(closed);
    EXPECT_EQ(writer.begin({"a"}),
              "The output cannot be written (Bad file descriptor); try again, or "
              "choose another folder.");
}
