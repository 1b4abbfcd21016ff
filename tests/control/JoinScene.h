#pragma once

#include "support/Backstage.h"
#include "support/FakeModel.h"
#include "support/Stage.h"

#include <gtest/gtest.h>

#include <functional>
#include <initializer_list>

// As hosts and toolkits know them.
inline constexpr std::int16_t leftButton = 1;
inline constexpr std::int16_t rightButton = 2;
inline constexpr std::int16_t square = 1; ///< the form of a mark
inline constexpr std::int16_t circle = 3;

/// Two tables on a stage, Orders to the west of Customers, for the tests of joins.
struct JoinScene : ::testing::Test {
    using Back = TalvikDBxZandor::ZandorBackstage;
    using Event = TalvikDBxZandor::Event;
    using Record = zandor::platform::Ref<TalvikDBxZandor::clsJoinLine>;
    using Item = zandor::platform::Ref<TalvikTabulet::ColumnItem>;
    using String = zandor::platform::String;

    fake::Library library;
    zandor::platform::Ref<fake::Model> model = library.newModel();
    zandor::platform::Ref<fake::Table> orders =
        model->table(u"Orders", {u"Id", u"Customer", u"Total"});
    zandor::platform::Ref<fake::Table> customers = model->table(u"Customers", {u"Number", u"Name"});
    std::unique_ptr<Stage> stage = Stage::open(library);
    TalvikDBxZandor::Zandor& control = stage->control();

    JoinScene() {
        orders->place(1000, 500, 2000, 2000);
        customers->place(5000, 1500, 2000, 2000);
        control.DebugSwitch(0);
    }

    /// Orders.Customer to Customers.Number in the model.
    fake::Join& join(std::int16_t type = 0, std::int16_t compareOperator = 0) {
        return *model->join(orders, u"Customer", customers, u"Number", type, compareOperator);
    }

    /// Binds the model, which has to show without a report, and forgets what it told.
    void bind() {
        control.P_SET_Zandor(model);
        EXPECT_TRUE(stage->boxes.empty());
        forget();
    }

    void forget() {
        stage->boxes.clear();
        stage->raised.clear();
        stage->transcript.clear();
    }

    TalvikTabulet::Tabulet& table(std::int16_t index) { return *Back::lstTable(control)(index); }
    Item entry(std::int16_t index, std::int32_t position) {
        return table(index).ColumnItems().Item(position);
    }
    Record record(const String& key = u"1") { return Back::mJoinLines(control).Item(key); }
    zandor::platform::Line& line(std::int16_t index = 1) { return *Back::linJoin(control)(index); }
    /// Puts the line of a record where a test needs it.
    void put(std::int16_t index, float x1, float y1, float x2, float y2) {
        Back::PlaceLine(control, *record(zandor::platform::decimal(index)), x1, y1, x2, y2);
    }
    std::int32_t joinCount() { return Back::mJoinLines(control).Count(); }
    bool isFree(std::int32_t number) { return Back::mJoinFreeList(control)->IsFree(number); }

    /// A new join on the canvas alone; nothing when none was made.
    Record draw(const Item& left, const Item& right, std::int16_t type = 0,
                std::int16_t compareOperator = 0) {
        Record made;
        Back::DrawNewJoin(control, made, Back::lstTable(control)(1), left,
                          Back::lstTable(control)(2), right, type, compareOperator);
        return made;
    }

    /// Puts the place that the join commands of the menu act on, the middle of a line unless given.
    void pointAt(std::int16_t index = 1) {
        Back::mPopupX(control) = (line(index).X1() + line(index).X2()) / 2;
        Back::mPopupY(control) = (line(index).Y1() + line(index).Y2()) / 2;
    }
    void pointNowhere() {
        Back::mPopupX(control) = 11000;
        Back::mPopupY(control) = 8000;
    }

    std::vector<Event> events() const {
        std::vector<Event> told;
        for (const auto& raised : stage->raised) told.push_back(raised.event);
        return told;
    }
};

/// What the box of an unexpected error says.
inline Stage::Box errorBox(const Stage::String& module, const Stage::String& procedure,
                           std::int32_t number, const Stage::String& description) {
    return {u"Module:\t" + module + u"\r\nFunction:\t" + procedure + u"\r\nError No:\t" +
                zandor::platform::decimal(number) + u"\r\nError:\t" + description,
            u"Unexpected Error:", 48};
}

inline Stage::Box controlErrorBox(const Stage::String& procedure, std::int32_t number,
                                  const Stage::String& description) {
    return errorBox(u"TalvikDBxZandor.Zandor", procedure, number, description);
}

inline Stage::Box dialogErrorBox(const Stage::String& procedure, std::int32_t number,
                                 const Stage::String& description) {
    return errorBox(u"TalvikDBxZandor.frmJoinDefinition", procedure, number, description);
}

inline const Stage::String invalidCall = u"Invalid procedure call or argument";
inline const Stage::String objectNotSet = u"Object variable or With block variable not set";

using Boxes = std::vector<Stage::Box>;
