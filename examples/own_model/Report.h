#pragma once

#include <map>
#include <memory>
#include <string>
#include <vector>

/// A report as a program had it long before it got a designer: plain structs with no base class.
/// Nothing here knows of the designer.
namespace report {

struct Field {
    std::string name = {};
    bool key = false;
    bool marked = false;
};

struct Source {
    int id = 0;
    std::string name = {};
    std::vector<Field> fields = {};
    int left = -1, top = -1, width = 0, height = 0; ///< twips, 1440 to an inch
    bool current = false;
};

struct Link {
    int id = 0; ///< 0: not in the report yet
    std::shared_ptr<Source> from = {}, to = {};
    int fromField = -1, toField = -1; ///< positions in their fields
    int kind = 0;
    int comparison = 0;
};

struct Output {
    int id = 0; ///< 0: not in the report yet
    std::shared_ptr<Source> source = {};
    int field = -1;
    std::string title = {};
    int order = 0;
    bool shown = true;
    std::map<int, std::string> conditions = {}; ///< by row of the grid
};

struct Report {
    std::vector<std::shared_ptr<Source>> sources;
    std::vector<std::shared_ptr<Link>> links;
    std::vector<std::shared_ptr<Output>> outputs;
    int lastId = 0;
};

/// What the report says, one thing a line.
std::string describe(const Report& report);

/// Two sources, a link and an output, to begin with.
Report someReport();

} // namespace report
