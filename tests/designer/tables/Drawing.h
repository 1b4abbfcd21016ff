#pragma once

#include "Databases.h"

#include "designer/DrawingArea.h"
#include "designer/database/Database.h"
#include "designer/document/Document.h"
#include "designer/tables/TableAdding.h"

#include <Zandor/platform/KeyedCollection.h>

#include <gtest/gtest.h>

#include <QRect>
#include <QUndoStack>

/// A database, a drawing over it, and what adding tables to it says.
class Drawing : public testing::Test {
protected:
    Drawing() {
        area.resize(1200, 800);
        area.show();
        QObject::connect(&adding, &zandor::designer::TableAdding::refused,
                         [this](const QString& why) { refused << why; });
        QObject::connect(&adding, &zandor::designer::TableAdding::added,
                         [this](const QString& name) { added << name; });
    }

    void openSample() { ASSERT_EQ(database.open(sampleDatabase()), std::nullopt); }

    void add(const QStringList& names, std::optional<QPoint> place = {}) {
        std::vector<zandor::reader::TableId> tables;
        for (const QString& name : names) tables.push_back({u"", name.toStdU16String()});
        adding.add(tables, place);
    }

    zandor::model::Query& query() { return *document.query(); }

    QRect place(const QString& name) {
        const auto table = query().tableNamed(name.toStdU16String());
        if (!table) return {};
        return {table->Left(), table->Top(), table->Width(), table->Height()};
    }

    /// Names and places of all tables.
    std::vector<std::pair<std::string, QRect>> places() {
        std::vector<std::pair<std::string, QRect>> all;
        for (const auto& table :
             zandor::platform::Each<TalvikZandorLib::ZDTable>(query().Tables())) {
            const QString name = QString::fromStdU16String(table->Name());
            all.emplace_back(name.toStdString(), place(name));
        }
        return all;
    }

    std::vector<std::string> joins() {
        std::vector<std::string> all;
        for (const auto& join : zandor::platform::Each<TalvikZandorLib::ZDJoin>(query().Joins()))
            all.push_back(zandor::platform::toUtf8(
                join->LeftTable()->Name() + u"." + join->LeftColumn()->Name() + u" = " +
                join->RightTable()->Name() + u"." + join->RightColumn()->Name()));
        return all;
    }

    zandor::designer::Database database;
    zandor::designer::Document document;
    zandor::designer::DrawingArea area{document};
    zandor::designer::TableAdding adding{document, database, area};
    QStringList refused;
    QStringList added;
};
