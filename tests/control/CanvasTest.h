#pragma once

#include "support/Backstage.h"
#include "support/FakeModel.h"
#include "support/Stage.h"
#include "support/StageEvents.h"

#include <gtest/gtest.h>

/// A control with a model of the test's own, quiet but for unexpected errors.
class CanvasTest : public testing::Test {
protected:
    using Back = TalvikDBxZandor::ZandorBackstage;
    using String = zandor::platform::String;
    using Texts = std::vector<std::string>;
    template <class T>
    using Ref = zandor::platform::Ref<T>;
    using Tabulet = TalvikTabulet::Tabulet;
    using ColumnItem = TalvikTabulet::ColumnItem;

    CanvasTest() : library(), model(library.newModel()), stage(Stage::open(library)) {
        control().DebugSwitch(0);
    }

    TalvikDBxZandor::Zandor& control() { return stage->control(); }

    void bind(const Ref<fake::Model>& shown) {
        control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(shown));
        forget();
    }
    void bind() { bind(model); }

    /// Drops what was shown and raised so far.
    void forget() {
        stage->boxes.clear();
        stage->raised.clear();
        stage->transcript.clear();
        stage->messages.clear();
    }

    /// A model table with a place, all of it well inside the canvas.
    Ref<fake::Table> table(const String& name, std::initializer_list<String> columns, float left,
                           float top = 600) {
        auto made = model->table(name, columns);
        made->place(left, top, 1800, 2400);
        return made;
    }

    const Ref<Tabulet>& element(std::int16_t index) { return Back::lstTable(control())(index); }
    bool slotIsFree(std::int32_t index) { return Back::mTableFreeList(control())->IsFree(index); }

    zandor::platform::Bounds boundsOf(const std::string& name) { return stage->look(name).bounds; }
    std::vector<String> selectedIn(std::int16_t index) { return look(index).selected; }
    Stage::Seen look(std::int16_t index) {
        return stage->look("lstTable(" + std::to_string(index) + ")");
    }

    /// The middle of an entry's row, in the table list's own coordinates.
    TalvikTabulet::Point entryPoint(std::int16_t index, std::int32_t entry) {
        const auto& list = element(index);
        const auto& wanted = list->ColumnItems().Item(entry);
        float first = -1, last = -1;
        for (float y = 0; y < list->Height(); y += 15) {
            if (list->ColumnAt(list->Width() / 2, y) != wanted) continue;
            if (first < 0) first = y;
            last = y;
        }
        EXPECT_GE(first, 0) << "entry " << entry << " is not in view";
        return {list->Width() / 2, (first + last) / 2};
    }
    /// A place of the list below its last entry.
    TalvikTabulet::Point emptyPoint(std::int16_t index) {
        const auto& list = element(index);
        const TalvikTabulet::Point point{list->Width() / 2, list->Height() - 150};
        EXPECT_FALSE(list->ColumnAt(point.X, point.Y));
        return point;
    }

    static std::string utf8(zandor::platform::StringView text) {
        return zandor::platform::toUtf8(text);
    }

    /// The boxes shown, in the form that report() and trace() give them.
    Texts told() const {
        Texts result;
        for (const auto& box : stage->boxes)
            result.push_back(utf8(box.title) + "|" + std::to_string(box.style) + "|" +
                             utf8(box.text));
        return result;
    }
    Texts events() const {
        Texts result;
        for (const auto& raised : stage->raised) result.push_back(eventName(raised.event));
        return result;
    }

    static std::string report(const std::string& procedure, int number,
                              const std::string& description,
                              const std::string& module = "TalvikDBxZandor.Zandor") {
        return "Unexpected Error:|48|Module:\t" + module + "\r\nFunction:\t" + procedure +
               "\r\nError No:\t" + std::to_string(number) + "\r\nError:\t" + description;
    }
    static std::string trace(const std::string& text,
                             const std::string& title = "TalvikDBxZandor.Zandor") {
        return title + "|4096|" + text;
    }
    static std::string noKey(const std::string& procedure) {
        return report(procedure, 5, "Invalid procedure call or argument");
    }
    static std::string notSet(const std::string& procedure) {
        return report(procedure, 91, "Object variable or With block variable not set");
    }
    static std::string noElement(const std::string& procedure, int index,
                                 const std::string& module = "TalvikDBxZandor.Zandor") {
        return report(procedure, 340,
                      "Control array element '" + std::to_string(index) + "' doesn't exist",
                      module);
    }
    /// What a host's model fails with in these tests.
    static zandor::platform::RuntimeError broken() { return {1234, u"The host is broken"}; }
    static std::string brokenIn(const std::string& procedure) {
        return report(procedure, 1234, "The host is broken");
    }

    fake::Library library;
    Ref<fake::Model> model;
    std::unique_ptr<Stage> stage;
};
