#pragma once

#include "model/sql_reader/Comments.h"
#include "model/sql_reader/Scope.h"

#include <Zandor/model/Record.h>

#include <map>

namespace zandor::sql_reader {

/// Where nodes of a statement were read, in bytes of what was parsed.
using Places = std::map<Node, std::size_t>;

/// A statement with what its names mean.
struct Selected {
    /// What is asked of rows, and behind GROUP BY.
    struct Asked {
        Node where;
        Node having;
    };

    model::sql::Statement statement;                  ///< all that can be is asked of rows
    Asked asked;                                      ///< as it was written
    Scope scope;                                      ///< of its FROM
    std::map<String, model::TableDescription> tables; ///< of the database, by what they are called
    std::map<String, model::SavedQuery> queries;      ///< those that it reads from, likewise
    std::size_t place = 0;                            ///< of its first token
    Places places;
    Commented commented; ///< what comments can stand by

    std::size_t placeOf(const Node& node) const {
        const auto known = places.find(node);
        return known == places.end() ? place : known->second;
    }

    /// Of all that a node is made of; nothing where that is not known.
    std::optional<std::size_t> firstPlaceOf(const Node& node) const {
        std::optional<std::size_t> first;
        const auto take = [&](std::optional<std::size_t> byte) {
            if (byte && (!first || *byte < *first)) first = byte;
        };
        if (const auto known = places.find(node); known != places.end()) take(known->second);
        for (const Node& part : model::sql::partsOf(*node)) take(firstPlaceOf(part));
        return first;
    }
};

} // namespace zandor::sql_reader
