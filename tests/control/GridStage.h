#pragma once

#include "support/Backstage.h"
#include "support/FakeModel.h"
#include "support/Stage.h"
#include "support/StageEvents.h"
#include "support/Tables.h"

#include <gtest/gtest.h>

/// What the tests of the grid share: a control with the grid shown and two tables on the canvas,
/// ORDERS in slot 1 and CUSTOMERS in slot 2, without output columns.
namespace gridstage {

using zandor::platform::Ref;
using zandor::platform::String;
using Backstage = TalvikDBxZandor::ZandorBackstage;
using TalvikDBxZandor::Event;

constexpr std::int16_t left = 1;
constexpr std::int16_t right = 2;
constexpr std::int16_t enter = 13;
constexpr std::int16_t escape = 27;

// Entries of ORDERS and CUSTOMERS, counted from 1.
constexpr std::int32_t allColumns = 1;
constexpr std::int32_t id = 2;
constexpr std::int32_t customer = 3;
constexpr std::int32_t total = 4;
constexpr std::int32_t name = 3;

constexpr std::int32_t fieldRow = 0;
constexpr std::int32_t synonymRow = 1;
constexpr std::int32_t sortRow = 2;
constexpr std::int32_t visibleRow = 3;
constexpr std::int32_t criteriaRow = 4;

inline Stage::Box report(zandor::platform::StringView procedure,
                         const zandor::platform::RuntimeError& error,
                         zandor::platform::StringView module = u"TalvikDBxZandor.Zandor") {
    return {u"Module:\t" + String(module) + u"\r\nFunction:\t" + String(procedure) +
                u"\r\nError No:\t" + zandor::platform::decimal(error.Number) + u"\r\nError:\t" +
                error.Description,
            u"Unexpected Error:", 48};
}

inline zandor::platform::RuntimeError refusal() { return {1234, u"The host refuses."}; }

/// The names of the enabled entries of a menu.
inline std::vector<std::string> enabledIn(const std::vector<Stage::Entry>& entries) {
    std::vector<std::string> names;
    for (const auto& entry : entries)
        if (entry.enabled && entry.caption != u"-")
            names.push_back(zandor::platform::toUtf8(entry.name));
    return names;
}

class GridTest : public testing::Test {
protected:
    GridTest() {
        control().DebugSwitch(0);
        control().OnlyJoin(false);
        orders = addOrders(*model);
        customers = addCustomers(*model);
    }

    TalvikDBxZandor::Zandor& control() { return stage->control(); }
    MSFlexGridLib::MSFlexGrid& grid() { return *Backstage::sprColumn(control()); }

    void bind() {
        control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        forget();
    }

    void forget() {
        stage->boxes.clear();
        stage->raised.clear();
        stage->messages.clear();
        stage->transcript.clear();
    }

    void press(std::int16_t button, std::int32_t row, std::int32_t col) {
        stage->pressCell(button, row, col);
    }

    /// Chooses an entry of the menu over a cell; an empty name dismisses the menu.
    void menuOverCell(std::int32_t row, std::int32_t col, const std::string& entry = {}) {
        willChoose(entry);
        stage->pressCell(right, row, col);
        stage->releaseCell(right, row, col);
    }

    void menuOverEntry(std::int16_t table, std::int32_t entry, const std::string& chosen = {}) {
        willChoose(chosen);
        stage->pressEntry(table, entry, right);
        stage->releaseEntry(table, entry, right);
    }

    /// Of the first join.
    TalvikTabulet::Point middleOfTheLine() {
        const auto line = stage->look("linJoin(1)");
        return {(line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2};
    }
    void menuOverTheLine(const std::string& entry = {}) {
        willChoose(entry);
        const auto at = middleOfTheLine();
        stage->pressCanvas(right, at.X, at.Y);
        stage->releaseCanvas(right, at.X, at.Y);
    }

    void willChoose(const std::string& entry) {
        stage->onMenu = [this, entry](const std::vector<Stage::Entry>& shown) {
            menu = shown;
            return zandor::platform::fromUtf8(entry);
        };
    }

    void copy(std::int16_t table, const std::vector<std::int32_t>& entries) {
        stage->selectEntries(table, entries);
        menuOverEntry(table, entries.front(), "mnuTableDefinitionCopy");
        forget();
    }

    void drag(std::int16_t table, const std::vector<std::int32_t>& entries, std::int32_t col) {
        stage->selectEntries(table, entries);
        stage->dragToCell(table, entries.front(), synonymRow, col);
    }

    std::vector<String> fields(std::int32_t count) {
        std::vector<String> texts;
        for (std::int32_t col = 1; col <= count; ++col) texts.push_back(stage->cell(fieldRow, col));
        return texts;
    }

    std::vector<std::string> events() const {
        std::vector<std::string> names;
        for (const auto& raised : stage->raised) names.push_back(eventName(raised.event));
        return names;
    }

    /// The names of the enabled entries of the menu seen last.
    std::vector<std::string> enabled() const { return enabledIn(menu); }

    bool shows(const std::string& element) { return stage->look(element).visible; }

    fake::Library library;
    Ref<fake::Model> model = library.newModel();
    std::unique_ptr<Stage> stage = Stage::open(library);
    Ref<fake::Table> orders, customers;
    std::vector<Stage::Entry> menu;
};

using Boxes = std::vector<Stage::Box>;
using Names = std::vector<std::string>;
using Texts = std::vector<String>;

} // namespace gridstage
