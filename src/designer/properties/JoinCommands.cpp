#include "designer/properties/JoinCommands.h"

#include "designer/DrawingArea.h"
#include "designer/document/Document.h"

#include <Zandor/model/Names.h>
#include <Zandor/qt/Text.h>

#include <QCoreApplication>

namespace zandor::designer {

using platform::qt::fromQt;

namespace {

class Words {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::JoinCommands)
};

// A type of join is the sum of these.
constexpr std::int16_t allOfLeft = 1;
constexpr std::int16_t allOfRight = 2;

/// A name as a menu shows it.
QString shown(const platform::String& name) {
    constexpr int longest = 40;
    QString line = QString::fromStdU16String(model::oneLine(name)).simplified();
    if (line.size() > longest) line = line.left(longest - 1) + QChar(0x2026);
    return line.replace(u'&', QStringLiteral("&&"));
}

} // namespace

std::vector<TalvikDBxZandor::HostEntry>
JoinCommands::entries(const platform::Ref<TalvikZandorLib::ZDJoin>& join) {
    std::vector<TalvikDBxZandor::HostEntry> result;
    if (!join || mArea.control().JoinModifyDisabled() == 0)
        return result; // which means the reverse
    const std::int16_t now = join->JoinType();
    const auto offer = [&](const auto& table, std::int16_t side) {
        const auto next = static_cast<std::int16_t>(now ^ side);
        if (!table || !isOffered(next)) return;
        const QString words =
            (now & side) ? Words::tr("Only matching rows of %1") : Words::tr("All rows of %1");
        result.push_back(
            {fromQt(words.arg(shown(table->Name()))),
             [&document = mDocument, key = join->Key(), next] { setType(document, key, next); }});
    };
    offer(join->LeftTable(), allOfLeft);
    offer(join->RightTable(), allOfRight);
    return result;
}

bool JoinCommands::isOffered(std::int16_t type) const {
    ZandorWidget& control = mArea.control();
    switch (type) {
    case 0: return control.UseJoinTypeNormal();
    case allOfLeft: return control.UseJoinTypeLeft();
    case allOfRight: return control.UseJoinTypeRight();
    default: return control.UseJoinTypeBoth();
    }
}

void JoinCommands::setType(Document& document, const platform::String& key, std::int16_t type) {
    document.change({}, [&](model::Query& query) {
        for (const auto& join : platform::Each<TalvikZandorLib::ZDJoin>(query.Joins()))
            if (join->Key() == key) join->JoinType(type);
    });
}

} // namespace zandor::designer
