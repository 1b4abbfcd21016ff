#pragma once

#include <Zandor/Questions.h>
#include <Zandor/model/Join.h>

#include <QString>

namespace zandor::designer {

class Document;
class DrawingArea;

/// Chooses by the name of a table whether a join keeps all of its rows, for people who need not
/// know which of the two is the left one.
class JoinCommands {
public:
    /// Both outlive the object and its entries.
    JoinCommands(Document& document, DrawingArea& area) : mDocument(document), mArea(area) {}

    /// For the menu over the line of a join: one for each of its tables. None where joins cannot be
    /// changed, and only those that lead to a type which can be chosen.
    std::vector<TalvikDBxZandor::HostEntry>
    entries(const platform::Ref<TalvikZandorLib::ZDJoin>& join);

private:
    bool isOffered(std::int16_t type) const;
    static void setType(Document& document, const platform::String& key, std::int16_t type);

    Document& mDocument;
    DrawingArea& mArea;
};

} // namespace zandor::designer
