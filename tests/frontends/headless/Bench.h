#pragma once

#include <Zandor/headless/User.h>

#include <gtest/gtest.h>

#include <list>

namespace headless = zandor::platform::headless;

/// A toolkit and its user, with a canvas for tables.
struct Bench {
    headless::Toolkit toolkit;
    headless::User user{toolkit};
    std::unique_ptr<zandor::platform::Frame> canvas = toolkit.makeFrame({.Name = u"fraTable"}, {});
    std::list<TalvikTabulet::TabuletEvents> tableEvents;

    /// A visible table list of 2000 by 2000 twips at 1000, 500 whose entries are A, B, C ...
    zandor::platform::Ref<TalvikTabulet::Tabulet>
    table(std::int16_t index, TalvikTabulet::TabuletEvents events = {}, char16_t lastEntry = u'D') {
        tableEvents.push_back(std::move(events));
        auto made = toolkit.makeTabulet({.Name = u"lstTable", .Container = canvas.get()}, index,
                                        nullptr, tableEvents.back());
        for (char16_t name = u'A'; name <= lastEntry; ++name)
            made->ColumnItems().Add(u"k" + zandor::platform::String(1, name),
                                    zandor::platform::String(1, name));
        made->setBounds({1000, 500, 2000, 2000});
        made->Visible(true);
        return made;
    }

    template <class T>
    T& look(const std::string& name) {
        return toolkit.find<T>(name);
    }
};

/// The number of the run-time error that an action ends with; 0 for none.
template <class Action>
std::int32_t errorOf(Action&& action) {
    try {
        action();
    } catch (const zandor::platform::RuntimeError& error) {
        return error.Number;
    }
    return 0;
}
